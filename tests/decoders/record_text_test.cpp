#include <cstdlib>
#include <new>

#include "nrxctl/base/output.h"
#include "nrxctl/base/utf8.h"
#include "nrxctl/decoders/record_layout.h"
#include "platform/virtual/time_sync.h"
#include "tests/decoders/event_record.h"
#include "tests/support/device_test.h"

namespace {

using namespace tests;

std::size_t allocations = 0;

}  // namespace

// All other forms of the standard library call these. They are not inlined, so that no compiler
// takes them for a mismatch.
[[gnu::noinline]] void* operator new(std::size_t size) {
    ++allocations;
    if (void* memory = std::malloc(size)) return memory;
    throw std::bad_alloc();
}
[[gnu::noinline]] void operator delete(void* memory) noexcept {
    std::free(memory);
}
[[gnu::noinline]] void operator delete(void* memory, std::size_t /*size*/) noexcept {
    std::free(memory);
}

namespace {

using record_text = device_test;

TEST_F(record_text, holds_names_body_identifiers_bytes_and_boot_time) {
    host.set_boot_time({1700000000, 42});
    EXPECT_EQ(
        decoded(make_record({6, 7, 5, 3}, {{16, 4, 7}, {24, 4, 500}, {36, 4, 0xffffffff}})),
        "{  'category':  'uart', 'component':     '7', 'event':  'baseband', "
        "'type':     'event', 'timestamp':      8123, 'sequence_num':        42, "
        "'arg1':         7, 'arg2':         0, 'arg3':       500, 'arg4':         0, "
        "'arg5':         0, 'arg6':4294967295, 'xarg1':         '7', 'xarg2':         '0', "
        "'xarg3':         '1f4', 'xarg4':         '0', 'xarg5':         '0', "
        "'xarg6':         'ffffffff', "
        "'type-id':3, 'category-id':6, 'component-id':7, 'event-id':5, "
        "'binary-data':[3,5,7,6,42,0,0,0,187,31,0,0,0,0,0,0,7,0,0,0,0,0,0,0,244,1,0,0,0,0,0,0,"
        "0,0,0,0,255,255,255,255,0,0,0,0,0,0,0,0], 'boot-timestamp':1700000000000042}");
}

TEST_F(record_text, numbers_of_every_length_are_right_aligned_and_never_cut) {
    const auto expect_shown = [](std::uint8_t type, std::uint64_t value, const std::string& text) {
        const auto line = decoded(make_record({8, 0, 0, type}, {{16, 8, value}}));
        EXPECT_NE(line.find(text), std::string::npos) << text;
    };
    std::uint64_t power = 1;
    for (std::size_t zeros = 0; zeros < 20; ++zeros, power *= 10) {
        for (std::string digits : {std::to_string(power), std::to_string(power - 1)}) {
            const std::uint64_t value = std::stoull(digits);
            digits.insert(0, 10 - std::min<std::size_t>(10, digits.size()), ' ');
            expect_shown(11, value, "'global-id':" + digits + ",");
        }
    }
    for (std::uint32_t bit = 0; bit < 32; ++bit) {
        expect_shown(
            3, 1U << bit,
            std::string("'xarg1':         '") + "1248"[bit % 4] + std::string(bit / 4, '0') + "',");
    }
}

TEST_F(record_text, is_never_longer_than_its_bound) {
    host.set_boot_time({9223372036854, 775807});
    for (int type = 0; type < 256; ++type) {
        for (std::uint8_t category = 0; category < 12; ++category) {
            auto record = make_record({category, 6, 16, static_cast<std::uint8_t>(type)}, {}, 0xff);
            std::fill_n(record.bytes.begin() + 4, 12, std::uint8_t{0xff});
            const auto line = decoded(record);
            EXPECT_NE(line.find("'timestamp':18446744073709551615, 'sequence_num':4294967295,"),
                      std::string::npos);
            EXPECT_TRUE(line.ends_with("255,255], 'boot-timestamp':9223372036854775807}")) << line;
            EXPECT_LE(line.size(), nrx::max_record_text);
        }
    }
    // Names 107, timestamp and number 61, the body of an event 288, identifiers 70, the rest 293.
    EXPECT_EQ(nrx::max_record_text, 819U);
}

// Looks at each line without storing it.
class inspecting_sink final : public nrx::line_sink {
public:
    bool write(std::string_view text) override {
        if (text.find("'calendar-time'") != std::string_view::npos) ++lines_with_time;
        return true;
    }

