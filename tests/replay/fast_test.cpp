// The fast path of reading sample files, against plain code that does the same.
#include <algorithm>
#include <array>
#include <cstdint>
#include <cstring>
#include <malloc.h>
#include <random>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "nrxctl/replay/fast/event_memory.h"
#include "nrxctl/replay/fast/fast_number.h"
#include "nrxctl/replay/fast/line_pattern.h"
#include "tests/support/rows.h"

namespace tests {

namespace {

using nrx::event_memory::allocate;
using nrx::event_memory::deallocate;

// A copy in an allocation of its own size: a sanitizer detects a read outside.
using exact_copy = std::vector<char>;

std::string_view view(const exact_copy& bytes) {
    return {bytes.data(), bytes.size()};
}

using chunk = std::array<char, nrx::simd16::size>;

template <class Simd>
void expect_plain_results(const chunk& a, const chunk& b) {
    std::uint32_t equal = 0;
    std::uint32_t matches = 0;
    for (std::size_t i = 0; i < a.size(); ++i) {
        equal |= std::uint32_t{a[i] == b[i]} << i;
        matches |= std::uint32_t{a[i] == b[0] || a[i] == b[7] || a[i] == b[15]} << i;
    }
    EXPECT_EQ(Simd(a.data()).equal(Simd(b.data())), equal);
    EXPECT_EQ(Simd(a.data()).find(b[0], b[7], b[15]), matches);
}

TEST(simd16, both_implementations_match_a_plain_search) {
    std::mt19937 random(1);
    for (int round = 0; round < 2000 && !HasFailure(); ++round) {
        // Few different values, so that there are matches.
        std::string values("\x00\x01\x7f\x80\xfe\xff", 6);
        if (round % 2 == 1) values = {static_cast<char>(random()), static_cast<char>(random())};
        const auto random_value = [&] { return values[random() % values.size()]; };
        chunk a;
        chunk b;
        std::generate(a.begin(), a.end(), random_value);
        std::generate(b.begin(), b.end(), random_value);
        expect_plain_results<nrx::simd16>(a, b);
        expect_plain_results<nrx::portable_simd16>(a, b);
    }
}

std::int64_t read_plainly(std::string_view text) {
    const nrx::number_parts parts = nrx::split_number(text);
    if (parts.digits.size() > 15) return nrx::not_parsed;
    const auto magnitude = nrx::read_digits(parts.digits, parts.hexadecimal ? 16 : 10);
    if (!magnitude) return nrx::not_parsed;
    return parts.negative ? -*magnitude : *magnitude;
}

TEST(fast_number, any_byte_at_any_position_gives_the_plain_result) {
    for (const std::string prefix : {"", "-", "+", "0x", "-0x", "+0x"}) {
        const std::string digits = prefix.ends_with('x') ? "1a2Bc3D4e5F67890" : "1234567890123456";
        EXPECT_EQ(nrx::read_fast_number(prefix), nrx::not_parsed);
        for (std::size_t length = 1; length <= 16; ++length) {
            std::string text = prefix + digits.substr(16 - length);
            for (char& byte : text) {
                const char original = byte;
                for (int value = 0; value < 256; ++value) {
                    byte = static_cast<char>(value);
                    ASSERT_EQ(nrx::read_fast_number(view({text.begin(), text.end()})),
                              read_plainly(text))
                        << text;
                }
                byte = original;
            }
        }
    }
    EXPECT_EQ(nrx::parse_fast_number("-0x123456789abcdef0", "bad"), -0x123456789abcdef0);
}

constexpr std::size_t event_size = 52;
constexpr std::size_t aligned_size = 56;
constexpr std::size_t event_count = 100'000;

// Bytes allocated by the process, approximately; 0 under a sanitizer.
std::size_t bytes_in_use() {
    const auto info = ::mallinfo2();
    return info.uordblks + info.hblkhd;
}

// Allocates events side by side, each filled with a byte of its own.
std::vector<std::uint8_t*> allocate_events() {
    std::vector<std::uint8_t*> events;
    std::size_t neighbours = 0;
    for (std::size_t i = 0; i < event_count; ++i) {
        void* event = std::memset(allocate(event_size), static_cast<int>(i % 251), event_size);
        EXPECT_EQ(reinterpret_cast<std::uintptr_t>(event) % alignof(std::uint64_t), 0U);
        events.push_back(static_cast<std::uint8_t*>(event));
        neighbours += i > 0 && events[i] == events[i - 1] + aligned_size ? 1U : 0U;
    }
    EXPECT_GE(neighbours, event_count - 1 - event_count * aligned_size / 2'000'000);
    return events;
}

TEST(event_memory, events_do_not_overlap_and_are_reused_or_freed) {
    deallocate(allocate(event_size));
    const std::size_t before = bytes_in_use();
    for (int round = 0; round < 4; ++round) {
        auto events = allocate_events();
        for (std::size_t i = 0; i < event_count; ++i)
            ASSERT_EQ(std::count(events[i], events[i] + event_size, i % 251), event_size) << i;
        if (round % 2 == 1) std::reverse(events.begin(), events.end());
        if (round == 2) std::rotate(events.begin(), events.begin() + event_count / 3, events.end());
        std::for_each(events.begin(), events.end(), deallocate);
    }
    EXPECT_LT(bytes_in_use(), before + 1'000'000);
}

TEST(event_memory, sizes_are_rounded_up_to_multiples_of_eight) {
    std::vector<std::byte*> events;
    for (const std::size_t size : {52U, 49U, 56U, 1U})
        events.push_back(static_cast<std::byte*>(allocate(size)));
    for (std::size_t i = 1; i < events.size(); ++i)
        EXPECT_EQ(events[i], events[i - 1] + aligned_size);
    std::for_each(events.begin(), events.end(), deallocate);
}

TEST(length_hint, matches_values_of_the_last_length_up_to_15) {
    nrx::length_hint hint;
    for (std::size_t length = 0; length <= 20; ++length) {
        for (std::size_t value_length = 0; value_length <= 20; ++value_length) {
            const std::string text = std::string(value_length, 'v') + "," + std::string(15, 'v');
            EXPECT_EQ(hint.matches(text.c_str()),
                      length > 0 && length < 16 && value_length == length)
                << length << ' ' << value_length;
        }
        hint.assign(length + 1);
    }
    hint.assign(3);
    EXPECT_FALSE(hint.matches(",bc,vvvvvvvvvvvv"));
}

// Enough text after a line that its pattern can be tried.
const std::string padding = "\n" + std::string(32, 'b');

std::size_t match(nrx::line_pattern& pattern, const std::string& text) {
    return pattern.match(view({text.begin(), text.end()}));
}

// The line matches, and has the values that the general splitter finds.
void expect_match(nrx::line_pattern& pattern, const std::string& line) {
    const std::string padded = line + padding;
    const exact_copy text(padded.begin(), padded.end());
    ASSERT_EQ(pattern.match(view(text)), line.size() + 1) << line;
    nrx::sample_line split;
    ASSERT_TRUE(nrx::split_sample_line(line, split)) << line;
    for (std::size_t i = 0; i < nrx::sample_key_count; ++i) {
        const auto key = static_cast<nrx::sample_key>(i);
        EXPECT_EQ(pattern.values()[key], split.values[key]) << line << ' ' << i;
    }
}

TEST(line_pattern, lines_with_the_same_tag_and_keys_match) {
    const std::string line = "accel,x=0x10,k=v,sampleid=1,temperature=2880";
    nrx::line_pattern pattern;
    pattern.learn(line);
    for (const std::string& value : std::vector<std::string>{
             "1", "12", "-1", "+", "junk", " ", "\r", "\xff\x80", "0x00000000", "123456789012345",
             "1234567890123456", "12345678901234567", std::string(500, 'v'), "1"}) {
        expect_match(pattern, line);
        expect_match(pattern,
                     "accel,x=" + value + ",k=" + value + ",sampleid=" + value + ",temperature=7");
        for (int hinted = 0; hinted < 2; ++hinted)
            expect_match(pattern, "accel,x=1,k=2,sampleid=3,temperature=" + value);
    }
    // A text that ends within the line or right after it.
    for (std::size_t size = 0; size <= line.size() + 1; ++size)
        EXPECT_EQ(match(pattern, (line + "\n").substr(0, size)), 0U) << size;
    expect_match(pattern, line);
    // 32 bytes must follow the start of the last field.
    const std::size_t needed = line.rfind(',') + 1 + 32;
    EXPECT_EQ(match(pattern, (line + padding).substr(0, needed)), line.size() + 1);
    EXPECT_EQ(match(pattern, (line + padding).substr(0, needed - 1)), 0U);
}

TEST(line_pattern, only_the_last_learned_line_counts) {
    const std::string name15(15, 'n');
    const std::string name16(16, 'n');
    nrx::line_pattern pattern;
    for (const auto& [learned, line, matches] : rows<std::string, std::string, bool>{
             {"", "accel,x=1", false},
             {"gyro,x=1,y=2,x=3", "gyro,x=4,y=5,x=6", true},
             {"accel", "gyro,x=4,y=5,x=6", false},
             {"gyro,=1,x=2", "gyro,=3,x=4", true},
             {"gyro,=1,x=2", "gyro,k=3,x=4", false},
             {"accel,", "gyro,=3,x=4", false},
             {"accel,x=1,k=v", "accel,x=1,K=v", false},
             {"accel,x=1,k=v", "accel,x=,k=v", false},
             {"accel,x=1,k=v", "accel,x=1,k=", false},
             // A trailing comma does not add a field.
             {"accel,y=7,", "accel,y=8", true},
             {"accel,y=7,", "accel,y=8,", false},
             {",", ",", false},
             {name15 + ",x=1", name15 + ",x=1", true},
             {name16 + ",x=1", name16 + ",x=1", false},
             {"accel," + name15 + "=1", "accel," + name15 + "=1", true},
             {"accel," + name16 + "=1", "accel," + name16 + "=1", false}}) {
        pattern.learn(learned);
        if (matches) {
            expect_match(pattern, line);
        } else {
            // The first attempt leaves no hint.
            for (int attempt = 0; attempt < 2; ++attempt)
                EXPECT_EQ(match(pattern, line + padding), 0U) << line;
        }
    }
}

}  // namespace

}  // namespace tests
