// The body of a record, by its type and, for some records, by its category.

#include "tests/decoders/event_record.h"
#include "tests/support/device_test.h"

namespace {

using namespace tests;
using record_body = device_test;

TEST_F(record_body, of_each_type_has_its_fields_in_order) {
    const auto sensor = record_of({2, 1, 9, 8}, {{16, 4, {10000, 20000, 3, 4, 0x00ff4101}}}, 'z');
    const std::string sensor_numbers =
        ", 'report-interval':     10000, 'batch-interval':     20000, 'threshold':         3, "
        "'time-limit':         4, 'connected':         1, 'decimation':        65, "
        "'gyroPowerMode':       255,";
    const auto function = record_of({0, 4, 0, 9}, {{16, 4, {1, 2, 3, 4}}}, 'f');
    const std::string function_numbers =
        ", 'arg':         4, 'task':         1, 'thread':         2, 'duration':         3,";
    const rows<nrx::profile_record, std::string> cases{
        {record_of({0, 3, 2, 2}, {{16, 2, 7}, {18, 8, 0x0807060504030201}}),
         " 'subtype':         7, 'packet-size':        30, 'data-length':        30, "
         "'data-offset':         0, "
         "'raw-data':[1,2,3,4,5,6,7,8,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0],"},
        {record_of({11, 0, 0, 3}, {{16, 4, {255, 2, 4294967295, 4096, 0, 100000000}}}),
         " 'arg1':       255, 'arg2':         2, 'arg3':4294967295, 'arg4':      4096, "
         "'arg5':         0, 'arg6': 100000000, 'xarg1':         'ff', 'xarg2':         '2', "
         "'xarg3':         'ffffffff', 'xarg4':         '1000', 'xarg5':         '0', "
         "'xarg6':         '5f5e100',"},
        {record_of({5, 0, 0, 4}, {{16, 4, {0xffffffff, 51}}}, 0xff),
         " 'trigger':1, 'thread-id':        51, 'arg':        51,"},
        {record_of({0, 1, 0, 5}, {{16, 4, {1, 22, 333, 4444, 55555, 666666}}}),
         " 'function-id':         1, 'extra-id':        22, 'thread-id':       333, "
         "'duration':      4444, 'depth':     55555, 'thread_duration':    666666,"},
        {with_text(sensor, 35, "zzzzzzzzzzzz"), " 'name':  'zzzzzzzzzzzz'" + sensor_numbers},
        {with_text(sensor, 35, {"gyro\0", 5}), " 'name':          'gyro'" + sensor_numbers},
        {sensor, " 'name':              ''" + sensor_numbers},
        {function, " 'function':'ffffffffffffffff'" + function_numbers},
        {with_text(function, 32, {"run\0", 4}), " 'function':     'run'" + function_numbers},
        {record_of({1, 1, 0, 11}, {{16, 8, {12345678901, 0x68676665}}, {32, 4, {8, 9}}}),
         " 'global-id':12345678901, 'entry-id':1751606885, 'entry':    'efgh', "
         "'arg1':         8, 'arg2':         9,"},
        {record_of({1, 1, 0, 11}, {{24, 8, 0x6867666564636261}}),
         " 'global-id':         0, 'entry-id':7523094288207667809, 'entry':'abcdefgh', "
         "'arg1':         0, 'arg2':         0,"},
        {with_text(record_of({2, 0, 9, 12}, {{16, 4, {0xffffffff, 0xffffffff, 1, 2, 3}}}), 36,
                   "accel-filter"),
         " 'name':  'accel-filter', 'sample-interval':         1, 'report-interval':         "
         "2, 'batch-interval':         3, 'next-dispatch':18446744073709551615,"},
        {record_of({10, 0, 1, 13}, {{16, 4, {17, 0x3456789a, 0x12}}}),
         " 'wake_reason':        17, 'endpoint_ref':78187493530,"},
        {record_of({10, 0, 2, 3}, {{16, 4, {17, 0x3456789a, 0x12}}}),
         " 'wake_reason':        17, 'service_id': 878082202,"},
    };
    for (const auto& [record, text] : cases)
        EXPECT_EQ(decoded_body(record), text);
}

TEST_F(record_body, of_long_data_lists_as_many_bytes_as_it_says_and_there_are) {
    const auto long_data = [](std::uint64_t length) {
        return decoded_body(record_of(
            {2, 0, 1, 1},
            {{16, 2, 65535}, {18, 2, 100}, {20, 2, length}, {22, 2, 24}, {24, 8, 0xff000302010a}}));
    };
    EXPECT_EQ(long_data(5),
              " 'subtype':     65535, 'packet-size':       100, 'data-length':         5, "
              "'data-offset':        24, 'raw-data':[10,1,2,3,0],");
    EXPECT_TRUE(long_data(2).ends_with(" 'data-offset':        24, 'raw-data':    [10,1],"));
    EXPECT_TRUE(long_data(0).ends_with(" 'data-offset':        24, 'raw-data':        [],"));
    const std::string all = "'raw-data':[10,1,2,3,0,255,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0],";
    for (const std::uint64_t length : {24U, 25U, 200U, 1000U, 65535U})
        EXPECT_TRUE(long_data(length).ends_with(all)) << length;
    EXPECT_TRUE(long_data(23).ends_with(",255,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0],"));
}

TEST_F(record_body, of_talvor_samples_shows_fractions_of_16_or_12_bits) {
    const auto samples = [](std::uint8_t event, std::int32_t x, std::int32_t y, std::int32_t z) {
        const auto word = [](std::int32_t value) { return static_cast<std::uint32_t>(value); };
        return decoded_body(
            record_of({4, 0, event, 3}, {{16, 4, {word(x), word(y), word(z), 4, 5, 6}}}));
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

TEST_F(record_body, of_the_two_special_categories_is_special_for_exact_first_words_only) {
    for (const record_ids ids :
         {record_ids{4, 0, 2, 3}, record_ids{4, 1, 0, 3}, record_ids{10, 0, 1, 3},
          record_ids{10, 1, 2, 3}, record_ids{3, 0, 0, 3}, record_ids{9, 0, 2, 3}}) {
        EXPECT_TRUE(decoded_body(record_of(ids)).ends_with("'xarg6':         '0',"));
    }
    EXPECT_EQ(decoded_body(record_of({4, 0, 0, 4})),
              " 'trigger':1, 'thread-id':         0, 'arg':         0,");
    for (const record_ids ids :
         {record_ids{10, 0, 2, 13}, record_ids{10, 1, 1, 13}, record_ids{9, 0, 1, 13}}) {
        EXPECT_EQ(decoded_body(record_of(ids)), "");
    }
}

TEST_F(record_body, changes_with_each_byte_of_its_layout_and_with_no_other) {
    struct layout {
        record_ids ids;
        std::size_t from, to;  // the bytes that are shown
    };
    std::vector<layout> layouts{
        {{0, 0, 0, 1}, 16, 48},  {{0, 0, 0, 2}, 16, 48},  {{0, 0, 0, 3}, 16, 40},
        {{0, 0, 0, 4}, 20, 24},  {{0, 0, 0, 5}, 16, 40},  {{0, 0, 0, 8}, 16, 47},
        {{0, 0, 0, 9}, 16, 48},  {{0, 0, 0, 11}, 16, 40}, {{0, 0, 0, 12}, 16, 48},
        {{4, 0, 0, 3}, 16, 40},  {{4, 0, 1, 3}, 16, 40},  {{10, 0, 1, 13}, 16, 28},
        {{10, 0, 2, 3}, 16, 24},
    };
    // Every other type has no body.
    for (int type = 0; type < 256; ++type) {
        if (type > 12 || type == 0 || type == 6 || type == 7 || type == 10)
            layouts.push_back({{0, 0, 0, static_cast<std::uint8_t>(type)}, 0, 0});
    }
    for (const layout& one : layouts) {
        const auto record = record_of(one.ids, {}, 0x11);
        EXPECT_EQ(decoded_body(record).empty(), one.to == 0);
        const auto head = [](const nrx::profile_record& shown) {
            const auto line = decoded(shown);
            return line.substr(0, line.find("'type-id'"));
        };
        for (std::size_t offset = 4; offset < 48; ++offset) {
            auto changed = record;
            changed.bytes[offset] ^= 0xff;
            // Time stamp and sequence number stand in front of the body, whatever it is.
            const bool is_shown = offset < 16 || (one.from <= offset && offset < one.to);
            EXPECT_EQ(head(changed) != head(record), is_shown)
                << "type " << int{one.ids.type} << " offset " << offset;
        }
    }
}

}  // namespace
