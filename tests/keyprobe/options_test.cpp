#include "keyprobe/options.h"

#include <algorithm>

#include "tests/keyprobe/button_host.h"

namespace {

class options : public tests::device_test {
protected:
    // Runs the front end with words; a plain return of main counts as a status too.
    static tests::outcome run(std::vector<std::string> words) {
        std::vector<char*> argv;
        for (std::string& word : words)
            argv.push_back(word.data());
        const auto argc = static_cast<int>(argv.size());
        argv.push_back(nullptr);
        std::optional<int> returned;
        auto result = tests::capture([&] { returned = nrx::keyprobe::run(argc, argv.data()); });
        if (!result.status) result.status = returned;
        return result;
    }

    // How often a text stands in another.
    static std::size_t count(const std::string& text, const std::string& part) {
        std::size_t found = 0;
        for (auto at = text.find(part); at != std::string::npos; at = text.find(part, at + 1)) {
            ++found;
        }
        return found;
    }

    tests::button_host services = tests::put_button_services(host);
    const std::string banner = "==========keyprobe get-stats==============\n";
};

TEST_F(options, without_any_prints_nothing) {
    for (const std::vector<std::string>& words :
         {std::vector<std::string>{"keyprobe"}, {"keyprobe", "word", "-", "--", "-b"}}) {
        const auto result = run(words);
        EXPECT_EQ(result.status, 0);
        EXPECT_EQ(result.out + result.err, "");
    }
}

TEST_F(options, collect_all_may_be_abbreviated_repeated_and_surrounded_by_words) {
    EXPECT_EQ(count(run({"keyprobe", "--collectall"}).out, banner), 1U);
    EXPECT_EQ(count(run({"keyprobe", "--coll"}).out, banner), 1U);
    EXPECT_EQ(count(run({"keyprobe", "word", "--collectall", "word", "--c"}).out, banner), 2U);
    const auto twice = run({"keyprobe", "--collectall", "--collectall"});
    EXPECT_EQ(twice.status, 0);
    const std::string all = tests::stats_text() + tests::diagnostics_text() + tests::assets_text() +
                            tests::features_text();
    EXPECT_EQ(twice.out, all + all);
}

TEST_F(options, anything_else_is_answered_with_the_usage_line) {
    const std::string usage = "usage: ./some/keyprobe [--collectall]\n";
    const std::vector<std::vector<std::string>> quiet{
        {"--help"}, {"--h"}, {"-b"}, {"-f", "x"}, {"-fx"}};
    for (auto words : quiet) {
        words.insert(words.begin(), "./some/keyprobe");
        const auto result = run(words);
        EXPECT_EQ(result.status, 1) << words[1];
        EXPECT_EQ(result.out, "");
        EXPECT_EQ(result.err, usage) << words[1];
    }
    const std::vector<std::pair<std::string, std::string>> diagnosed{
        {"-s", "invalid option -- 's'"},
        {"-f", "option requires an argument -- 'f'"},
        {"--nope", "unrecognized option '--nope'"},
        {"--collectall=5", "option '--collectall' doesn't allow an argument"},
    };
    for (const auto& [word, message] : diagnosed) {
        const auto result = run({"./some/keyprobe", word});
        EXPECT_EQ(result.status, 1) << word;
        EXPECT_EQ(result.out, "");
        EXPECT_EQ(result.err, "./some/keyprobe: " + message + "\n" + usage);
    }
}

TEST_F(options, a_wrong_option_after_the_collection_ends_with_status_1) {
    const auto result = run({"keyprobe", "--collectall", "-b", "--collectall"});
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(count(result.out, banner), 1U);
    EXPECT_TRUE(result.err.ends_with("usage: keyprobe [--collectall]\n"));
    EXPECT_EQ(count(run({"keyprobe", "-b", "--collectall"}).out, banner), 0U);
}

TEST_F(options, failed_steps_do_not_change_the_status) {
    for (const char* name : {"WQR_wqr-button", "arc", "btmspk", "button-hid"})
        host.remove(name);
    const auto result = run({"keyprobe", "--collectall"});
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.out, "==========keyprobe arc 0xd0==============\n");
    EXPECT_EQ(count(result.err, "Assertion failed: keyprobe: "), 4U);
}

TEST_F(options, an_empty_argument_vector_is_a_usage_error) {
    char* none[] = {nullptr};
    const auto result = tests::capture([&] { nrx::keyprobe::run(0, none); });
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.err, "usage: keyprobe [--collectall]\n");
}

}  // namespace
