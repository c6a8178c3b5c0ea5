// keyprobe as a process, on the embedded device.
#include "tests/support/program.h"

#include <algorithm>
#include <cstdlib>

#include <gtest/gtest.h>

namespace {

using namespace tests;

const std::string program = KEYPROBE_PROGRAM;

TEST(keyprobe_program, collects_everything_from_the_embedded_device) {
    const auto result = run_program(program, {"--collectall"});
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.err, "");
    EXPECT_TRUE(result.out.starts_with("==========keyprobe get-stats==============\nkpdx_stats\n"));
    // Each of the last reports is dumped.
    EXPECT_NE(result.out.find("hidreport get 0xe4 -u 0xFF00,0x0020===============\n00000000: e4"),
              std::string::npos);
    EXPECT_NE(result.out.find("\nLength: 1479, expected 1479\nASSET [Slow][SingleDown]: enable 1"),
              std::string::npos);
}

TEST(keyprobe_program, ends_with_the_status_of_its_words) {
    const std::string usage = "usage: " + program + " [--collectall]\n";
    const std::string all = run_program(program, {"--collectall"}).out;
    struct row {
        std::vector<std::string> words;
        int status;
        std::string out;
        std::string err;
    };
    const std::vector<row> rows{
        {{}, 0, "", ""},
        {{"word", "-", "--", "--help"}, 0, "", ""},
        {{"word", "--coll"}, 0, all, ""},
        {{"--collectall", "word", "--c"}, 0, all + all, ""},
        {{"--help"}, 1, "", usage},
        {{"--h"}, 1, "", usage},
        {{"-b", "--collectall"}, 1, "", usage},
        {{"-fx"}, 1, "", usage},
        {{"-f", "file"}, 1, "", usage},
        {{"-f"}, 1, "", program + ": option requires an argument -- 'f'\n" + usage},
        {{"-s"}, 1, "", program + ": invalid option -- 's'\n" + usage},
        {{"--nope"}, 1, "", program + ": unrecognized option '--nope'\n" + usage},
        {{"--collectall=x"},
         1,
         "",
         program + ": option '--collectall' doesn't allow an argument\n" + usage},
        {{"--collectall", "-b"}, 1, all, usage},
    };
    for (const row& one : rows) {
        const auto result = run_program(program, one.words);
        EXPECT_EQ(result.status, one.status) << ::testing::PrintToString(one.words);
        EXPECT_EQ(result.out, one.out) << ::testing::PrintToString(one.words);
        EXPECT_EQ(result.err, one.err) << ::testing::PrintToString(one.words);
    }
}

TEST(keyprobe_program, parses_the_same_whatever_the_environment) {
    ::setenv("POSIXLY_CORRECT", "1", 1);
    const auto result = run_program(program, {"word", "--collectall"});
    ::unsetenv("POSIXLY_CORRECT");
    EXPECT_TRUE(result.out.starts_with("==========keyprobe get-stats==============\n"));
}

TEST(keyprobe_program, survives_output_that_cannot_be_written) {
    for (const output_to target :
         {output_to::closed_pipe, output_to::full_device, output_to::nowhere}) {
        const auto result = run_program(program, {"--collectall"}, target);
        EXPECT_EQ(result.status, 0);
        EXPECT_EQ(result.err, "");
    }
}

TEST(keyprobe_program, writes_whole_lines_one_at_a_time) {
    const auto writes = writes_of(program, {"--collectall"});
    EXPECT_GT(writes.size(), 100U);
    for (const std::string& text : writes) {
        EXPECT_EQ(std::count(text.begin(), text.end(), '\n'), 1) << text;
        EXPECT_TRUE(text.ends_with('\n')) << text;
    }
}

}  // namespace
