#include "nrxctl/printers/spi_status.h"

#include <gtest/gtest.h>

#include "tests/support/device_test.h"
#include "tests/support/report_bytes.h"

namespace {

using namespace tests;

outcome printed_record(const std::vector<std::uint8_t>& record) {
    return capture([&] { nrx::print_spi_status(record); });
}

TEST(spi_status, dumps_captured_data_under_its_heading) {
    const std::string dump = "00000000: 61 62                                             | ab\n";
    const std::vector<std::pair<std::uint8_t, std::string>> headings{
        {0, "MOSI"}, {1, "MISO"}, {3, "AccelVar"}};
    for (const auto& [type, name] : headings) {
        auto record = report_with(9, {{0, 8, 0xffffffffffffffff}, {8, 1, type}});
        const std::string heading = "\ntimestamp: 18446744073709551615, " + name + ": \n";
        EXPECT_EQ(printed_record(record).out, heading);
        record.push_back('a');
        record.push_back('b');
        EXPECT_EQ(printed_record(record).out, heading + dump);
    }
}

TEST(spi_status, spells_every_error_with_its_own_blanks) {
    struct status_row {
        std::uint64_t code;
        std::uint64_t value;
        std::string text;
    };
    const std::vector<status_row> rows{
        {0x7001, 0xdeadbeef, "(0x7001), errorStatus(0xdeadbeef), error: bad checksum\n"},
        {0x7002, 1, "(0x7002), errorStatus(0x1),  error: corrupted transport header\n"},
        {0x7003, 0, "(0x7003), errorStatus(0x0),  error:bad transport header status\n"},
        {0x7004, 15, "(0x7004), errorStatus(0xf),  error:spi read error\n"},
        {0x7005, 0xffffffff, "(0x7005), -1 packet_drops observed\n"},
        {0x7009, 5, "(0x7009), \n"},
        {0, 5, "(0x0), \n"},
    };
    for (const status_row& row : rows) {
        // Bytes behind the status do not show.
        const auto record =
            report_with(20, {{0, 8, 77}, {8, 1, 2}, {9, 4, row.code}, {13, 4, row.value}});
        EXPECT_EQ(printed_record(record).out, "\ntimestamp: 77, STATUS: errorCode" + row.text);
    }
}

TEST(spi_status, ignores_unknown_types) {
    for (const std::uint64_t type : {4U, 5U, 255U}) {
        const auto result = printed_record(report_with(30, {{8, 1, type}}));
        EXPECT_EQ(result.out + result.err, "") << type;
    }
}

TEST(spi_status, dumps_a_record_that_is_too_short_for_its_type) {
    EXPECT_EQ(printed_record({}).out, "");
    EXPECT_EQ(printed_record({}).err, "");
    const auto header = printed_record({2, 0, 0, 0, 0, 0, 0, 0});
    EXPECT_EQ(header.out,
              "00000000: 02 00 00 00 00 00 00 00                           | ........ \n");
    EXPECT_EQ(header.err,
              failure_line("nrxtoollib", "length >= 9", "nrxctl/printers/spi_status.cpp"));
    for (std::size_t size = 9; size < 17; ++size) {
        const auto status = printed_record(report_with(size, {{8, 1, 2}}));
        EXPECT_EQ(status.out.substr(0, 10), "00000000: ") << size;
        EXPECT_EQ(status.err,
                  failure_line("nrxtoollib", "length >= 17", "nrxctl/printers/spi_status.cpp"));
    }
}

}  // namespace
