#include "nrxctl/printers/printer_registry.h"

#include <vector>

#include <gtest/gtest.h>

#include "nrxctl/printers/diag_report.h"
#include "nrxctl/printers/haptic_names.h"
#include "nrxctl/printers/input_error_stats.h"
#include "nrxctl/printers/sample_ranges.h"
#include "nrxctl/printers/transfer_errors.h"
#include "tests/support/capture.h"

namespace {

TEST(report_printers, registers_42_identifiers) {
    int registered = 0;
    for (std::int32_t id = -1000; id < 1000; ++id) {
        nrx::report_printer expected = nullptr;
        if (id >= 0xd0 && id <= 0xf7) expected = nrx::print_diag_report;
        if (id == 0xe3) expected = nrx::print_input_error_stats;
        if (id == 0x45) expected = nrx::print_transfer_errors;
        if (id == 0x53) expected = nrx::print_sample_ranges;
        EXPECT_EQ(nrx::find_report_printer(id), expected) << id;
        if (nrx::find_report_printer(id) != nullptr) ++registered;
    }
    EXPECT_EQ(registered, 42);
}

TEST(report_printers, print_what_has_no_printer_as_a_dump) {
    const std::string dump = "00000000: 41                                                | A\n";
    for (const std::int32_t id : {0x44, 0xcf, 0xf8, -1}) {
        EXPECT_EQ(tests::capture([&] {
                      nrx::print_report("morvane", id, std::vector<std::uint8_t>{'A'});
                  }).out,
                  dump);
    }
    EXPECT_EQ(
        tests::capture([&] { nrx::print_report("mux", 0xd0, std::vector<std::uint8_t>(12)); }).out,
        "data: 0 timestamp:0\n");
}

TEST(name_tables, name_what_they_know_and_nothing_else) {
    EXPECT_EQ(nrx::name_of(nrx::speed_names, 0), "Slow");
    EXPECT_EQ(nrx::name_of(nrx::speed_names, 2), "Fast");
    EXPECT_EQ(nrx::name_of(nrx::button_event_names, 15), "LongPressUp");
    for (const std::int32_t code : {-1, 16, 255, INT32_MIN, INT32_MAX}) {
        EXPECT_EQ(nrx::name_of(nrx::button_event_names, code), "") << code;
    }
    EXPECT_EQ(nrx::name_of(nrx::speed_names, 3), "");
}

}  // namespace
