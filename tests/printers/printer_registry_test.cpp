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

TEST(report_printers, serve_the_registered_identifiers_and_dump_any_other) {
    for (std::int32_t id = -1000; id < 1000; ++id) {
        nrx::report_printer expected = nullptr;
        if (id >= 0xd0 && id <= 0xf7) expected = nrx::print_diag_report;
        if (id == 0xe3) expected = nrx::print_input_error_stats;
        if (id == 0x45) expected = nrx::print_transfer_errors;
        if (id == 0x53) expected = nrx::print_sample_ranges;
        EXPECT_EQ(nrx::find_report_printer(id), expected) << id;
    }
    const auto printed = [](std::int32_t id) {
        return tests::capture(
                   [=] { nrx::print_report("mux", id, std::vector<std::uint8_t>(12, 'A')); })
            .out;
    };
    EXPECT_EQ(printed(0xcf),
              "00000000: 41 41 41 41 41 41 41 41  41 41 41 41              | AAAAAAAA AAAA\n");
    EXPECT_EQ(printed(0xd0), "data:41414141 timestamp:4702111234474983745\n");
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