    std::size_t lines_with_time = 0;
};

TEST(allocation, a_record_after_the_first_allocates_nothing) {
    machine host;  // keeps no log
    const platform::simulated::installed_machine installed(host);
    add_time_sync(host, [] { return platform::simulated::sync_point{1, 2}; });
    host.set_boot_time({1, 2});
    std::vector<nrx::profile_record> records;
    for (int id = 0; id < 256; ++id) {
        const auto byte = static_cast<std::uint8_t>(id);
        records.push_back(make_record({byte, byte, 0, 3}, {}, 'x'));
        records.push_back(make_record({4, 0, 0, byte}, {}, 0xff));
        records.back().bytes[13] = byte;
    }
    inspecting_sink sink;
    const nrx::scoped_sink installed_sink(nrx::standard_stream::output, sink);
    nrx::print_profile_record(records[0]);
    const std::size_t before = allocations;
    for (const nrx::profile_record& record : records)
        nrx::print_profile_record(record);
    EXPECT_EQ(allocations, before);
    EXPECT_GT(before, 0U);
    EXPECT_GT(sink.lines_with_time, records.size() / 2);
}

TEST(event_text, text_beyond_its_capacity_stops_the_process) {
    const auto write_letter = [](char* target) { return std::fill_n(target, 1, 'x'); };
    nrx::event_text line;
    line.append(1024, write_letter);
    line.append(1023, write_letter);
    EXPECT_EQ(line.view(), "xx");
    EXPECT_DEATH(line.append(1023, write_letter),
                 std::string(source_file::event_text) +
                     ":[0-9]+: append: Assertion `max_size <= capacity - size_' failed\\.\n");
}

TEST_F(record_text, is_printed_only_if_it_is_utf8) {
    const auto printed = [](std::string_view name) {
        const auto record = with_text(make_record({0, 4, 0, 9}), 32, name);
        std::string text = capture([&] { nrx::print_profile_record(record); }).out;
        nrx::event_text line;
        const auto formatted = nrx::format_profile_record(record, line);
        EXPECT_EQ(text, formatted ? decoded(record) + "\n" : "");
        return text;
    };
    EXPECT_NE(printed("a'b\"\n\x01\x7f").find("'function': 'a'b\"\n\x01\x7f',"), std::string::npos);
    EXPECT_NE(printed("gr\xc3\xb6\xc3\x9f").find("'function':  'gr\xc3\xb6\xc3\x9f',"),
              std::string::npos);
    for (const char* name : {"gr\xf6\xdf", "sixteen letters\xc3", "\xff"})
        EXPECT_EQ(printed(name), "");
}

std::string dumped(std::string_view label, const std::vector<std::uint8_t>& bytes, int spaced) {
    return capture([&] { nrx::nrx_profile_hexdump(label, bytes, spaced); }).out;
}

TEST(profile_hexdump, a_space_follows_each_byte_only_if_spaced_is_1) {
    EXPECT_EQ(dumped("x: ", {0x00, 0x9f, 0xff}, 1), "x: 00 9f ff \n");
    EXPECT_EQ(dumped("x: ", {0x00, 0x9f, 0xff}, 0), "x: 009fff\n");
    EXPECT_EQ(dumped("x: ", {0x12}, 2), "x: 12\n");
    EXPECT_EQ(dumped("x: ", {0x12}, -1), "x: 12\n");
    EXPECT_EQ(dumped("", {}, 1), "\n");
}

TEST(profile_hexdump, a_line_too_long_stops_the_process) {
    EXPECT_EQ(dumped("ab", std::vector<std::uint8_t>(84), 1).size(), 2U + 84 * 3 + 1);
    EXPECT_EQ(dumped(std::string(254, 'l'), {}, 0).size(), 255U);
    const std::string report =
        std::string(source_file::record_text) +
        ":[0-9]+: nrx_profile_hexdump: Assertion "
        "`\\(strlen\\(label\\) \\+ 3\\*bufLen \\+ 1\\) < sizeof\\(line\\)' failed\\.";
    EXPECT_DEATH(nrx::nrx_profile_hexdump("abc", std::vector<std::uint8_t>(84), 1), report);
    EXPECT_DEATH(nrx::nrx_profile_hexdump(std::string(255, 'l'), {}, 0), report);
}

}  // namespace
