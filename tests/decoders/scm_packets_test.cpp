// Bus transfers and their data, and the hexadecimal lines that show them.
#include "nrxctl/decoders/scm_packets.h"

#include <algorithm>
#include <array>

#include <gtest/gtest.h>

#include "nrxctl/decoders/profile_hexdump.h"
#include "tests/decoders/event_record.h"

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
    return at_time(record_of({9, component, event, 3}, {{16, 4, direction}, {20, 8, 0x123456789a}}),
                   timestamp);
}

profile_record data(std::uint64_t length, std::uint8_t timestamp) {
    return at_time(record_of({77, 0, 0, 1}, {{18, 2, 100}, {20, 2, length}, {22, 2, 24}}, 0xa5),
                   timestamp);
}

class scm_packets : public ::testing::Test {
protected:
    std::string print(const profile_record& record) {
        return capture([&] { printer_.print(record); }).out;
    }

private:
    nrx::scm_packet_printer printer_;
};

TEST_F(scm_packets, a_transfer_names_bus_event_direction_and_both_times) {
    const std::vector<std::string> buses{"spi0", "smb0", "smb1", "i2cm0", "i2c_ctrl0", "i2c_ctrl1"};
    for (std::size_t i = 0; i < buses.size(); ++i) {
        const auto bus = static_cast<std::uint8_t>(i);
        const std::string times = " wqr_timestamp=5 scm_timestamp=78187493530\n";
        EXPECT_EQ(print(transfer(bus, 12, 0, 5)), buses[i] + ".12: scm_read" + times);
        EXPECT_EQ(print(transfer(bus, 255, 1, 5)), buses[i] + ".255: scm_write" + times);
    }
    auto late = record_of({9, 0, 0, 3}, {{20, 8, 18446744073709551615U}});
    late.bytes[15] = 0x80;
    EXPECT_EQ(print(late),
              "spi0.0: scm_read wqr_timestamp=-9223372036854767685 scm_timestamp=-1\n");
    auto its_data = data(1, 0);
    std::copy_n(late.bytes.begin() + 8, 8, its_data.bytes.begin() + 8);
    EXPECT_EQ(print(its_data), "spi0.0:   data[24-0/100]: a5 \n");
    for (std::size_t offset = 8; offset < 16; ++offset) {
        auto other = its_data;
        other.bytes[offset] ^= 0x01;
        EXPECT_EQ(print(other), "") << offset;
    }
}

TEST_F(scm_packets, data_belongs_to_the_last_transfer_by_its_time_stamp) {
    print(transfer(2, 7, 0, 9));
    EXPECT_EQ(
        print(data(24, 9)),
        "smb1.7:   data[24-23/100]: a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 a5 "
        "a5 a5 a5 a5 \n");
    EXPECT_EQ(print(data(2, 9)), "smb1.7:   data[24-1/100]: a5 a5 \n");
    EXPECT_EQ(print(data(65535, 9)).substr(0, 31), "smb1.7:   data[24-65534/100]: a");
    EXPECT_EQ(print(data(65535, 9)).size(), 30U + 24 * 3 + 1);
    EXPECT_EQ(print(data(0, 9)), "");
    EXPECT_EQ(print(data(24, 8)), "");
    print(transfer(1, 8, 1, 10));
    EXPECT_EQ(print(data(1, 9)), "");
    EXPECT_EQ(print(data(1, 10)), "smb0.8:   data[24-0/100]: a5 \n");
}

TEST_F(scm_packets, what_is_no_transfer_prints_nothing_and_changes_nothing) {
    EXPECT_EQ(print(data(1, 0)), ":   data[24-0/100]: a5 \n");
    print(transfer(3, 1, 0, 4));
    EXPECT_EQ(print(transfer(6, 1, 0, 5)), "");
    EXPECT_EQ(print(transfer(0, 1, 2, 5)), "");
    for (const std::uint8_t type : std::array<std::uint8_t, 4>{0, 2, 4, 8}) {
        EXPECT_EQ(print(at_time(record_of({9, 0, 0, type}), 4)), "") << int{type};
    }
    EXPECT_EQ(print(at_time(record_of({0, 0, 0, 3}), 5)), "");
    EXPECT_EQ(print(at_time(record_of({4, 0, 0, 3}), 5)), "");
    EXPECT_EQ(print(data(1, 5)), "");
    EXPECT_EQ(print(data(1, 4)), "i2cm0.1:   data[24-0/100]: a5 \n");
}

std::string dumped(std::string_view label, const std::vector<std::uint8_t>& bytes, int spaced) {
    return capture([&] { nrx::nrx_profile_hexdump(label, bytes, spaced); }).out;
}

TEST(profile_hexdump, puts_a_blank_behind_each_byte_only_if_spaced_is_1) {
    EXPECT_EQ(dumped("x: ", {0x00, 0x9f, 0xff}, 1), "x: 00 9f ff \n");
    EXPECT_EQ(dumped("x: ", {0x00, 0x9f, 0xff}, 0), "x: 009fff\n");
    EXPECT_EQ(dumped("x: ", {0x12}, 2), "x: 12\n");
    EXPECT_EQ(dumped("x: ", {0x12}, -1), "x: 12\n");
    EXPECT_EQ(dumped("", {}, 1), "\n");
}

TEST(profile_hexdump, stops_the_process_if_the_line_would_not_fit) {
    EXPECT_EQ(dumped("ab", std::vector<std::uint8_t>(84), 1).size(), 2U + 84 * 3 + 1);
    EXPECT_EQ(dumped(std::string(254, 'l'), {}, 0).size(), 255U);
    const std::string report =
        "nrxctl/decoders/profile_hexdump.cpp:[0-9]+: nrx_profile_hexdump: Assertion "
        "`\\(strlen\\(label\\) \\+ 3\\*bufLen \\+ 1\\) < sizeof\\(line\\)' failed\\.";
    EXPECT_DEATH(nrx::nrx_profile_hexdump("abc", std::vector<std::uint8_t>(84), 1), report);
    EXPECT_DEATH(nrx::nrx_profile_hexdump(std::string(255, 'l'), {}, 0), report);
}

}  // namespace
