#include "nrxctl/decoders/scm_packets.h"

#include <gtest/gtest.h>

#include "tests/decoders/event_record.h"
#include "tests/support/source_files.h"

namespace {

using namespace tests;
using nrx::profile_record;

profile_record at_time(profile_record record, std::uint8_t timestamp) {
    std::fill_n(record.bytes.begin() + 8, 8, std::uint8_t{0});
    record.bytes[8] = timestamp;
    return record;
}

profile_record transfer(std::uint8_t component, std::uint8_t event, std::uint64_t direction,
                        std::uint8_t timestamp) {
    return at_time(
        make_record({9, component, event, 3}, {{16, 4, direction}, {20, 8, 0x123456789a}}),
        timestamp);
}

profile_record data(std::uint64_t length, std::uint8_t timestamp) {
    return at_time(make_record({77, 0, 0, 1}, {{18, 2, 100}, {20, 2, length}, {22, 2, 24}}, 0xa5),
                   timestamp);
}

// Prints records one after another with one printer; each must print its text.
void expect_printed(const rows<profile_record, std::string>& records) {
    nrx::scm_packet_printer printer;
    for (const auto& [record, text] : records)
        EXPECT_EQ(capture([&, &next = record] { printer.print(next); }).out, text);
}

TEST(scm_packets, a_transfer_names_bus_event_direction_and_both_times) {
    auto late = make_record({9, 0, 0, 3}, {{20, 8, 18446744073709551615U}});
    late.bytes[15] = 0x80;
    expect_printed({
        {transfer(0, 12, 0, 5), "spi0.12: scm_read wqr_timestamp=5 scm_timestamp=78187493530\n"},
        {transfer(5, 255, 1, 5),
         "i2c_ctrl1.255: scm_write wqr_timestamp=5 scm_timestamp=78187493530\n"},
        {late, "spi0.0: scm_read wqr_timestamp=-9223372036854767685 scm_timestamp=-1\n"},
    });
}

TEST(scm_packets, data_belongs_to_the_last_transfer_by_its_timestamp) {
    const std::string bytes =
        "a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 \n";
    rows<profile_record, std::string> records{
        {data(1, 0), ":   data[24-0/100]: a5 \n"},
        {transfer(2, 7, 0, 9), "smb1.7: scm_read wqr_timestamp=9 scm_timestamp=78187493530\n"},
        {data(24, 9), "smb1.7:   data[24-23/100]: " + bytes},
        {data(2, 9), "smb1.7:   data[24-1/100]: a5 a5 \n"},
        {data(65535, 9), "smb1.7:   data[24-65534/100]: " + bytes},
        {data(0, 9), ""},
        {transfer(1, 8, 1, 10), "smb0.8: scm_write wqr_timestamp=10 scm_timestamp=78187493530\n"},
        {data(1, 9), ""},
        {data(1, 10), "smb0.8:   data[24-0/100]: a5 \n"},
    };
    for (std::size_t offset = 8; offset < 16; ++offset) {
        records.emplace_back(data(1, 10), "");
        std::get<profile_record>(records.back()).bytes[offset] ^= 0x01;
    }
    expect_printed(records);
}

TEST(scm_packets, other_records_print_nothing_and_change_nothing) {
    rows<profile_record, std::string> records{
        {transfer(3, 1, 0, 4), "i2cm0.1: scm_read wqr_timestamp=4 scm_timestamp=78187493530\n"},
        {transfer(6, 1, 0, 5), ""},
        {transfer(0, 1, 2, 5), ""},
        {data(1, 5), ""},
        {data(1, 4), "i2cm0.1:   data[24-0/100]: a5 \n"},
    };
    for (const record_ids ids :
         {record_ids{9, 0, 0, 0}, record_ids{9, 0, 0, 2}, record_ids{9, 0, 0, 4},
          record_ids{9, 0, 0, 8}, record_ids{0, 0, 0, 3}, record_ids{4, 0, 0, 3}})
        records.emplace(records.begin() + 1, at_time(make_record(ids), 5), "");
    expect_printed(records);
}

}  // namespace
