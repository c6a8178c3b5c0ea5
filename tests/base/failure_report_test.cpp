#include "nrxctl/base/failure_report.h"

#include <functional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "nrxctl/base/reply_fields.h"
#include "tests/support/capture.h"

namespace {

using nrx::report_failure;
using tests::capture;

std::string reported(const char* label, const char* condition, const char* exit_label,
                     const char* message, const char* file, int line, std::uint32_t code) {
    const auto result = capture([&] {
        report_failure(label, condition, exit_label, message, file, line,
                       platform::code_from_bits(code));
    });
    EXPECT_EQ(result.out, "");
    return result.err;
}

TEST(failure_report, is_one_line_with_all_its_parts_in_order) {
    EXPECT_EQ(reported("nrxtoollib", "kr == 0 ", "bail", "Failed in setting mode", "file", 17,
                       0xe00002c7),
              "Assertion failed: nrxtoollib: Check failed: kr == 0  bail Failed in setting mode "
              "file:17 unsupported request (0xe00002c7)\n");
}

TEST(failure_report, leaves_out_the_parts_that_are_not_given) {
    EXPECT_EQ(reported("keyprobe", "service", "bail", nullptr, "keyprobe/x", 3, 0),
              "Assertion failed: keyprobe: Check failed: service bail keyprobe/x:3\n");
    EXPECT_EQ(reported("keyprobe", "service", "bail", nullptr, "keyprobe/x", 0, 0),
              "Assertion failed: keyprobe: Check failed: service bail \n");
    EXPECT_EQ(reported("keyprobe", nullptr, "bail", nullptr, "x", -2, 0),
              "Assertion failed: keyprobe: bail x:-2\n");
    EXPECT_EQ(reported("keyprobe", nullptr, nullptr, "message", nullptr, 9, 0),
              "Assertion failed: keyprobe: message \n");
    EXPECT_EQ(reported(nullptr, nullptr, nullptr, nullptr, nullptr, 0, 0xe0001234),
              "Assertion failed: :  unknown return code (0xe0001234)\n");
}

TEST(failure_report, prints_every_code_as_its_32_bit_pattern) {
    EXPECT_EQ(reported("l", nullptr, nullptr, nullptr, nullptr, 0, 0xe00002f0),
              "Assertion failed: l:  service not found (0xe00002f0)\n");
    EXPECT_EQ(reported("l", nullptr, nullptr, nullptr, nullptr, 0, 5),
              "Assertion failed: l:  unknown return code (0x5)\n");
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
