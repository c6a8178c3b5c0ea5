// Error statistics, transfer errors and sample ranges.
#include <algorithm>

#include <gtest/gtest.h>

#include "nrxctl/printers/input_error_stats.h"
#include "nrxctl/printers/sample_ranges.h"
#include "nrxctl/printers/transfer_errors.h"
#include "tests/support/report_bytes.h"

namespace {

using namespace tests;
using bytes = std::vector<std::uint8_t>;

std::string printed(nrx::report_printer print, std::string_view service, const bytes& report) {
    return tests::printed(print, service, 0, report).out;
}

TEST(input_error_stats, prints_every_counter_under_the_name_of_the_service) {
    const bytes report = report_with(
        64, {{0, 4, {1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 0xffffffff, 12, 0xffffffff, 14, 15, 16}}});
    EXPECT_EQ(printed(nrx::print_input_error_stats, "accel", report),
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
    print_every_prefix(nrx::print_input_error_stats, "accel", 0xe3, report, 64,
                       "nrxctl/printers/input_error_stats.cpp");
    EXPECT_EQ(printed(nrx::print_input_error_stats, "accel", {}), "");
}

bytes bus_record(std::string_view name) {
    bytes record = report_with(32, {{0, 4, {100, 1, 200, 0xffffffff, 0x80000000, 3}}, {24, 8, 0}});
    std::copy(name.begin(), name.end(), record.begin() + 24);
    return record;
}

TEST(transfer_errors, prints_a_line_for_each_whole_record) {
    auto report = bus_record("spi0");
    const auto second = bus_record("i2cm0xyz");
    report.insert(report.end(), second.begin(), second.end());
    const std::string counters =
        " read_errors: 1/100 write_errors: -1/200 other_errors: 3/-2147483648\n";
    EXPECT_EQ(printed(nrx::print_transfer_errors, "x", report),
              "spi0           " + counters + "i2cm0xy        " + counters);
    report.resize(63);
    EXPECT_EQ(printed(nrx::print_transfer_errors, "x", report), "spi0           " + counters);
    report.resize(31);
    EXPECT_EQ(printed(nrx::print_transfer_errors, "x", report), "");
    EXPECT_EQ(printed(nrx::print_transfer_errors, "x", {}), "");
}

TEST(sample_ranges, prints_the_range_of_each_axis_of_a_motion_sensor) {
    const bytes report =
        report_with(28, {{0, 4, {0xffffffff, 0xffff8000, 65536, 0, 1, 0x80000000, 0x7fffffff}}});
    const std::string text =
        "num_samples: -1\n"
        "x: -0.500000 - +1.000000\n"
        "y: +0.000000 - +0.000015\n"
        "z: -32768.000000 - +32767.999985\n";
    for (const char* service : {"accel", "gyro", "compass"}) {
        EXPECT_EQ(printed(nrx::print_sample_ranges, service, report), text);
    }
    print_every_prefix(nrx::print_sample_ranges, "accel", 0x53, report, 28,
                       "nrxctl/printers/sample_ranges.cpp");
    EXPECT_EQ(printed(nrx::print_sample_ranges, "gyro", {9, 0, 0, 0, 1}),
              "num_samples: 9\n"
              "x: +0.000000 - +0.000000\n"
              "y: +0.000000 - +0.000000\n"
              "z: +0.000000 - +0.000000\n");
    EXPECT_EQ(printed(nrx::print_sample_ranges, "als", {}), "");
    EXPECT_EQ(printed(nrx::print_sample_ranges, "Accel", {'A'}),
              "00000000: 41                                                | A\n");
}

}  // namespace
