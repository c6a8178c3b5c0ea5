// The body of a record, by its type and, for some records, by its category.
#include <array>

#include "tests/decoders/event_record.h"
#include "tests/support/device_test.h"

namespace {

using tests::decoded_body;
using tests::record_ids;
using tests::record_of;
using tests::with_text;

class record_body : public tests::device_test {};

TEST_F(record_body, of_long_data_lists_as_many_bytes_as_it_says_and_there_are) {
    const auto long_data = [](std::uint64_t length) {
        return decoded_body(record_of(
            {2, 0, 1, 1},
            {{16, 2, 65535}, {18, 2, 100}, {20, 2, length}, {22, 2, 24}, {24, 8, 0xff000302010a}}));
    };
    EXPECT_EQ(long_data(5),
              " 'subtype':     65535, 'packet-size':       100, 'data-length':         5, "
              "'data-offset':        24, 'raw-data':[10,1,2,3,0],");
    EXPECT_EQ(long_data(2),
              " 'subtype':     65535, 'packet-size':       100, 'data-length':         2, "
              "'data-offset':        24, 'raw-data':    [10,1],");
    EXPECT_EQ(long_data(0),
              " 'subtype':     65535, 'packet-size':       100, 'data-length':         0, "
              "'data-offset':        24, 'raw-data':        [],");
    const std::string all = "'raw-data':[10,1,2,3,0,255,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0],";
    for (const std::uint64_t length : {24U, 25U, 200U, 1000U, 65535U})
        EXPECT_TRUE(long_data(length).ends_with(all)) << length;
    EXPECT_TRUE(long_data(23).ends_with(",255,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0],"));
}

TEST_F(record_body, of_short_data_has_a_fixed_size) {
    EXPECT_EQ(decoded_body(record_of({0, 3, 2, 2}, {{16, 2, 7}, {18, 8, 0x0807060504030201}})),
              " 'subtype':         7, 'packet-size':        30, 'data-length':        30, "
              "'data-offset':         0, "
              "'raw-data':[1,2,3,4,5,6,7,8,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0],");
}

TEST_F(record_body, of_an_event_shows_its_arguments_in_decimal_and_hexadecimal) {
    EXPECT_EQ(decoded_body(record_of({11, 0, 0, 3}, {{16, 4, 255},
                                                     {20, 4, 2},
                                                     {24, 4, 4294967295},
                                                     {28, 4, 4096},
                                                     {32, 4, 0},
                                                     {36, 4, 100000000}})),
              " 'arg1':       255, 'arg2':         2, 'arg3':4294967295, 'arg4':      4096, "
              "'arg5':         0, 'arg6': 100000000, 'xarg1':         'ff', 'xarg2':         '2', "
              "'xarg3':         'ffffffff', 'xarg4':         '1000', 'xarg5':         '0', "
              "'xarg6':         '5f5e100',");
}

TEST_F(record_body, of_a_trigger_shows_its_thread_twice) {
    EXPECT_EQ(decoded_body(record_of({5, 0, 0, 4}, {{20, 4, 51}}, 0xff)),
              " 'trigger':1, 'thread-id':        51, 'arg':        51,");
}

TEST_F(record_body, of_a_function) {
    EXPECT_EQ(decoded_body(record_of({0, 1, 0, 5}, {{16, 4, 1},
                                                    {20, 4, 22},
                                                    {24, 4, 333},
                                                    {28, 4, 4444},
                                                    {32, 4, 55555},
                                                    {36, 4, 666666}})),
              " 'function-id':         1, 'extra-id':        22, 'thread-id':       333, "
              "'duration':      4444, 'depth':     55555, 'thread_duration':    666666,");
}

TEST_F(record_body, of_sensor_information) {
    const auto record = record_of({2, 1, 9, 8},
                                  {{16, 4, 10000},
                                   {20, 4, 20000},
                                   {24, 4, 3},
                                   {28, 4, 4},
                                   {32, 1, 1},
                                   {33, 1, 'A'},
                                   {34, 1, 255}},
                                  'z');
    const std::string numbers =
        ", 'report-interval':     10000, 'batch-interval':     20000, 'threshold':         3, "
        "'time-limit':         4, 'connected':         1, 'decimation':        65, "
        "'gyroPowerMode':       255,";
    EXPECT_EQ(decoded_body(record), " 'name':  'zzzzzzzzzzzz'" + numbers);
    EXPECT_EQ(decoded_body(with_text(record, 35, {"gyro\0", 5})),
              " 'name':          'gyro'" + numbers);
    EXPECT_EQ(decoded_body(with_text(record, 35, std::string(1, '\0'))),
              " 'name':              ''" + numbers);
}

TEST_F(record_body, of_an_external_function) {
    const auto record =
        record_of({0, 4, 0, 9}, {{16, 4, 1}, {20, 4, 2}, {24, 4, 3}, {28, 4, 4}}, 'f');
    const std::string numbers =
        ", 'arg':         4, 'task':         1, 'thread':         2, 'duration':         3,";
    EXPECT_EQ(decoded_body(record), " 'function':'ffffffffffffffff'" + numbers);
    EXPECT_EQ(decoded_body(with_text(record, 32, {"run\0", 4})),
              " 'function':     'run'" + numbers);
}

TEST_F(record_body, of_an_annotation_shows_its_entry_as_number_and_text) {
    EXPECT_EQ(
        decoded_body(record_of(
            {1, 1, 0, 11}, {{16, 8, 12345678901}, {24, 8, 0x68676665}, {32, 4, 8}, {36, 4, 9}})),
        " 'global-id':12345678901, 'entry-id':1751606885, 'entry':    'efgh', "
        "'arg1':         8, 'arg2':         9,");
    EXPECT_EQ(decoded_body(record_of({1, 1, 0, 11}, {{24, 8, 0x6867666564636261}})),
              " 'global-id':         0, 'entry-id':7523094288207667809, 'entry':'abcdefgh', "
              "'arg1':         0, 'arg2':         0,");
}

TEST_F(record_body, of_decimation_information) {
    EXPECT_EQ(decoded_body(with_text(
                  record_of({2, 0, 9, 12},
                            {{16, 8, 18446744073709551615U}, {24, 4, 1}, {28, 4, 2}, {32, 4, 3}}),
                  36, "accel-filter")),
              " 'name':  'accel-filter', 'sample-interval':         1, 'report-interval':         "
              "2, 'batch-interval':         3, 'next-dispatch':18446744073709551615,");
}

TEST_F(record_body, is_empty_for_every_other_type) {
    for (int type = 0; type < 256; ++type) {
        if (type < 13 && type != 0 && type != 6 && type != 7 && type != 10) continue;
        const auto record = record_of({0, 0, 0, static_cast<std::uint8_t>(type)}, {}, 'x');
        EXPECT_EQ(decoded_body(record), "") << type;
    }
}

TEST_F(record_body, of_talvor_samples_shows_fractions_of_16_or_12_bits) {
    const auto samples = [](std::uint8_t event, std::int32_t x, std::int32_t y, std::int32_t z) {
        const auto word = [](std::int32_t value) { return static_cast<std::uint32_t>(value); };
        return decoded_body(record_of({4, 0, event, 3}, {{16, 4, word(x)},
                                                         {20, 4, word(y)},
                                                         {24, 4, word(z)},
                                                         {28, 4, 4},
                                                         {32, 4, 5},
                                                         {36, 4, 6}}));
    };
    EXPECT_EQ(samples(0, -65536, 32768, 1),
              " 'arg1':4294901760, 'arg2':     32768, 'arg3':         1, 'arg4':         4, "
              "'arg5':         5, 'arg6':         6, 'x':        -1, 'y':       0.5, "
              "'z':1.52588e-05,");
    EXPECT_EQ(samples(1, 4096, -4096, 1),
              " 'arg1':      4096, 'arg2':4294963200, 'arg3':         1, 'arg4':         4, "
              "'arg5':         5, 'arg6':         6, 'x':         1, 'y':        -1, "
              "'z':0.000244141,");
    EXPECT_TRUE(samples(0, 0, INT32_MIN, INT32_MAX)
                    .ends_with(" 'x':         0, 'y':    -32768, 'z':     32768,"));
    EXPECT_TRUE(samples(1, -1, INT32_MIN, 5000000)
                    .ends_with(" 'x':-0.000244141, 'y':   -524288, 'z':    1220.7,"));
}

TEST_F(record_body, of_wake_information) {
    const std::initializer_list<tests::number_at> numbers{{16, 4, 17}, {20, 8, 0x123456789a}};
    EXPECT_EQ(decoded_body(record_of({10, 0, 1, 13}, numbers)),
              " 'wake_reason':        17, 'endpoint_ref':78187493530,");
    EXPECT_EQ(decoded_body(record_of({10, 0, 2, 3}, numbers)),
              " 'wake_reason':        17, 'service_id': 878082202,");
}

TEST_F(record_body, of_the_two_special_categories_is_special_for_exact_first_words_only) {
    for (const record_ids ids :
         {record_ids{4, 0, 2, 3}, record_ids{4, 1, 0, 3}, record_ids{10, 0, 1, 3},
          record_ids{10, 1, 2, 3}, record_ids{3, 0, 0, 3}, record_ids{9, 0, 2, 3}}) {
        EXPECT_TRUE(decoded_body(record_of(ids)).ends_with("'xarg6':         '0',"));
    }
    EXPECT_EQ(decoded_body(record_of({4, 0, 0, 4})),
              " 'trigger':1, 'thread-id':         0, 'arg':         0,");
    EXPECT_EQ(decoded_body(record_of({10, 0, 2, 13})), "");
    EXPECT_EQ(decoded_body(record_of({10, 1, 1, 13})), "");
    EXPECT_EQ(decoded_body(record_of({9, 0, 1, 13})), "");
}

TEST_F(record_body, changes_with_each_byte_of_its_layout_and_with_no_other) {
    struct layout {
        record_ids ids;
        std::size_t from, to;  // the bytes that are shown
    };
    constexpr std::array layouts{
        layout{{0, 0, 0, 0}, 0, 0},    layout{{0, 0, 0, 1}, 16, 48},
        layout{{0, 0, 0, 2}, 16, 48},  layout{{0, 0, 0, 3}, 16, 40},
        layout{{0, 0, 0, 4}, 20, 24},  layout{{0, 0, 0, 5}, 16, 40},
        layout{{0, 0, 0, 6}, 0, 0},    layout{{0, 0, 0, 7}, 0, 0},
        layout{{0, 0, 0, 8}, 16, 47},  layout{{0, 0, 0, 9}, 16, 48},
        layout{{0, 0, 0, 10}, 0, 0},   layout{{0, 0, 0, 11}, 16, 40},
        layout{{0, 0, 0, 12}, 16, 48}, layout{{4, 0, 0, 3}, 16, 40},
        layout{{4, 0, 1, 3}, 16, 40},  layout{{10, 0, 1, 13}, 16, 28},
        layout{{10, 0, 2, 3}, 16, 24},
    };
    for (const layout& one : layouts) {
        const auto record = record_of(one.ids, {}, 0x11);
        for (std::size_t offset = 16; offset < 48; ++offset) {
            auto changed = record;
            changed.bytes[offset] ^= 0xff;
            const bool is_shown = one.from <= offset && offset < one.to;
            EXPECT_EQ(decoded_body(changed) != decoded_body(record), is_shown)
                << "type " << int{one.ids.type} << " offset " << offset;
        }
        // Time stamp and sequence number stand in front of the body, whatever it is.
        const auto head = [](const nrx::profile_record& shown) {
            const auto line = tests::decoded(shown);
            return line.substr(0, line.find("'type-id'"));
        };
        for (std::size_t offset = 4; offset < 16; ++offset) {
            auto changed = record;
            changed.bytes[offset] ^= 0xff;
            EXPECT_NE(head(changed), head(record)) << offset;
        }
    }
}

}  // namespace
