// Whole lines: what stands in them, and when one is printed.
#include "nrxctl/decoders/record_text.h"

#include "nrxctl/decoders/decoder_registry.h"
#include "nrxctl/decoders/utf8.h"
#include "tests/decoders/event_record.h"
#include "tests/support/device_test.h"

namespace {

using namespace tests;

class event_line : public device_test {};

TEST_F(event_line, holds_names_body_identifiers_bytes_and_boot_time) {
    host.set_boot_time({1700000000, 42});
    EXPECT_EQ(
        decoded(record_of({0, 0, 0, 3}, {{16, 4, 7}, {24, 4, 500}, {36, 4, 0xffffffff}})),
        "{  'category':  'exec', 'component':'scheduler', 'event':'context-switch', "
        "'type':     'event', 'timestamp':      8123, 'sequence_num':        42, "
        "'arg1':         7, 'arg2':         0, 'arg3':       500, 'arg4':         0, "
        "'arg5':         0, 'arg6':4294967295, 'xarg1':         '7', 'xarg2':         '0', "
        "'xarg3':         '1f4', 'xarg4':         '0', 'xarg5':         '0', "
        "'xarg6':         'ffffffff', "
        "'type-id':3, 'category-id':0, 'component-id':0, 'event-id':0, "
        "'binary-data':[3,0,0,0,42,0,0,0,187,31,0,0,0,0,0,0,7,0,0,0,0,0,0,0,244,1,0,0,0,0,0,0,"
        "0,0,0,0,255,255,255,255,0,0,0,0,0,0,0,0], 'boot-timestamp':1700000000000042}");
}

TEST_F(event_line, ends_with_the_bytes_if_the_host_tells_no_time) {
    auto stop = record_of({200, 17, 99, 0}, {}, 0xff);
    for (std::size_t offset = 4; offset < 16; ++offset)
        stop.bytes[offset] = 0xff;
    EXPECT_EQ(decoded(stop),
              "{  'category':   '200', 'component':    '17', 'event':        '99', "
              "'type':      'stop', 'timestamp':18446744073709551615, 'sequence_num':4294967295, "
              "'type-id':0, 'category-id':200, 'component-id':17, 'event-id':99, "
              "'binary-data':[0,99,17,200,255,255,255,255,255,255,255,255,255,255,255,255,255,255,"
              "255,255,255,255,255,255,255,255,255,255,255,255,255,255,255,255,255,255,255,255,255,"
              "255,255,255,255,255,255,255,255,255]}");
}

TEST_F(event_line, numbers_of_every_length_are_right_aligned_and_never_cut) {
    const auto shows = [](const nrx::profile_record& record, const std::string& text) {
        EXPECT_NE(decoded(record).find(text), std::string::npos) << text;
    };
    const auto global_id = [&](std::uint64_t value, const std::string& digits) {
        shows(record_of({8, 0, 0, 11}, {{16, 8, value}}),
              "'global-id':" + std::string(10 - std::min<std::size_t>(10, digits.size()), ' ') +
                  digits + ",");
    };
    std::uint64_t value = 1;
    for (std::size_t zeros = 0; zeros < 20; ++zeros, value *= 10) {
        global_id(value, std::string("1").append(zeros, '0'));
        if (zeros > 0) global_id(value - 1, std::string(zeros, '9'));
    }
    for (std::uint32_t bits = 0; bits < 32; ++bits) {
        shows(record_of({8, 0, 0, 3}, {{16, 4, 1U << bits}}),
              std::string("'xarg1':         '") + "1248"[bits % 4] + std::string(bits / 4, '0') +
                  "',");
    }
}

TEST_F(event_line, no_record_makes_a_line_longer_than_its_bound) {
    host.set_boot_time({9223372036854, 775807});
    std::size_t longest = 0;
    for (int type = 0; type < 256; ++type) {
        for (std::uint8_t category = 0; category < 12; ++category) {
            auto record = record_of({category, 6, 16, static_cast<std::uint8_t>(type)}, {}, 0xff);
            std::fill_n(record.bytes.begin() + 4, 12, std::uint8_t{0xff});
            const auto line = decoded(record);
            EXPECT_TRUE(line.ends_with(":9223372036854775807}")) << line;
            longest = std::max(longest, line.size());
        }
    }
    EXPECT_LE(longest, nrx::longest_record_text);
    // Names 107, time stamp and number 61, the body of an event 288, identifiers 70, the rest 293.
    EXPECT_EQ(nrx::longest_record_text, 819U);
}

TEST_F(event_line, is_printed_unless_it_is_no_utf8) {
    const auto printed = [](std::string_view name) {
        const auto record = with_text(record_of({0, 4, 0, 9}), 32, name);
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

TEST(decoder_registry, has_a_decoder_for_every_category_but_seven_which_names_any_number) {
    for (std::uint32_t category = 0; category < 300; ++category) {
        const bool has_one = category <= 10 && category != 7;
        EXPECT_EQ(nrx::decoder_for_category(category) != nullptr, has_one) << category;
    }
    EXPECT_EQ(nrx::decoder_for_category(2)->component_name(70000).view(), "70000");
    EXPECT_EQ(nrx::decoder_for_category(0)->event_name(4294967295, 4294967295).view(),
              "4294967295");
}

TEST(utf8, takes_every_well_formed_sequence_and_nothing_else) {
    // The second bytes that may follow each first byte, and how many bytes come behind the second.
    struct lead {
        int first_from, first_to;
        int second_from, second_to;
        std::size_t further;
    };
    constexpr std::array leads{
        lead{0xc2, 0xdf, 0x80, 0xbf, 0}, lead{0xe0, 0xe0, 0xa0, 0xbf, 1},
        lead{0xe1, 0xec, 0x80, 0xbf, 1}, lead{0xed, 0xed, 0x80, 0x9f, 1},
        lead{0xee, 0xef, 0x80, 0xbf, 1}, lead{0xf0, 0xf0, 0x90, 0xbf, 2},
        lead{0xf1, 0xf3, 0x80, 0xbf, 2}, lead{0xf4, 0xf4, 0x80, 0x8f, 2},
    };
    for (int first = 0x80; first <= 0xff; ++first) {
        for (int second = 0; second <= 0xff; ++second) {
            for (std::size_t further = 0; further <= 2; ++further) {
                bool is_well_formed = false;
                for (const lead& one : leads) {
                    is_well_formed |= first >= one.first_from && first <= one.first_to &&
                                      second >= one.second_from && second <= one.second_to &&
                                      further == one.further;
                }
                std::string text{static_cast<char>(first), static_cast<char>(second)};
                text.append(further, '\xbf');
                EXPECT_EQ(nrx::is_utf8(text), is_well_formed) << first << " " << second;
            }
        }
    }
    EXPECT_TRUE(nrx::is_utf8(""));
    EXPECT_TRUE(nrx::is_utf8("\x7f plain"));
    EXPECT_TRUE(nrx::is_utf8("seventeen letters\xc3\xa9 and more"));
    for (const std::string_view text : {"\xc2", "\xe1\x80\x7f", "\xe1\x80\xc0", "\xf1\x80\x7f\x80",
                                        "\xf1\x80\xc0\x80", "\xf1\x80\x80\x7f", "\xf1\x80\x80\xc0",
                                        "a\xc3\xa9\x80", "seventeen letters\xc3 and more"}) {
        EXPECT_FALSE(nrx::is_utf8(text)) << text;
    }
}

}  // namespace
