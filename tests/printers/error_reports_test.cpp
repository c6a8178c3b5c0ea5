// Error statistics, transfer errors and sample ranges.
#include <gtest/gtest.h>

#include "nrxctl/printers/input_error_stats.h"
#include "nrxctl/printers/sample_ranges.h"
#include "nrxctl/printers/transfer_errors.h"
#include "tests/support/report_bytes.h"

namespace {

using tests::printed;
using tests::report_with;

TEST(input_error_stats, prints_every_counter_under_the_name_of_the_service) {
    const auto report = report_with(64, {{0, 4, 1},
                                         {4, 4, 2},
                                         {8, 4, 3},
                                         {12, 4, 4},
                                         {16, 4, 5},
                                         {20, 4, 6},
                                         {24, 4, 7},
                                         {28, 4, 8},
                                         {32, 4, 9},
                                         {36, 4, 10},
                                         {40, 4, 0xffffffff},
                                         {44, 4, 12},
                                         {48, 4, 0xffffffff},
                                         {52, 4, 14},
                                         {56, 4, 15},
                                         {60, 4, 16}});
    EXPECT_EQ(printed(nrx::print_input_error_stats, "accel", 0xe3, report).out,
              "=========== (input report) error stats for <service_id>: accel===========\n"
              "_total_packets_nrx_received         # 4294967295\n"
              "_total_packets_sent_to_ap           # 12\n"
              "_resets_since_boot                  # -1\n"
              "_packet_drops                       # 1\n"
              "_pt_invalid_packets(debug)          # 15\n"
              "_pt_cached_packets                  # 16\n"
              "_duplicate_packet_drops             # 14\n"
              "_chksum_errors                      # 10\n"
              "\n"
              "_total_status_errors                # 2\n"
              "  _status_IOReturnError             # 3\n"
              "  _status_IOReturnNotReady          # 4\n"
              "  _status_IOReturnNotPermitted      # 5\n"
              "  _status_IOReturnUnsupported       # 6\n"
              "  _status_IOReturnBadArgument       # 7\n"
              "  _status_IOReturnIOError           # 8\n"
              "  _status_IOReturnInternalError     # 9\n"
              "\n");
    tests::print_every_prefix(nrx::print_input_error_stats, "accel", 0xe3, report, 64,
                              "nrxctl/printers/input_error_stats.cpp");
    EXPECT_EQ(printed(nrx::print_input_error_stats, "accel", 0xe3, {}).out, "");
}

std::vector<std::uint8_t> bus_record(std::string_view name) {
    auto record = report_with(32, {{0, 4, 100},
                                   {4, 4, 1},
                                   {8, 4, 200},
                                   {12, 4, 0xffffffff},
                                   {16, 4, 0x80000000},
                                   {20, 4, 3}});
    for (std::size_t i = 0; i < 8; ++i) {
        record[24 + i] = i < name.size() ? static_cast<std::uint8_t>(name[i]) : std::uint8_t{0};
    }
    return record;
}

TEST(transfer_errors, prints_a_line_for_each_whole_record) {
    auto report = bus_record("spi0");
    const auto second = bus_record("i2cm0xyz");
    report.insert(report.end(), second.begin(), second.end());
    const std::string counters =
        " read_errors: 1/100 write_errors: -1/200 other_errors: 3/-2147483648\n";
    EXPECT_EQ(printed(nrx::print_transfer_errors, "x", 0x45, report).out,
              "spi0           " + counters + "i2cm0xy        " + counters);
    report.resize(63);
    EXPECT_EQ(printed(nrx::print_transfer_errors, "x", 0x45, report).out,
              "spi0           " + counters);
    report.resize(31);
    EXPECT_EQ(printed(nrx::print_transfer_errors, "x", 0x45, report).out, "");
    EXPECT_EQ(printed(nrx::print_transfer_errors, "x", 0x45, {}).out, "");
}

TEST(sample_ranges, prints_the_range_of_each_axis_of_a_motion_sensor) {
    const auto report = report_with(28, {{0, 4, 0xffffffff},
                                         {4, 4, 0xffff8000},
                                         {8, 4, 65536},
                                         {12, 4, 0},
                                         {16, 4, 1},
                                         {20, 4, 0x80000000},
                                         {24, 4, 0x7fffffff}});
    const std::string text =
        "num_samples: -1\n"
        "x: -0.500000 - +1.000000\n"
        "y: +0.000000 - +0.000015\n"
        "z: -32768.000000 - +32767.999985\n";
    for (const char* service : {"accel", "gyro", "compass"}) {
        EXPECT_EQ(printed(nrx::print_sample_ranges, service, 0x53, report).out, text);
    }
    tests::print_every_prefix(nrx::print_sample_ranges, "accel", 0x53, report, 28,
                              "nrxctl/printers/sample_ranges.cpp");
    EXPECT_EQ(printed(nrx::print_sample_ranges, "gyro", 0x53, {9, 0, 0, 0, 1}).out,
              "num_samples: 9\n"
              "x: +0.000000 - +0.000000\n"
              "y: +0.000000 - +0.000000\n"
              "z: +0.000000 - +0.000000\n");
    EXPECT_EQ(printed(nrx::print_sample_ranges, "als", 0x53, {}).out, "");
    EXPECT_EQ(printed(nrx::print_sample_ranges, "Accel", 0x53, {'A'}).out,
              "00000000: 41                                                | A\n");
}

}  // namespace
