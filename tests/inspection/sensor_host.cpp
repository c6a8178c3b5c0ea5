#include "tests/inspection/sensor_host.h"

#include "tests/golden/golden_text.h"

namespace tests {

using namespace std::string_view_literals;
using enum reply_kind;

const std::string matrix_text =
    "1.000000 -0.500000 0.250000 | 0.125000 2.000000 -3.000000 | "
    "0.000015 32767.999985 -32768.000000";
const byte_list matrix =
    numbers({0x10000, -0x8000, 0x4000, 0x2000, 0x20000, -0x30000, 1, INT32_MAX, INT32_MIN});

const std::vector<report_row> all_reports{
    {0x00, fixed, numbers({10'000}), "10000 us", ""},
    {0x33, fixed, numbers({-250'000}), "hw=-250000", "hw=-1"},
    {0x40, fixed, numbers({125'000}), "125000 us", "sensor is not systick source"},
    {0x22, fixed, numbers({0x10000}), "enabled fixedOdr", "disabled fixedOdr"},
    {0x23, fixed, numbers({0}), "fixedOdr=disabled", "fixedOdr=disabled"},
    {0x24, fixed, numbers({0x100}), "decimation=enabled", "decimation=disabled"},
    {0x43, fixed, numbers({-110'000, -120'000, -130'000, -140'000, -150'000}),
     "sensor=-110000 mux=-120000 ap_batch=-130000 ap_report=-140000 (-150000 samples",
     "sensor=0 mux=0 ap_batch=0 ap_report=0 (0 samples"},
    {0x0a, fixed, numbers({0}), "factory", "factory"},
    {0x0d, fixed, numbers({INT32_MIN}), "factory", "normal"},
    {0x0f, variable, bytes_of("Maker\0rest"sv), "Maker M-1", " M-1"},
    {0x10, variable, bytes_of("M-1\0rest"sv), "Maker M-1", "Maker "},
    {0x0b, fixed, matrix, "Cal matrix  : " + matrix_text + "\n", ""},
    {0x1a, fixed, numbers({1, -2, INT32_MAX}), "Cal offset  : 1 -2 2147483647\n", ""},
    {0x18, fixed, bytes_of("\1\xff\0\0\x7f\x80\2\3\4"sv),
     "Orient. m.  : 1 -1 0, 0 127 -128, 2 3 4\n", ""},
    {0x3f, variable, numbers({10'000, 5'000, 3}), "100.00 200.00 333333.33 ", ""},
    {0x2d, fixed, numbers({-210'000}), "-210000", "0"},
    {0x19, fixed, numbers({-220'000}), "-220000", "0"},
    {0x3d, fixed, numbers({2}), "sysconfig", "uncalibrated"},
    {0x44, fixed, bytes_of("L\0\0\xff\xff"sv), "'L' alternate=-65536", "N/A"},
    {0x06, fixed, numbers({-80'000}), ": -80000", ": "},
    {0x36, variable, numbers({2, 70'000, -8}), "2 70000 -8 ", ""},
    {0x04, fixed, numbers({-1}), "bw          : -1", "bw          : "},
    {0x37, variable, numbers({25, 0}), "25 0 ", ""},
    {0x1d, fixed, matrix, "Sensitivity : " + matrix_text, "Sensitivity : N/A"},
    {0xd6, fixed, numbers({0x18000, -0x10000, 0}), "1.500000 -1.000000 0.000000", "N/A"},
    // The first block sets the number base in which the second one starts.
    {0x39, structured, bytes_of("\0\x0a\0\0\0\4\0\xff\0\0\0\3\2ok\0"sv),
     "10ff\nExtraInfo   : ok\nExtraInfo   : ffffffff", "\nExtraInfo   : -1"},
    {0x3a, structured, bytes_of("\0\xff\xff\xff\xff\5\2 \0\1\0\0\0\0\1\0\0\0\4"sv),
     "ffffffff 4294967296", ""},
    {0x3b, structured, bytes_of("\x09"sv),
     "\ndata error\n00000000: 09                                                | .\n\n", "\n"},
    {0x3c, structured, bytes_of("\0\x0c\0\0\0"sv), ": c\n", ": \n"},
    {0x38, structured, bytes_of("\2\0\0\0\x0f\0\xa0\0\x10\0\xbc\x0a"sv), "R0f=a0 R10=abc ",
     "<not supperted>"},
    {0x26, fixed, numbers({2}), "cycles: 16777216 allmisse: -1 ", "perfmon is not supported"},
    {0x31, structured,
     bytes_of("\2\0\0\0"
              "cycles\0x\0\0\0\1............"
              "allmisse\xff\xff\xff\xff............"sv),
     "APPerfmon   : cycles: 16777216 allmisse: -1 \n", ""},
};

void add_events(machine& host, std::string_view service) {
    const auto first = host.add({.name = "first"}, host.find(service));
    const auto second = host.add({.name = "second"}, first);
    const platform::dictionary events{{"_num_events", 77}};
    const auto third = host.add({.name = "third", .properties = {{"DebugState", events}}}, second);
    const platform::dictionary queue{{"EnqueueEventCount", std::int64_t{75}},
                                     {"DroppedEventCount", 2},
                                     {"LastEventTime", std::int64_t{1'500'000'000}},
                                     {"LastDroppedEventTime", std::int64_t{62'000'001'000}}};
    host.add({.name = "fourth", .properties = {{"DebugState", queue}}}, third);
}

byte_list numbers(std::initializer_list<std::int64_t> values) {
    byte_list bytes;
    for (const std::int64_t value : values) {
        for (int shift = 0; shift < 32; shift += 8)
            bytes.push_back(static_cast<std::uint8_t>(value >> shift));
    }
    return bytes;
}

byte_list client_entries() {
    return bytes_of(
        "system\0xxxxx\xc0\xbd\xf0\xff\xc0\xf2\xfc\xff\x20\x6c\xfb\xff\x40\x9c\0\0\1\0\7"
        "gone\0xxxxxxx\1\0\0\0\2\0\0\0\3\0\0\0\4\0\0\0\0\1\1"
        "twelve chars\5\0\0\0\6\0\0\0\7\0\0\0\0\0\0\x80\x09\x08\xff"sv);
}

interface_driver& add_sensor(machine& host, std::string_view name) {
    interface_driver& sensor = add_service(host, name, 31);
    for (const report_row& row : all_reports)
        sensor.set_report(row.id, row.reply);
    sensor.set_command(0x39, [](platform::byte_view, byte_list& reply) {
        reply = client_entries();
        return platform::success;
    });
    add_events(host, name);
    return sensor;
}

void add_hid_interfaces(machine& host, std::initializer_list<const char*> names) {
    for (const char* name : names)
        host.add({.name = name, .classes = {"KeltoNRXHIDInterface"}});
}

std::string sensor_text(std::string_view name, std::int32_t level) {
    const std::string type(name);
    const std::string text = "Sensor type : " + type + "\n" + golden_text("sensor_properties.txt") +
                             golden_text("sensor_" + type + ".txt");  // empty for most types
    return text + (level == 2 ? golden_text("sensor_details.txt") : "") + "\n\n";
}

std::vector<report_row> reports_of(std::string_view name) {
    auto reports = all_reports;
    std::erase_if(reports, [text = sensor_text(name, 2)](const report_row& row) {
        return text.find(row.text) == std::string::npos;
    });
    return reports;
}

std::string length_report(std::size_t required, const char* file) {
    return failure_line("nrxtoollib", "length >= " + std::to_string(required), file);
}

void sensor_test::expect_changes(std::string_view name, const std::vector<change>& changes) {
    for (const auto& [id, reply, text, changed_text, err] : changes) {
        interface_driver& sensor = add_sensor(host, name);
        sensor.drop_report(id);
        if (reply) sensor.set_report(id, *reply);
        std::string expected = sensor_text(name, 2);
        const std::size_t position = expected.find(text);
        ASSERT_NE(position, std::string::npos) << text;
        expected.replace(position, text.size(), changed_text);
        EXPECT_EQ(inspect(name, 2), expected + err) << id;
        host.remove(name);
    }
}

}  // namespace tests
