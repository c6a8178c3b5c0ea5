#include "nrxctl/printers/report_printers.h"

#include <gtest/gtest.h>

#include "nrxctl/printers/diag_report.h"
#include "nrxctl/printers/error_reports.h"
#include "nrxctl/printers/sample_ranges.h"
#include "nrxctl/printers/spi_status.h"
#include "nrxctl/printers/value_printers.h"
#include "tests/support/device_test.h"
#include "tests/support/report_bytes.h"
#include "tests/support/rows.h"

namespace {

using namespace tests;
using bytes = std::vector<std::uint8_t>;

std::string print(nrx::report_printer printer, std::string_view service, const bytes& report) {
    return printed(printer, service, 0xd0, report).out;
}

TEST(report_printers, serve_the_registered_ids_and_dump_any_other) {
    for (nrx::report_id id = 0; id < 1000; ++id) {
        nrx::report_printer expected = nullptr;
        if (id >= 0xd0 && id <= 0xf7) expected = nrx::print_diag_report;
        if (id == 0xe3) expected = nrx::print_input_error_stats;
        if (id == 0x45) expected = nrx::print_transfer_errors;
        if (id == 0x53) expected = nrx::print_sample_ranges;
        EXPECT_EQ(nrx::find_report_printer(id), expected) << id;
    }
    EXPECT_EQ(printed(nrx::print_report, "mux", 0xcf, bytes(12, 'A')).out,
              "00000000: 41 41 41 41 41 41 41 41  41 41 41 41              | AAAAAAAA AAAA\n");
    EXPECT_EQ(printed(nrx::print_report, "mux", 0xd0, bytes(12, 'A')).out,
              "data:41414141 timestamp:4702111234474983745\n");
}

TEST(input_error_stats, prints_every_counter_under_the_name_of_the_service) {
    number_list counters(0xf0000000);
    while (counters.size() < 16)
        counters.push_back(counters.back() + 1);
    const bytes report = report_with(64, {{0, 4, counters}});
    EXPECT_EQ(print(nrx::print_input_error_stats, "accel", report),
              "=========== (input report) error stats for <service_id>: accel===========\n"
              "_total_packets_nrx_received         # 4026531850\n"
              "_total_packets_sent_to_ap           # 4026531851\n"
              "_resets_since_boot                  # -268435444\n"
              "_packet_drops                       # 4026531840\n"
              "_pt_invalid_packets(debug)          # 4026531854\n"
              "_pt_cached_packets                  # 4026531855\n"
              "_duplicate_packet_drops             # 4026531853\n"
              "_chksum_errors                      # 4026531849\n"
              "\n"
              "_total_status_errors                # 4026531841\n"
              "  _status_IOReturnError             # 4026531842\n"
              "  _status_IOReturnNotReady          # 4026531843\n"
              "  _status_IOReturnNotPermitted      # 4026531844\n"
              "  _status_IOReturnUnsupported       # 4026531845\n"
              "  _status_IOReturnBadArgument       # 4026531846\n"
              "  _status_IOReturnIOError           # 4026531847\n"
              "  _status_IOReturnInternalError     # 4026531848\n"
              "\n");
    print_every_prefix(nrx::print_input_error_stats, "accel", 0xe3, report, 64,
                       source_file::error_reports);
    EXPECT_EQ(print(nrx::print_input_error_stats, "accel", {}), "");
}

TEST(transfer_errors, prints_a_line_for_each_complete_record) {
    const auto record = [](std::string_view name) {
        bytes report = report_with(
            32, {{0, 4, {0xf0000000, 0xf0000001, 0xf0000002, 0xf0000003, 0x80000000, 0xf0000005}}},
            0);
        std::copy(name.begin(), name.end(), report.begin() + 24);
        return report;
    };
    auto report = record("spi0");
    const auto second = record("i2cm0xyz");
    report.insert(report.end(), second.begin(), second.end());
    const std::string counters =
        " read_errors: -268435455/-268435456 write_errors: -268435453/-268435454 "
        "other_errors: -268435451/-2147483648\n";
    const auto print_first = [&](std::ptrdiff_t size) {
        return print(nrx::print_transfer_errors, "x", {report.begin(), report.begin() + size});
    };
    EXPECT_EQ(print_first(64), "spi0           " + counters + "i2cm0xy        " + counters);
    EXPECT_EQ(print_first(63), "spi0           " + counters);
    EXPECT_EQ(print_first(31), "");
    EXPECT_EQ(print_first(0), "");
}

TEST(sample_ranges, prints_the_range_of_each_axis_of_a_motion_sensor) {
    const bytes report = report_with(
        28, {{0, 4, {0xffffffff, 0xffff8000, 0, 1, 0xffff0000, 0x80000000, 0x7fffffff}}});
    for (const char* service : {"accel", "gyro", "compass"}) {
        EXPECT_EQ(print(nrx::print_sample_ranges, service, report),
                  "num_samples: -1\n"
                  "x: -0.500000 - +0.000000\n"
                  "y: +0.000015 - -1.000000\n"
                  "z: -32768.000000 - +32767.999985\n");
    }
    print_every_prefix(nrx::print_sample_ranges, "accel", 0x53, report, 28,
                       source_file::sample_ranges);
    EXPECT_EQ(print(nrx::print_sample_ranges, "als", {}), "");
    EXPECT_EQ(print(nrx::print_sample_ranges, "Accel", {'A'}),
              "00000000: 41                                                | A\n");
}

outcome print_spi(const bytes& record) {
    return capture([&] { nrx::print_spi_status(record); });
}

TEST(spi_status, dumps_captured_data_under_its_heading) {
    const rows<std::uint8_t, std::string> headings{{0, "MOSI"}, {1, "MISO"}, {3, "AccelVar"}};
    for (const auto& [type, name] : headings) {
        auto record = report_with(9, {{0, 8, 0xffffffffffffffff}, {8, 1, type}});
        const std::string heading = "\ntimestamp: 18446744073709551615, " + name + ": \n";
        EXPECT_EQ(print_spi(record).out, heading);
        record.insert(record.end(), {'a', 'b'});
        EXPECT_EQ(print_spi(record).out,
                  heading + "00000000: 61 62                                             | ab\n");
    }
    for (const std::uint64_t type : {4U, 5U, 255U}) {
        const auto result = print_spi(report_with(30, {{8, 1, type}}));
        EXPECT_EQ(result.out + result.err, "") << type;
    }
}

TEST(spi_status, prints_every_error_with_its_own_spacing) {
    const rows<std::uint64_t, std::uint64_t, std::string> errors{
        {0x7001, 0xdeadbeef, "(0x7001), errorStatus(0xdeadbeef), error: bad checksum\n"},
        {0x7002, 1, "(0x7002), errorStatus(0x1),  error: corrupted transport header\n"},
        {0x7003, 0, "(0x7003), errorStatus(0x0),  error:bad transport header status\n"},
        {0x7004, 15, "(0x7004), errorStatus(0xf),  error:spi read error\n"},
        {0x7005, 0xffffffff, "(0x7005), -1 packet_drops observed\n"},
        {0x7009, 5, "(0x7009), \n"},
        {0xf0000000, 5, "(0xf0000000), \n"},
    };
    for (const auto& [code, value, text] : errors) {
        const auto record = report_with(20, {{0, 8, 77}, {8, 1, 2}, {9, 4, code}, {13, 4, value}});
        EXPECT_EQ(print_spi(record).out, "\ntimestamp: 77, STATUS: errorCode" + text);
    }
}

TEST(spi_status, a_record_too_short_for_its_type_is_dumped) {
    const auto empty = print_spi({});
    EXPECT_EQ(empty.out + empty.err, "");
    const auto header = print_spi({2, 0, 0, 0, 0, 0, 0, 0});
    EXPECT_EQ(header.out,
              "00000000: 02 00 00 00 00 00 00 00                           | ........ \n");
    EXPECT_EQ(header.err, library_report(source_file::spi_status, "length >= 9"));
    for (std::size_t size = 9; size < 17; ++size) {
        const auto status = print_spi(report_with(size, {{8, 1, 2}}));
        EXPECT_EQ(status.out.substr(0, 10), "00000000: ") << size;
        EXPECT_EQ(status.err, library_report(source_file::spi_status, "length >= 17"));
    }
}

TEST(value_printers, text_or_dump_looks_at_every_byte_but_the_last) {
    const auto text_or_dump = [](const bytes& report) {
        return print(nrx::print_text_or_dump, "x", report);
    };
    EXPECT_EQ(text_or_dump({'o', 'k', 0}), std::string("ok\0\n", 4));
    EXPECT_EQ(text_or_dump({' ', '\t', '\n', '\v', '\f', '\r', '~', 0xff}), " \t\n\v\f\r~\xff\n");
    EXPECT_EQ(text_or_dump({0}), std::string("\0\n", 2));
    EXPECT_EQ(text_or_dump({}), "");
    EXPECT_EQ(text_or_dump({0, 'k'}),
              "00000000: 00 6b                                             | .k\n");
    for (const std::uint8_t byte : bytes{0x08, 0x0e, 0x1f, 0x7f, 0x80, 0xff})
        EXPECT_EQ(text_or_dump({byte, 'a'}).substr(0, 10), "00000000: ") << int{byte};
}

TEST(value_printers, print_their_bytes_and_nothing_else) {
    const rows<nrx::report_printer, bytes, std::string> cases{
        {nrx::print_hex,
         {'a'},
         "00000000: 61                                                | a\n"},
        {nrx::print_text, {'a', 0, 0xff}, {"a\0\xff\n", 4}},
        {nrx::print_text, {}, "\n"},
        {nrx::print_raw, {'a', 0, '\n'}, {"a\0\n", 3}},
        {nrx::print_raw, {}, ""},
        {nrx::print_u32, {0xff, 0xff, 0xff, 0xff}, "4294967295\n"},
        {nrx::print_u32, {1, 2}, "513\n"},
        {nrx::print_u32, {}, "0\n"},
        {nrx::print_u32, {1, 2, 3, 4, 5}, ""},
    };
    for (const auto& [printer, report, text] : cases)
        EXPECT_EQ(print(printer, "x", report), text);
}

}  // namespace
