// Whole lines: what stands in them, and when one is printed.
#include "nrxctl/decoders/record_text.h"

#include "nrxctl/decoders/decoder_registry.h"
#include "nrxctl/decoders/profile_hexdump.h"
#include "nrxctl/decoders/utf8.h"
#include "tests/decoders/event_record.h"
#include "tests/support/device_test.h"

namespace {

using tests::capture;
using tests::decoded;
using tests::record_of;
using tests::with_text;

class event_line : public tests::device_test {};

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
    std::uint64_t value = 1;
    for (std::size_t digits = 1; digits <= 20; ++digits, value *= 10) {
        const std::string blanks(digits < 10 ? 10 - digits : 0, ' ');
        const std::string zeros(digits - 1, '0');
        const std::string nines(digits - 1, '9');
        const auto at_least = record_of({8, 0, 0, 11}, {{16, 8, value}});
        EXPECT_TRUE(decoded(at_least).find("'global-id':" + blanks + "1" + zeros + ",") !=
                    std::string::npos)
            << value;
        if (digits == 1) continue;
        const auto below = record_of({8, 0, 0, 11}, {{16, 8, value - 1}});
        EXPECT_TRUE(
            decoded(below).find("'global-id':" + std::string(digits < 12 ? 11 - digits : 0, ' ') +
                                nines + ",") != std::string::npos)
            << value - 1;
    }
    for (std::uint32_t bits = 0; bits < 32; ++bits) {
        std::string hex = "'xarg1':         '1";
        hex[hex.size() - 1] = "1248"[bits % 4];
        hex.append(bits / 4, '0').append("',");
        EXPECT_TRUE(decoded(record_of({8, 0, 0, 3}, {{16, 4, 1U << bits}})).find(hex) !=
                    std::string::npos)
            << hex;
    }
}

TEST_F(event_line, no_record_makes_a_line_longer_than_its_bound) {
    host.set_boot_time({9223372036854, 775807});
    std::size_t longest = 0;
    for (int type = 0; type < 256; ++type) {
        for (std::uint8_t category = 0; category < 12; ++category) {
            const auto line =
                decoded(record_of({category, 0, 2, static_cast<std::uint8_t>(type)}, {}, 0xff));
            EXPECT_TRUE(line.ends_with(":9223372036854775807}")) << line;
            longest = std::max(longest, line.size());
        }
    }
    EXPECT_LE(longest, nrx::longest_record_text);
}

TEST_F(event_line, is_printed_in_one_piece_unless_it_is_no_utf8) {
    const auto record = record_of({7, 1, 2, 0});
    EXPECT_EQ(capture([&] { nrx::print_profile_record(record); }).out, decoded(record) + "\n");
    const auto named = [](std::string_view name) {
        return with_text(record_of({0, 4, 0, 9}), 32, name);
    };
    const auto printed = [&](std::string_view name) {
        return capture([&] { nrx::print_profile_record(named(name)); }).out;
    };
    EXPECT_NE(printed("a'b\"\n\x01\x7f").find("'function': 'a'b\"\n\x01\x7f',"), std::string::npos);
    EXPECT_NE(printed("gr\xc3\xb6\xc3\x9f"
                      "e")
                  .find("'function': 'gr\xc3\xb6\xc3\x9f"
                        "e',"),
              std::string::npos);
    EXPECT_EQ(printed("gr\xf6\xdf"
                      "e"),
              "");
    EXPECT_EQ(printed("sixteen letters\xc3"), "");
    nrx::event_text line;
    EXPECT_FALSE(nrx::format_profile_record(named("\xff"), line));
    EXPECT_EQ(nrx::format_profile_record(named("x"), line), decoded(named("x")));
}

TEST(record_printers, text_or_dump_is_chosen_by_the_flag) {
    EXPECT_EQ(nrx::select_record_printer(true), nrx::print_profile_record);
    EXPECT_EQ(nrx::select_record_printer(false), nrx::dump_profile_record);
}

TEST(decoder_registry, has_a_decoder_for_every_category_but_seven) {
    for (std::uint32_t category = 0; category < 300; ++category) {
        const bool has_one = category <= 10 && category != 7;
        EXPECT_EQ(nrx::decoder_for_category(category) != nullptr, has_one) << category;
    }
    EXPECT_EQ(nrx::decoder_for_category(2)->component_name(4).view(), "gostin");
    EXPECT_EQ(nrx::decoder_for_category(2)->component_name(70000).view(), "70000");
    EXPECT_EQ(nrx::decoder_for_category(2)->category_name(2).view(), "sensor");
    EXPECT_EQ(nrx::decoder_for_category(0)->event_name(4294967295, 4294967295).view(),
              "4294967295");
}

TEST(utf8, takes_every_well_formed_sequence_and_nothing_else) {
    for (const std::string_view text :
         {"", "plain", "\x7f", "\xc2\x80", "\xdf\xbf", "\xe0\xa0\x80", "\xe1\x80\x80",
          "\xec\xbf\xbf", "\xed\x9f\xbf", "\xee\x80\x80", "\xef\xbf\xbf", "\xf0\x90\x80\x80",
          "\xf1\x80\x80\x80", "\xf3\xbf\xbf\xbf", "\xf4\x8f\xbf\xbf",
          "seventeen letters\xc3\xa9 and more"}) {
        EXPECT_TRUE(nrx::is_utf8(text)) << text;
    }
    for (const std::string_view text : {"\x80",
                                        "\xbf",
                                        "\xc0\x80",
                                        "\xc1\xbf",
                                        "\xc2",
                                        "\xc2\x7f",
                                        "\xc2\xc0",
                                        "\xe0\x9f\xbf",
                                        "\xe1\x80",
                                        "\xe1\x80\x7f",
                                        "\xe1\x80\xc0",
                                        "\xed\xa0\x80",
                                        "\xf0\x8f\xbf\xbf",
                                        "\xf1\x80\x80",
                                        "\xf1\x80\x80\x7f",
                                        "\xf4\x90\x80\x80",
                                        "\xf5\x80\x80\x80",
                                        "\xff",
                                        "a\xc3\xa9\x80",
                                        "seventeen letters\xc3 and more"}) {
        EXPECT_FALSE(nrx::is_utf8(text)) << text;
    }
}

}  // namespace
