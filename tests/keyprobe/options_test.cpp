#include "keyprobe/options.h"

#include "tests/support/device_test.h"
#include "tests/support/word_vector.h"

namespace tests {

// Runs the front end with words; a plain return of main counts as a status too.
outcome run(std::vector<std::string> words) {
    word_vector all(std::move(words));
    std::optional<int> returned;
    auto result = capture([&] { returned = nrx::keyprobe::run(all.argc(), all.argv()); });
    if (!result.status) result.status = returned;
    return result;
}

TEST(options, do_not_tell_by_the_status_that_steps_failed_but_that_there_is_no_program_name) {
    machine host;
    const platform::simulated::installed_machine installed(host);
    // The parser starts afresh each time, also after it was left inside a word.
    EXPECT_EQ(run({"keyprobe", "-bb"}).status, 1);
    const auto result = run({"keyprobe", "--collectall"});
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.out, "==========keyprobe arc 0xd0==============\n");
    EXPECT_TRUE(result.err.ends_with(
        failure_line("keyprobe", "service", "keyprobe/hid_feature_reports.cpp")));
    const auto none = run({});
    EXPECT_EQ(none.status, 1);
    EXPECT_EQ(none.err, "usage: keyprobe [--collectall]\n");
}

}  // namespace tests
