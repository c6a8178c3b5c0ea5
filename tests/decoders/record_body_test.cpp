#include "tests/decoders/event_record.h"
#include "tests/support/device_test.h"

namespace {

using namespace tests;
using nrx::profile_record;
using record_body = device_test;

profile_record long_data(std::uint64_t length) {
    return make_record(
        {2, 0, 1, 1},
        {{16, 2, 65535}, {18, 2, 100}, {20, 2, length}, {22, 2, 24}, {24, 8, 0xff000302010a}});
}

TEST_F(record_body, each_type_has_its_fields_in_order) {
    const auto sensor = make_record({2, 1, 9, 8}, {{16, 4, {10000, 20000, 3, 4, 0x00ff4101}}}, 'z');
    const std::string sensor_numbers =
        ", 'report-interval':     10000, 'batch-interval':     20000, 'threshold':         3, "
        "'time-limit':         4, 'connected':         1, 'decimation':        65, "
        "'gyroPowerMode':       255,";
    const auto function = make_record({0, 4, 0, 9}, {{16, 4, {1, 2, 3, 4}}}, 'f');
    const std::string function_numbers =
        ", 'arg':         4, 'task':         1, 'thread':         2, 'duration':         3,";
    const rows<profile_record, std::string> cases{
        {make_record({0, 3, 2, 2}, {{16, 2, 7}, {18, 8, 0x0807060504030201}}),
         " 'subtype':         7, 'packet-size':        30, 'data-length':        30, "
         "'data-offset':         0, "
         "'raw-data':[1,2,3,4,5,6,7,8,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0],"},
        {make_record(
             {11, 0, 0, 3},
             {{16, 4, {0xf0000001, 0xf0000002, 4294967295, 0xf0000004, 0xf0000005, 100000000}}}),
         " 'arg1':4026531841, 'arg2':4026531842, 'arg3':4294967295, 'arg4':4026531844, "
         "'arg5':4026531845, 'arg6': 100000000, 'xarg1':         'f0000001', "
         "'xarg2':         'f0000002', 'xarg3':         'ffffffff', 'xarg4':         'f0000004', "
         "'xarg5':         'f0000005', 'xarg6':         '5f5e100',"},
        {make_record({5, 0, 0, 4}, {{16, 4, {0xffffffff, 0xf0000001}}}, 0xff),
         " 'trigger':1, 'thread-id':4026531841, 'arg':4026531841,"},
        {make_record({0, 1, 0, 5}, {{16, 4, {1, 22, 333, 4444, 55555, 666666}}}),
         " 'function-id':         1, 'extra-id':        22, 'thread-id':       333, "
         "'duration':      4444, 'depth':     55555, 'thread_duration':    666666,"},
        {with_text(sensor, 35, "zzzzzzzzzzzz"), " 'name':  'zzzzzzzzzzzz'" + sensor_numbers},
        {with_text(sensor, 35, {"gyro\0", 5}), " 'name':          'gyro'" + sensor_numbers},
        {sensor, " 'name':              ''" + sensor_numbers},
        {function, " 'function':'ffffffffffffffff'" + function_numbers},
        {with_text(function, 32, {"run\0", 4}), " 'function':     'run'" + function_numbers},
        {make_record({1, 1, 0, 11}, {{16, 8, {12345678901, 0x68676665}}, {32, 4, {8, 9}}}),
         " 'global-id':12345678901, 'entry-id':1751606885, 'entry':    'efgh', "
         "'arg1':         8, 'arg2':         9,"},
        {make_record({1, 1, 0, 11}, {{24, 8, 0x6867666564636261}}),
         " 'global-id':         0, 'entry-id':7523094288207667809, 'entry':'abcdefgh', "
         "'arg1':         0, 'arg2':         0,"},
        {with_text(make_record({2, 0, 9, 12}, {{16, 4, {0xffffffff, 0xffffffff, 1, 2, 3}}}), 36,
                   "accel-filter"),
         " 'name':  'accel-filter', 'sample-interval':         1, 'report-interval':         "
         "2, 'batch-interval':         3, 'next-dispatch':18446744073709551615,"},
        {make_record({10, 0, 1, 13}, {{16, 4, {17, 0x3456789a, 0x12}}}),
         " 'wake_reason':        17, 'endpoint_ref':78187493530,"},
        {make_record({10, 0, 2, 3}, {{16, 4, {17, 0x3456789a, 0x12}}}),
         " 'wake_reason':        17, 'service_id': 878082202,"},
        {make_record(
             {4, 0, 0, 3},
             {{16, 4, {0xffff0000, 98304, 0xffffffff, 0xf0000004, 0xf0000005, 0xf0000006}}}),
         " 'arg1':4294901760, 'arg2':     98304, 'arg3':4294967295, 'arg4':4026531844, "
         "'arg5':4026531845, 'arg6':4026531846, 'x':        -1, 'y':       1.5, "
         "'z':-1.52588e-05,"},
        {make_record(
             {4, 0, 1, 3},
             {{16, 4, {65536, 0xfffff000, 0xffffffff, 0xf0000004, 0xf0000005, 0xf0000006}}}),
         " 'arg1':     65536, 'arg2':4294963200, 'arg3':4294967295, 'arg4':4026531844, "
         "'arg5':4026531845, 'arg6':4026531846, 'x':        16, 'y':        -1, "
         "'z':-0.000244141,"},
        {long_data(5),
         " 'subtype':     65535, 'packet-size':       100, 'data-length':         5, "
         "'data-offset':        24, 'raw-data':[10,1,2,3,0],"},
        {make_record({4, 0, 0, 4}), " 'trigger':1, 'thread-id':         0, 'arg':         0,"},
        {make_record({10, 0, 2, 13}), ""},
        {make_record({10, 1, 1, 13}), ""},
        {make_record({9, 0, 1, 13}), ""},
    };
    for (const auto& [record, text] : cases)
        EXPECT_EQ(decoded_body(record), text);
}

TEST_F(record_body, ends_with_its_boundary_values) {
    const std::string all = ":[10,1,2,3,0,255,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0],";
    const std::string event_end = "'xarg6':         '0',";
    const rows<profile_record, std::string> cases{
        {long_data(0), " 'raw-data':        [],"},
        {long_data(2), " 'raw-data':    [10,1],"},
        {long_data(23), ":[10,1,2,3,0,255,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0,0],"},
        {long_data(24), all},
        {long_data(25), all},
        {long_data(256), all},
        {long_data(65535), all},
        {make_record({4, 0, 0, 3}, {{16, 4, {0, 0x80000000, 0x7fffffff}}}),
         " 'x':         0, 'y':    -32768, 'z':     32768,"},
        {make_record({4, 0, 1, 3}, {{16, 4, {0xffffffff, 0x80000000, 5000000}}}),
         " 'x':-0.000244141, 'y':   -524288, 'z':    1220.7,"},
        // First words beside those of special bodies.
        {make_record({4, 0, 2, 3}), event_end},
        {make_record({4, 1, 0, 3}), event_end},
        {make_record({10, 0, 1, 3}), event_end},
        {make_record({10, 1, 2, 3}), event_end},
        {make_record({3, 0, 0, 3}), event_end},
        {make_record({9, 0, 2, 3}), event_end},
    };
    for (const auto& [record, end] : cases)
        EXPECT_TRUE(decoded_body(record).ends_with(end)) << decoded_body(record);
}

TEST_F(record_body, depends_on_each_byte_of_its_layout_and_on_no_other) {
    rows<record_ids, std::size_t, std::size_t> layouts{
        {{0, 0, 0, 1}, 16, 48},  {{0, 0, 0, 2}, 16, 48},  {{0, 0, 0, 3}, 16, 40},
        {{0, 0, 0, 4}, 20, 24},  {{0, 0, 0, 5}, 16, 40},  {{0, 0, 0, 8}, 16, 47},
        {{0, 0, 0, 9}, 16, 48},  {{0, 0, 0, 11}, 16, 40}, {{0, 0, 0, 12}, 16, 48},
        {{4, 0, 0, 3}, 16, 40},  {{4, 0, 1, 3}, 16, 40},  {{10, 0, 1, 13}, 16, 28},
        {{10, 0, 2, 3}, 16, 24}, {{0, 0, 0, 0}, 0, 0},    {{0, 0, 0, 6}, 0, 0},
        {{0, 0, 0, 7}, 0, 0},    {{0, 0, 0, 10}, 0, 0},
    };
    for (int type = 13; type < 256; ++type)
        layouts.push_back({{0, 0, 0, static_cast<std::uint8_t>(type)}, 0, 0});
    const auto text_before_ids = [](const profile_record& record) {
        const auto line = decoded(record);
        return line.substr(0, line.find("'type-id'"));
    };
    for (const auto& [ids, begin, end] : layouts) {
        const auto record = make_record(ids, {}, 0x11);
        EXPECT_EQ(decoded_body(record).empty(), end == 0);
        for (std::size_t offset = 4; offset < 48; ++offset) {
            auto changed = record;
            changed.bytes[offset] ^= 0xff;
            // Sequence number and timestamp precede every body.
            const bool is_shown = offset < 16 || (begin <= offset && offset < end);
            EXPECT_EQ(text_before_ids(changed) != text_before_ids(record), is_shown)
                << "type " << int{ids.type} << " offset " << offset;
        }
    }
}

}  // namespace
