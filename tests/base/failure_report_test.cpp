#include "nrxctl/base/failure_report.h"

#include <functional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "nrxctl/base/reply_fields.h"
#include "tests/support/capture.h"

namespace {

using namespace tests;
using nrx::report_failure;

std::string reported(const char* label, const char* condition, const char* exit_label,
                     const char* message, const char* file, int line, std::uint32_t code) {
    const auto result = capture([&] {
        report_failure(label, condition, exit_label, message, file, line,
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

TEST(check, answers_whether_it_holds) {
    const auto held = capture([] {
        EXPECT_TRUE(nrx::check(true, "service"));
        EXPECT_TRUE(nrx::check_success(platform::success, "kr == 0 "));
    });
    EXPECT_EQ(held.err, "");
    const auto failed = capture([] {
        EXPECT_FALSE(nrx::check(nullptr, "child"));
        EXPECT_FALSE(nrx::check_success(platform::no_memory, "result == 0 "));
    });
    EXPECT_EQ(failed.err,
              "Assertion failed: nrxtoollib: Check failed: child bail "
              "tests/base/failure_report_test.cpp\n"
              "Assertion failed: nrxtoollib: Check failed: result == 0  bail "
              "tests/base/failure_report_test.cpp out of memory (0xe00002bd)\n");
}

TEST(check, names_the_line_where_it_stands) {
    const auto place_of = [](const std::function<void()>& failing) {
        const std::string text = capture(failing).err_as_written;
        const std::string file = "tests/base/failure_report_test.cpp:";
        return std::stoi(text.substr(text.find(file) + file.size()));
    };
    const std::vector<std::uint8_t> short_reply(1);
    EXPECT_EQ(place_of([] { nrx::check(false, "child"); }), __LINE__);
    EXPECT_EQ(place_of([] { nrx::check_success(5, "kr == 0 "); }), __LINE__);
    EXPECT_EQ(place_of([&] { nrx::check_length(short_reply, 2); }), __LINE__);
}

}  // namespace
