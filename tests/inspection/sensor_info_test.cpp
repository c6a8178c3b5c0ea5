// The inspection of a sensor, its event statistics, the list of services, and the details: client
// table, extra information, registers and performance counters.
#include <algorithm>
#include <array>
#include <regex>

#include "nrxctl/base/hex_dump.h"
#include "nrxctl/inspection/client_table.h"
#include "nrxctl/inspection/sensor_details.h"
#include "nrxctl/inspection/sensor_registry.h"
#include "tests/inspection/sensor_host.h"
#include "tests/support/rows.h"

namespace tests {

using namespace std::string_view_literals;
using nrx::number_base;
using sensor_info = sensor_test;

TEST_F(sensor_info, sensor_of_any_kind_prints_all_its_lines) {
    for (const char* name : {"accel", "gyro", "compass", "pressure", "Accel", "accel2", "acce"}) {
        add_sensor(host, name);
        for (const std::int32_t level : {1, 2})
            EXPECT_EQ(inspect(name, level), sensor_text(name, level));
    }
}

TEST_F(sensor_info, level_determines_which_reports_are_read) {
    // The selector, the report id or command, and the capacity of each request.
    const std::string properties =
        "2:0:4 2:33:4 2:40:4 2:22:4 2:23:4 2:24:4 2:43:20 2:a:4 2:d:4 2:f:32 2:10:32 2:b:36 "
        "2:1a:12 2:18:9 2:3f:128 2:2d:4 2:19:4 2:3d:4 2:44:5 ";
    const std::string motion = "2:6:4 2:36:128 2:4:4 2:37:128 ";
    const std::string details =
        "3:39:496 2:39:1024 2:3a:1024 2:3b:1024 2:3c:1024 2:38:1024 2:26:4 2:31:256 ";
    add_sensor(host, "accel");
    std::string expected;
    for (const std::int32_t level : {1, 0, 3, -2, INT32_MAX, 2}) {
        inspect("accel", level);
        expected += properties + motion + (level == 2 ? details : "");
    }
    // Under its service id the sensor is not recognised as a motion sensor.
    inspect("31", 2);
    expected += properties + details;
    const std::regex pattern(R"(call accel (\d) scalars \[0x(.*)\] in \[\] results 0 \w+ (\d+))");
    std::string requests;
    for (const std::string& line : logged_calls("call"))
        requests += std::regex_replace(line, pattern, "$1:$2:$3 ");
    EXPECT_EQ(requests, expected);
}

TEST_F(sensor_info, missing_interval_is_all_that_is_printed) {
    add_sensor(host, "accel").drop_report(0x00);
    EXPECT_EQ(inspect("accel", 2), "sensor accel doesn't provide sensor info (kr=e00002c7)\n\n");
    EXPECT_EQ(logged_calls("call").size(), 1U);
    EXPECT_TRUE(inspect("nobody", 2)
                    .starts_with("sensor nobody doesn't provide sensor info "
                                 "(kr=e00002f0)\n\nAvailable HID services: \n"));
}

TEST_F(sensor_info, missing_optional_report_changes_its_line_alone) {
    const std::string counters_report =
        library_report(source_file::sensor_details, "kr == 0 ", unsupported_text);
    for (const auto& [name, count] :
         rows<const char*, std::size_t>{{"accel", 30}, {"gyro", 28}, {"compass", 28}}) {
        const auto reports = reports_of(name);
        ASSERT_EQ(reports.size(), count);
        for (std::size_t i = 1; i < count; ++i) {
            const auto& [id, kind, reply, text, missing_text] = reports[i];
            expect_changes(name, {{id, {}, text, missing_text, id == 0x31 ? counters_report : ""}});
        }
    }
}

TEST_F(sensor_info, reply_cut_anywhere_keeps_lines_and_is_reported) {
    const auto count_lines = [](auto text) { return std::count(text.begin(), text.end(), '\n'); };
    for (const char* name : {"accel", "compass"}) {
        interface_driver& sensor = add_sensor(host, name);
        for (const auto& [id, kind, reply, unused_text, unused_missing] : reports_of(name)) {
            if (kind == reply_kind::structured) continue;
            const std::string err = kind == reply_kind::fixed ? length_report(reply.size()) : "";
            for (std::size_t length = 0; length < reply.size(); ++length) {
                sensor.set_report(id, prefix(reply, length));
                const std::string output = inspect(name, 2);
                EXPECT_EQ(count_lines(output), count_lines(sensor_text(name, 2) + err)) << id;
                EXPECT_TRUE(output.ends_with("\n\n\n" + err)) << id << " " << length << output;
            }
            sensor.set_report(id, reply);
        }
    }
}

const std::string interval = "10000 us, hw=-250000 decimation=enabled";
const std::string rates = "100.00 200.00 333333.33 ";
const std::string location = "'L' alternate=-65536";
const std::string full_text = "0123456789abcdef0123456789ABCDEF";

TEST_F(sensor_info, properties_at_boundaries_and_cut_short_print_defaults) {
    expect_changes(
        "accel", {{0x00, numbers({0xffffffff}), interval, "unsupported"},
                  {0x00, numbers({INT32_MIN}), "10000 us", "-2147483648 us"},
                  {0x40, numbers({-2}), "125000 us", "-2 us"},
                  {0x40, numbers({-1}), "125000 us", "sensor is not systick source"},
                  {0x40, numbers({0}), "125000 us", "0 us"},
                  {0x23, numbers({INT32_MIN}), "fixedOdr=disabled", "fixedOdr=enabled"},
                  {0x0a, numbers({INT32_MIN}), "factory", "raw"},
                  {0x0f, bytes_of(full_text), "Maker", full_text},
                  {0x10, bytes_of("unended"), "M-1", "unended"},
                  {0x3f, numbers({0, 0xffffffff, 1}), rates, "inf 0.00 1000000.00 "},
                  {0x3f, numbers({8'000'000, 64'000'000}), rates, "0.12 0.02 "},
                  {0x3d, numbers({0}), "sysconfig", "uncalibrated"},
                  {0x3d, numbers({1}), "sysconfig", "default"},
                  {0x3d, numbers({3}), "sysconfig", "3"},
                  {0x3d, numbers({-70'000}), "sysconfig", "-70000"},
                  {0x44, byte_list{0, 1, 2, 3, 4}, location, "N/A"},
                  {0x44, byte_list{0xe9, 1, 0, 0, 0}, location, "'\xe9' alternate=1"},
                  {0x33, byte_list{}, "hw=-250000", "hw=0", length_report(4)},
                  {0x43, numbers({-110'000, -120'000, -130'000}), "-140000 (-150000", "0 (0",
                   length_report(20)},
                  {0x1a, numbers({1}), "1 -2 2147483647", "1 0 0", length_report(12)},
                  {0x18, byte_list{1, 0xff, 0, 0}, "0 127 -128, 2 3 4\n", "0 0 0, 0 0 0\n",
                   length_report(9)},
                  {0x44, byte_list{'L', 0, 0, 0xff}, location, "'L' alternate=0", length_report(5)},
                  {0x3f, byte_list{0x10, 0x27, 0, 0, 1}, rates, "100.00 "},
                  {0x36, byte_list{2, 0, 0, 0, 4, 0, 0}, "2 70000 -8 ", "2 "},
                  {0x04, numbers({0}), "bw          : -1", "bw          : auto"},
                  {0x04, numbers({0x1000000}), "bw          : -1", "bw          : 16777216"}});
}

using platform::dictionary;
using event_statistics = sensor_test;

TEST_F(event_statistics, missing_entry_is_reported_without_a_line) {
    for (const char* name : {"accel", "first", "second", "third", "fourth"}) {
        add_sensor(host, "accel");
        host.remove(name);
        const char* condition = host.find("accel") ? "child" : "service";
        EXPECT_EQ(output_of([] { nrx::print_event_statistics("accel"); }),
                  failure_line("nrxtoollib", condition, source_file::sensor_registry));
        host.remove("accel");
    }
}

TEST_F(event_statistics, missing_count_is_minus_1_and_time_0) {
    using state = std::optional<platform::property>;
    const std::string no_count =
        "-1 [enqueued=75 dropped=2; event_delta=1.500000 dropped_delta=62.000001]";
    const std::string no_queue =
        "77 [enqueued=-1 dropped=-1; event_delta=0.000000 dropped_delta=0.000000]";
    for (const auto& [entry, debug_state, text] : rows<const char*, state, std::string>{
             {"third", {}, no_count},
             {"third", 5, no_count},
             {"third", dictionary{{"EnqueueEventCount", 3}}, no_count},
             {"fourth", {}, no_queue},
             {"fourth", dictionary{{"EnqueueEventCount", "75"}}, no_queue},
             // Counts have 32 bits, times are unsigned.
             {"fourth",
              dictionary{{"EnqueueEventCount", std::int64_t{0x1'8000'0000}},
                         {"LastEventTime", std::int64_t{-1}}},
              "77 [enqueued=-2147483648 dropped=-1; event_delta=18446744073.709553 "
              "dropped_delta=0.000000]"},
             {"fourth",
              dictionary{{"DroppedEventCount", INT32_MAX},
                         {"LastDroppedEventTime", std::int64_t{501}}},
              "77 [enqueued=-1 dropped=2147483647; event_delta=0.000000 "
              "dropped_delta=0.000001]"}}) {
        add_sensor(host, "accel");
        host.find(entry)->properties = {};
        if (debug_state) host.find(entry)->properties.set("DebugState", *debug_state);
        EXPECT_EQ(output_of([] { nrx::print_event_statistics("accel"); }),
                  "APEvents    : " + text + "\n");
        host.remove("accel");
    }
}

using hid_services = device_test;

// Expects the list of names, then the service that each lookup finds. The addresses differ from
// run to run.
void expect_list(const std::string& name, const std::string& list, int prefixed, int bare,
                 const std::string& err = "") {
    const std::string output = output_of([&] { nrx::print_hid_services(name); });
    EXPECT_EQ(std::regex_replace(output, std::regex("\\[0x[0-9a-f]+, "), "["),
              list + "\nMatching WQR_" + name.substr(0, 123) + " [" + std::to_string(prefixed) +
                  "]\nMatching " + name + " [" + std::to_string(bare) + "]\n\n\n\n" + err);
}

const std::string label = "Available HID services: ";

TEST_F(hid_services, look_ups_show_the_service_that_each_finds) {
    expect_list("nobody", label, 0, 0);
    add_service(host, "WQR_accel", 31);
    expect_list("accel", label, 1, 0);
    add_service(host, "accel", 2);
    expect_list("accel", label, 2, 3);
    host.remove("WQR_accel");
    expect_list("accel", label, 0, 4);
    // The lookups are by name alone, and find no HID interfaces.
    expect_list("2", label, 0, 0);
    add_hid_interfaces(host, {"gyro", "WQR_gyro"});
    expect_list("gyro", label + "gyro WQR_gyro ", 0, 0);
}

TEST_F(hid_services, look_ups_follow_a_list_that_fails) {
    const std::string err = failure_line("nrxtoollib", "kr == 0", source_file::sensor_registry);
    add_hid_interfaces(host, {"accel", "gyro", "compass"});
    expect_list("nobody", label + "accel gyro compass ", 0, 0);
    EXPECT_EQ(host.log().at(2), "release accel");  // as soon as its name is read
    host.fail_call(1, failure::io);
    expect_list("nobody", "Can't enumerate HID services", 0, 0, err);
    host.fail_call(3, failure::not_found);
    expect_list("nobody", label + "accel Can't enumerate HID services", 0, 0, err);
}

TEST_F(hid_services, long_name_is_cut_only_after_the_prefix) {
    for (const std::size_t length : {123U, 124U, 200U})
        expect_list(std::string(length, 'n'), label, 0, 0);
    add_service(host, "WQR_" + std::string(123, 'n'), 1);
    expect_list(std::string(150, 'n'), label, 1, 0);
}

using sensor_details = sensor_test;

TEST_F(sensor_details, missing_service_or_reply_has_no_client_table) {
    const auto print = [] { nrx::print_client_table("=", "gyro"); };
    EXPECT_EQ(output_of(print), failure_line("nrxtoollib", "service", source_file::channel));
    add_service(host, "gyro", 1);
    EXPECT_EQ(output_of(print), "");
}

TEST(clients, incomplete_entry_at_the_end_is_ignored) {
    const byte_list entries = client_entries();
    std::string expected =
        "=name                                report    batch threshold timelimit options power\n";
    const std::array client_lines{
        "=system                          : -1000000  -200000   -300000     40000             7\n",
        "=twelve chars                    :        5        6         7 -2147483648       d   "
        "255\n"};
    for (std::size_t size = 0; size <= entries.size(); ++size) {
        if (size == 31) expected += client_lines[0];
        if (size == 93) expected += client_lines[1];
        EXPECT_EQ(output_of([&] { nrx::print_clients("=", prefix(entries, size)); }), expected);
    }
}

void expect_block(const std::string& block, const std::string& text, number_base base_after,
                  const std::string& err = "") {
    number_base base = number_base::decimal;
    EXPECT_EQ(output_of([&] { nrx::print_info_block(bytes_of(block), base); }),
              "ExtraInfo   : " + text + "\n" + err);
    EXPECT_EQ(base, base_after) << text;
}

TEST(extra_info, items_print_in_order_up_to_a_truncated_one) {
    std::string block;
    std::string text;
    number_base base = number_base::decimal;
    for (const auto& [item, item_text] : rows<std::string_view, std::string>{
             {"\0\x80\xff\xff\xff"sv, "-128"},
             {"\0\xff\xff\xff\x7f"sv, "2147483647"},
             {"\0\0\0\0\x80"sv, "-2147483648"},
             {"\1\xff\xff\xff\xff\xff\xff\xff\xff"sv, "-1"},
             {"\1\1\2\3\4\5\6\7\x08"sv, "578437695752307201"},
             {"\2\0"sv, ""},
             {"\2ab c\0"sv, "ab c"},
             {"\3"sv, "\nExtraInfo   : "},
             {"\4"sv, ""},
             {"\0\xff\xff\xff\xff"sv, "ffffffff"},
             {"\1\xfe\xff\xff\xff\xff\xff\xff\xff"sv, "fffffffffffffffe"},
             {"\0\x0a\0\0\0"sv, "a"},
             {"\5"sv, ""},
             {"\0\x0a\0\0\0"sv, "10"},
             {"\3"sv, "\nExtraInfo   : "}}) {
        expect_block(block, text, base);
        const bool is_text = item[0] == 2;  // a text may end with the block, a number must not
        const std::string err =
            is_text ? "" : length_report(block.size() + item.size(), source_file::sensor_details);
        for (std::size_t size = 1; size < item.size(); ++size) {
            const std::string part(item.substr(0, size));
            expect_block(block + part, text + (is_text ? part.substr(1) : ""), base, err);
        }
        block += item;
        text += item_text;
        if (item[0] == 4) base = number_base::hexadecimal;
        if (item[0] == 5) base = number_base::decimal;
    }
    expect_block(block, text, base);
}

TEST(extra_info, unknown_tag_ends_the_block_with_a_dump_of_it) {
    for (int tag = 6; tag <= 255; ++tag) {
        const std::string block =
            std::string("\2sixteen letters.\0\5"sv) + static_cast<char>(tag) + "\2thirteen more";
        const std::string dump = output_of([&] { nrx::hex_dump(bytes_of(block)); });
        expect_block(block, "sixteen letters.\ndata error\n" + dump, number_base::decimal);
    }
}

const std::string registers_text = "R0f=a0 R10=abc ";

TEST_F(sensor_details, registers_have_at_least_two_digits) {
    expect_changes("als", {{0x38, bytes_of("\3\0\0\0\0\0\x0f\0\x10\0\xff\0\xff\xff\0\1"sv),
                            registers_text, "R00=0f R10=ff Rffff=100 "},
                           {0x38, numbers({1, 0x20001, 0x40003}), registers_text, "R01=02 "},
                           {0x38, numbers({0}), registers_text, ""}});
}

TEST_F(sensor_details, register_count_beyond_the_list_is_reported) {
    std::vector<byte_list> lists{numbers({0xffffffff, 1, 2, 3})};
    for (const std::int64_t count : {256, 0x40000000, 0x40000001, 0x7fffffff}) {
        lists.push_back(numbers({count}));
        lists.back().resize(1024);
    }
    for (std::size_t size = 0; size < 12; ++size)
        lists.push_back(prefix(numbers({2, 0x20001, 0x40003}), size));
    const std::string report =
        library_report(source_file::sensor_details,
                       "size >= sizeof(NrxRegisterList) + list->count*sizeof(list->regs[0])");
    for (const byte_list& list : lists)
        expect_changes("als", {{0x38, list, registers_text, "", report}});
}

const std::string counters_text = "cycles: 16777216 allmisse: -1 ";

TEST_F(sensor_details, counters_require_automatic_mode) {
    const std::string text = "perfmon is not in auto mode";
    for (const std::int64_t mode : {0, 1, 3, 0x102, -2})
        expect_changes("als", {{0x26, numbers({mode}), counters_text, text}});
}

TEST_F(sensor_details, counters_print_up_to_the_last_complete_one) {
    const std::string counter = "nnnnnnnn: 1852730990 ";
    std::string ten;
    for (int i = 0; i < 10; ++i)
        ten += counter;
    for (const std::size_t count : {0U, 1U, 10U, 11U, 0x10000U, 0xffffffffU}) {
        byte_list reply = numbers({static_cast<std::int64_t>(count)});
        reply.resize(256, 'n');
        const std::string text = ten.substr(0, counter.size() * count);
        expect_changes("als", {{0x31, reply, counters_text, text}});
    }
    for (std::size_t size = 0; size <= 52; ++size) {
        const std::string text = ten.substr(0, size < 4 ? 0 : counter.size() * ((size - 4) / 24));
        const std::string err = size < 4 ? length_report(4, source_file::sensor_details) : "";
        expect_changes("als", {{0x31, byte_list(size, 'n'), counters_text, text, err}});
    }
}

}  // namespace tests
