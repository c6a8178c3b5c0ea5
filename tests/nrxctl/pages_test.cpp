// The manual pages against the tables of the program, both ways.
#include <algorithm>
#include <fstream>
#include <iterator>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include <gtest/gtest.h>

#include "nrxctl/nrxtoollib.h"
#include "nrxctl/options/options.h"
#include "nrxctl/profiler/config_grammar.h"
#include "nrxctl/replay/sample_line.h"
#include "nrxctl/replay/virtual_event.h"
#include "tests/support/argument_vector.h"
#include "tests/support/capture.h"
#include "tests/support/program.h"

namespace tests {

namespace {

using text_set = std::set<std::string>;

lines page_lines(const std::string& file) {
    std::ifstream stream(PAGES_FOLDER "/" + file);
    return split({std::istreambuf_iterator<char>(stream), {}}, '\n');
}

// The text of a line: without its macro, quotes and fonts. A macro for two fonts joins its
// arguments.
std::string plain(const std::string& line) {
    const std::size_t macro_end = line.starts_with('.') ? std::min(line.find(' '), line.size()) : 0;
    const bool joins = macro_end == 3;
    bool quoted = false;
    std::string text;
    for (std::size_t i = macro_end == 0 ? 0 : macro_end + 1; i < line.size(); ++i) {
        if (line[i] == '"') {
            quoted = !quoted;
        } else if (line[i] == '\\') {
            if (line.at(++i) == 'f') {
                ++i;
            } else {
                text += line[i];
            }
        } else if (line[i] != ' ' || quoted || !joins) {
            text += line[i];
        }
    }
    return text;
}

lines section(const std::string& file, const std::string& name) {
    const lines page = page_lines(file);
    const auto begin = std::find(page.begin(), page.end(), ".SH " + name);
    if (begin == page.end()) return {};
    return {begin + 1, std::find_if(begin + 1, page.end(), [](const std::string& line) {
                return line.starts_with(".SH");
            })};
}

// The entries of a section: the lines after ".TP".
lines tags(const std::string& file, const std::string& name) {
    lines entries;
    bool is_tag = false;
    for (const std::string& line : section(file, name)) {
        if (is_tag) entries.push_back(plain(line));
        is_tag = line == ".TP";
    }
    return entries;
}

std::string first_token(const std::string& text) {
    return text.substr(0, text.find(' '));
}

// The first words of the parts of each tag, which commas separate.
text_set keywords_on_page(const std::string& file, const std::string& name) {
    text_set keywords;
    for (const std::string& tag : tags(file, name)) {
        for (const std::string& part : split(tag, ','))
            keywords.insert(first_token(part.substr(part.find_first_not_of(' '))));
    }
    return keywords;
}

text_set keywords_of(std::span<const nrx::subcommand_row> table) {
    text_set keywords;
    for (const nrx::subcommand_row& row : table)
        keywords.emplace(row.keyword);
    return keywords;
}

text_set words(const lines& text) {
    text_set words;
    for (const std::string& line : text) {
        for (std::string word : split(plain(line))) {
            std::erase_if(word, [](char c) { return c == ',' || c == ':' || c == '.'; });
            words.insert(word);
        }
    }
    return words;
}

// The subcommands that a usage names.
text_set usage_keywords(const std::string& usage, const std::string& option) {
    text_set keywords;
    const std::string beginning = "    nrxctl --" + option + " ";
    for (const std::string& line : split(usage, '\n')) {
        if (line.starts_with(beginning))
            keywords.insert(first_token(line.substr(beginning.size())));
    }
    return keywords;
}

std::string usage_of(void (*command)(std::string_view, std::span<char* const>, int&)) {
    int index = 0;
    return capture([&] { command("help", {}, index); }).out;
}

}  // namespace

TEST(pages, synopsis_is_the_usage) {
    const auto synopsis = [](const std::string& file) {
        std::string text = "usage:";
        for (const std::string& line : section(file, "SYNOPSIS"))
            text.append(" ").append(plain(line));
        return text + "\n";
    };
    EXPECT_TRUE(run_program(NRXCTL_PROGRAM, {"--help"}).out.starts_with(synopsis("nrxctl.1")));
    std::string usage = run_program(KEYPROBE_PROGRAM, {"--help"}).err;
    const std::string path = KEYPROBE_PROGRAM;
    usage.replace(usage.find(path), path.size(), "keyprobe");
    EXPECT_EQ(usage, synopsis("keyprobe.1"));
    EXPECT_EQ(tags("keyprobe.1", "OPTIONS"), (lines{"--collectall", "--help"}));
}

TEST(pages, options_are_those_of_the_table) {
    text_set usages;
    for (const nrx::nrxctl::option_row& row : nrx::nrxctl::option_table()) {
        std::string usage("--");
        usage.append(row.name);
        if (!row.arguments.empty()) usage.append(" ").append(row.arguments);
        usages.insert(usage);
    }
    const lines entries = tags("nrxctl.1", "OPTIONS");
    EXPECT_EQ(text_set(entries.begin(), entries.end()), usages);
}

TEST(pages, subcommands_are_those_of_the_tables_and_usages) {
    const text_set profile = keywords_of(nrx::profile_subcommands());
    const text_set replay = keywords_of(nrx::replay_subcommands());
    EXPECT_EQ(keywords_on_page("nrxctl.1", "PROFILER SUBCOMMANDS"), profile);
    EXPECT_EQ(keywords_on_page("nrxctl.1", "REPLAY SUBCOMMANDS"), replay);
    EXPECT_EQ(usage_keywords(usage_of(nrx::replay_command), "replay"), replay);
    // The usage of the profiler leaves some out.
    const text_set in_usage = usage_keywords(usage_of(nrx::profile_command), "profile");
    EXPECT_EQ(in_usage.size(), 10U);
    EXPECT_TRUE(std::includes(profile.begin(), profile.end(), in_usage.begin(), in_usage.end()));
}

// Every word of the table on the page is a keyword or a part of its headings.
TEST(pages, configuration_keywords_are_those_of_the_grammar) {
    lines table = section("nrxctl.1", "CONFIGURATIONS");
    table.erase(table.begin(), std::find(table.begin(), table.end(), ".nf"));
    text_set on_page = words(table);
    text_set keywords;
    for (const std::string_view name : nrx::profiler_keywords()) {
        const nrx::profiler_grammar& profiler = *nrx::find_profiler_grammar(name);
        keywords.emplace(name);
        for (const auto& component : profiler.components)
            keywords.emplace(component.keyword);
        for (const auto& special : profiler.special_reports)
            for (const auto& report : special.reports.keywords)
                keywords.emplace(report.keyword);
        if (profiler.reports == nullptr) continue;
        for (const auto& report : profiler.reports->keywords)
            keywords.emplace(report.keyword);
    }
    for (int channel = 1; channel < 15; ++channel)
        keywords.erase("ch" + std::to_string(channel));
    for (const char* heading : {"profiler", "components", "reports", "to", "or", "", "nf", "fi"})
        on_page.erase(heading);
    EXPECT_EQ(on_page, keywords);
}

TEST(pages, sample_tags_keys_and_signals_are_those_that_are_read) {
    const auto as_set = [](const std::vector<std::string_view>& texts) {
        return text_set(texts.begin(), texts.end());
    };
    EXPECT_EQ(keywords_on_page("nrx-samples.5", "TAGS"), as_set(nrx::event_tags()));
    EXPECT_EQ(keywords_on_page("nrx-samples.5", "SIGNALS"),
              as_set(nrx::make_event("accel")->signal_types()));
    const text_set keys = keywords_on_page("nrx-samples.5", "KEYS");
    EXPECT_EQ(keys.size(), nrx::sample_key_count);
    for (const std::string& key : keys)
        EXPECT_TRUE(nrx::find_sample_key(key)) << key;
}

}  // namespace tests
