// keyprobe as a process on the embedded device.
#include "tests/support/program.h"

#include <cstdlib>
#include <optional>

#include "keyprobe/options.h"
#include "tests/golden/golden_text.h"
#include "tests/support/argument_vector.h"
#include "tests/support/device_test.h"
#include "tests/support/rows.h"

namespace {

using namespace tests;

const std::string program = KEYPROBE_PROGRAM;
const std::string usage = "usage: " + program + " [--collectall]\n";
const std::string whole_text = golden_text("keyprobe_collectall.txt");

TEST(keyprobe_program, ends_with_the_output_and_status_of_its_arguments) {
    ASSERT_NE(whole_text, "");
    const rows<std::string, int, std::string, std::string> cases{
        {"", 0, "", ""},
        {"word - -- --help", 0, "", ""},
        {"--collectall", 0, whole_text, ""},
        {"word --coll", 0, whole_text, ""},
        {"--collectall word --c", 0, whole_text + whole_text, ""},
        {"--help", 1, "", usage},
        {"-b --collectall", 1, "", usage},
        {"-f file", 1, "", usage},
        {"-f", 1, "", program + ": option requires an argument -- 'f'\n" + usage},
        {"-s", 1, "", program + ": invalid option -- 's'\n" + usage},
        {"--nope", 1, "", program + ": unrecognized option '--nope'\n" + usage},
        {"--collectall=x", 1, "",
         program + ": option '--collectall' doesn't allow an argument\n" + usage},
        {"--collectall -b", 1, whole_text, usage},
    };
    for (const bool posix_rules : {false, true}) {
        if (posix_rules) ::setenv("POSIXLY_CORRECT", "1", 1);
        for (const auto& [arguments, status, out, err] : cases) {
            const auto result = run_program(program, split(arguments));
            EXPECT_EQ(result.status, status) << arguments;
            EXPECT_EQ(result.out, out) << arguments;
            EXPECT_EQ(result.err, err) << arguments;
        }
    }
    ::unsetenv("POSIXLY_CORRECT");
}

TEST(keyprobe_program, ignores_output_that_cannot_be_written) {
    for (const output_target target :
         {output_target::closed_pipe, output_target::full_device, output_target::closed}) {
        const auto result = run_program(program, {"--collectall"}, target);
        EXPECT_EQ(result.status, 0);
        EXPECT_EQ(result.err, "");
    }
}

// Runs the front end in this process. The status is that of a return from main or of the end of the
// process.
outcome run(std::vector<std::string> arguments) {
    argument_vector command_line(std::move(arguments));
    std::optional<int> returned;
    auto result =
        capture([&] { returned = nrx::keyprobe::run(command_line.argc(), command_line.argv()); });
    if (!result.status) result.status = returned;
    return result;
}

TEST(keyprobe_options, fail_without_a_program_name_but_not_with_the_collection) {
    machine empty_host;
    const platform::simulated::installed_machine installed(empty_host);
    // The next run resets the parser, which this one leaves inside an argument.
    EXPECT_EQ(run({"keyprobe", "-bb"}).status, 1);
    const auto result = run({"keyprobe", "--collectall"});
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.out, "==========keyprobe arc 0xd0==============\n");
    EXPECT_TRUE(result.err.ends_with(failure_line("keyprobe", "service", source_file::collection)));
    const auto nameless = run({});
    EXPECT_EQ(nameless.status, 1);
    EXPECT_EQ(nameless.err, "usage: keyprobe [--collectall]\n");
}

}  // namespace
