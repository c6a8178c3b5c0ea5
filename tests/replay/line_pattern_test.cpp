// The pattern of sample lines: which lines match it, and that they are split as any line is.
#include "nrxctl/replay/line_pattern.h"

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "nrxctl/replay/sample_line.h"

namespace {

using nrx::line_pattern;
using nrx::sample_key;

constexpr const char* learned = "accel,x=0x10,k=v,sampleid=1,temperature=2880";

// Enough behind a line that it is not left for being near to the end.
const std::string behind = "\n" + std::string(32, 'b');

line_pattern pattern_of(std::string_view line) {
    line_pattern pattern;
    pattern.learn(line);
    return pattern;
}

// In memory of its own size: nothing beyond may be read.
std::size_t match(line_pattern& pattern, const std::string& text) {
    static std::unique_ptr<char[]> copy;
    copy = std::make_unique<char[]>(text.size());
    std::copy(text.begin(), text.end(), copy.get());
    return pattern.match({copy.get(), text.size()});
}

// The values by their keys' numbers.
std::vector<std::string> dumped(const nrx::sample_values& values) {
    std::vector<std::string> texts;
    for (std::size_t i = 0; i < nrx::sample_key_count; ++i)
        texts.emplace_back(values[static_cast<sample_key>(i)]);
    return texts;
}

// Matches, and splits as the general splitter does.
void expect_match(line_pattern& pattern, const std::string& line) {
    ASSERT_EQ(match(pattern, line + behind), line.size() + 1) << line;
    nrx::sample_line split;
    ASSERT_TRUE(nrx::split_sample_line(line, split)) << line;
    EXPECT_EQ(dumped(pattern.values()), dumped(split.values)) << line;
}

TEST(line_pattern, nothing_matches_before_a_line_with_fields_was_learned) {
    line_pattern pattern;
    for (const std::string line : {"", "accel", "accel,x=1", ",x=1", ",", "accel,"}) {
        EXPECT_EQ(match(pattern, line + behind), 0U) << line;
        auto learner = pattern_of(line);
        if (line.find('=') == std::string::npos) {
            EXPECT_EQ(match(learner, line + behind), 0U) << line;
        }
    }
}

TEST(line_pattern, lines_with_the_same_tag_and_keys_match_whatever_their_values_are) {
    auto pattern = pattern_of(learned);
    for (const std::string& value : std::vector<std::string>{
             "1", "12", "-1", "+", "junk", " ", "\r", "\xff\x80", "0x00000000", "123456789012345",
             "1234567890123456", "12345678901234567", std::string(500, 'v'), "1"}) {
        expect_match(pattern, learned);
        expect_match(pattern,
                     "accel,x=" + value + ",k=" + value + ",sampleid=" + value + ",temperature=7");
        expect_match(pattern, "accel,x=1,k=2,sampleid=3,temperature=" + value);
        expect_match(pattern, "accel,x=1,k=2,sampleid=3,temperature=" + value);
    }
}

TEST(line_pattern, another_line_does_not_match_whatever_was_guessed) {
    for (const std::string line : {
             "accel,k=v,x=0x10,sampleid=1,temperature=2880",      // another order
             "accel,x=0x10,k=v,sampleid=1",                       // a key less, here and there
             "accel,k=v,sampleid=1,temperature=2880",             //
             "accel,x=0x10,k=v,sampleid=1,temperature=2880,y=1",  // one more, likewise
             "accel,y=0x10,x=0x10,k=v,sampleid=1,temperature=2880",
             "accel,x=0x10,x=0x10,k=v,sampleid=1,temperature=2880",
             "accel,x=0x10,k=v,sampleid=1,temperature=2880,",
             "accel,x=0x10,k=v,sampleid=1,,temperature=2880",
             "accel,x=0x10,k=,sampleid=1,temperature=2880",  // no value
             "accel,x=0x10,k=v,sampleid=1,temperature=",
             "accel,x=0x10,k=v=,sampleid=1,temperature=2880",  // a second equals sign
             "accel,x=0x10,k==v,sampleid=1,temperature=2880",
             "accel,x=0x1=,k=v,sampleid=1,temperature=2880",
             "accel,x=0x10,k=v,sampleid=1,temperature=288=",
             "accel,x=0x10,k=v,sampleid=1,temperaturE=2880",  // nearly the same
             "accel,x=0x10,K=v,sampleid=1,temperature=2880",
             "accem,x=0x10,k=v,sampleid=1,temperature=2880",
             "accelx,x=0x10,k=v,sampleid=1,temperature=2880",
             "\naccel,x=0x10,k=v,sampleid=1,temperature=2880",
             "accel,x=0x10,k=v,\nsampleid=1,temperature=2880",  // ends early
             "accel,x=0x10\nk=v,sampleid=1,temperature=2880",
             "",
         }) {
        auto pattern = pattern_of(learned);
        EXPECT_EQ(match(pattern, line + behind), 0U) << line;
        expect_match(pattern, learned);
        // At once again, too: what was seen of it is no guess.
        EXPECT_EQ(match(pattern, line + behind), 0U) << line;
        EXPECT_EQ(match(pattern, line + behind), 0U) << line;
        expect_match(pattern, learned);
    }
}

TEST(line_pattern, repeated_empty_and_long_keys) {
    auto repeated = pattern_of("gyro,x=1,y=2,x=3");
    expect_match(repeated, "gyro,x=4,y=5,x=6");
    auto empty = pattern_of("gyro,=1,x=2");
    expect_match(empty, "gyro,=3,x=4");
    EXPECT_EQ(match(empty, "gyro,k=3,x=4" + behind), 0U);
    for (const std::size_t length : {15U, 16U}) {
        const std::string name(length, 'n');
        for (const std::string& line : {"accel," + name + "=1", name + ",x=1"}) {
            auto pattern = pattern_of(line);
            EXPECT_EQ(match(pattern, line + behind), length == 15 ? line.size() + 1 : 0) << line;
        }
    }
}

TEST(line_pattern, the_last_line_learned_counts_alone) {
    auto pattern = pattern_of("gyro,x=1,y=2");
    expect_match(pattern, "gyro,x=3,y=4");
    pattern.learn("accel,x=5");
    EXPECT_EQ(match(pattern, "gyro,x=3,y=4" + behind), 0U);
    expect_match(pattern, "accel,x=6");
    // A comma at the very end is no field, and not in the pattern.
    pattern.learn("accel,y=7,");
    expect_match(pattern, "accel,y=8");
    EXPECT_EQ(match(pattern, "accel,y=8," + behind), 0U);
}

TEST(line_pattern, a_text_that_ends_within_the_line_or_right_behind_it_does_not_match) {
    auto pattern = pattern_of(learned);
    const std::string line = std::string(learned) + "\n";
    for (int guesses = 0; guesses < 2; ++guesses) {
        for (std::size_t size = 0; size <= line.size(); ++size)
            EXPECT_EQ(match(pattern, line.substr(0, size)), 0U) << size;
        expect_match(pattern, learned);
    }
}

}  // namespace
