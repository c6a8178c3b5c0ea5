#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "nrxctl/base/check.h"
#include "nrxctl/base/end_process.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "tests/support/capture.h"

namespace {

using namespace tests;

std::string reported(const char* label, const char* condition, const char* exit_label,
                     const char* message, const char* file, int line, std::uint32_t code) {
    const auto result = capture([&] {
        nrx::report_failure(label, condition, exit_label, message, file, line,
                            platform::code_from_bits(code));
    });
    EXPECT_EQ(result.out, "");
    return result.err;
}

TEST(failure_report, is_one_line_of_the_parts_that_are_given) {
    EXPECT_EQ(reported("nrxtoollib", "kr == 0 ", "bail", "Failed in setting mode", "file", 17,
                       0xe00002c7),
              "Assertion failed: nrxtoollib: Check failed: kr == 0  bail Failed in setting mode "
              "file:17 unsupported request (0xe00002c7)\n");
    EXPECT_EQ(reported("keyprobe", "service", "bail", nullptr, "keyprobe/x", 3, 0),
              "Assertion failed: keyprobe: Check failed: service bail keyprobe/x:3\n");
    EXPECT_EQ(reported("keyprobe", "service", "bail", nullptr, "keyprobe/x", 0, 0),
              "Assertion failed: keyprobe: Check failed: service bail \n");
    EXPECT_EQ(reported("keyprobe", nullptr, "bail", nullptr, "x", -2, 0),
              "Assertion failed: keyprobe: bail x:-2\n");
    EXPECT_EQ(reported("keyprobe", nullptr, nullptr, "message", nullptr, 9, 0),
              "Assertion failed: keyprobe: message \n");
}

TEST(failure_report, ends_with_the_text_of_the_code_and_its_32_bit_pattern) {
    const std::vector<std::pair<std::uint32_t, std::string>> codes{
        {0xe00002bd, "out of memory (0xe00002bd)"},
        {0xe00002c2, "bad argument (0xe00002c2)"},
        {0xe00002c7, "unsupported request (0xe00002c7)"},
        {0xe00002f0, "service not found (0xe00002f0)"},
        {0xe0000401, "device i/o failure (0xe0000401)"},
        {0xe0000402, "reply larger than the room for it (0xe0000402)"},
        {0xe0001234, "unknown return code (0xe0001234)"},
        {5, "unknown return code (0x5)"},
    };
    for (const auto& [code, text] : codes) {
        EXPECT_EQ(reported(nullptr, nullptr, nullptr, nullptr, nullptr, 0, code),
                  "Assertion failed: :  " + text + "\n");
    }
}

TEST(check, returns_whether_it_holds_and_names_its_source_line) {
    const std::vector<std::uint8_t> short_reply(1);
    const auto held = capture([] {
        EXPECT_TRUE(nrx::check(true, "service"));
        EXPECT_TRUE(nrx::check_success(platform::success, "kr == 0 "));
    });
    EXPECT_EQ(held.err, "");
    const int line = __LINE__;
    const auto failed = capture([&] {
        EXPECT_FALSE(nrx::check(nullptr, "child"));
        EXPECT_FALSE(nrx::check_success(platform::no_memory, "result == 0 "));
        nrx::check_length(short_reply, 2);
    });
    const auto place = [&](int below) {
        return " bail tests/base/failure_report_test.cpp:" + std::to_string(line + below);
    };
    const std::string begin = "Assertion failed: nrxtoollib: Check failed: ";
    EXPECT_EQ(failed.raw_err, begin + "child" + place(2) + "\n" + begin + "result == 0 " +
                                  place(3) + " out of memory (0xe00002bd)\n" + begin +
                                  "length >= 2" + place(4) + "\n");
}

TEST(failure_count, counts_reports_and_lines_that_state_a_failure) {
    const std::uint64_t before = nrx::failure_count();
    EXPECT_EQ(capture([] { nrx::print_failure("Replay is not enabled"); }).out,
              "Replay is not enabled\n");
    reported(nullptr, "x", nullptr, nullptr, nullptr, 0, 0);
    nrx::count_failure();
    EXPECT_EQ(nrx::failure_count() - before, 3U);
}

TEST(end_process, ends_only_the_action_and_flushes_output) {
    nrx::memory_sink out;
    const nrx::scoped_sink installed(nrx::standard_stream::output, out);
    const nrx::block_output blocks;
    nrx::print_line("before");
    EXPECT_FALSE(nrx::run_to_completion([] {
        EXPECT_FALSE(nrx::run_to_completion([] { nrx::end_process(); }));
        EXPECT_TRUE(nrx::run_to_completion([] {}));
        nrx::end_process();
    }));
    EXPECT_EQ(out.text(), "before\n");
}

}  // namespace
