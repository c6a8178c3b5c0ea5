#include "tests/inspection/sensor_host.h"

#include <map>

#include "nrxctl/inspection/sensor_info.h"

namespace tests {

namespace {

void append(byte_list& bytes, std::int64_t number) {
    for (int shift = 0; shift < 32; shift += 8)
        bytes.push_back(static_cast<std::uint8_t>(number >> shift));
}

void put_events(machine& host, std::string_view service) {
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

}  // namespace

byte_list words(std::initializer_list<std::int64_t> numbers) {
    byte_list bytes;
    for (const std::int64_t number : numbers)
        append(bytes, number);
    return bytes;
}

byte_list bytes_of(std::string_view text) {
    return {text.begin(), text.end()};
}

byte_list first_bytes(const byte_list& whole, std::size_t length) {
    return {whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length)};
}

byte_list client_entry(std::string_view name, std::initializer_list<std::int64_t> numbers,
                       std::uint8_t in_use, std::uint8_t option, std::uint8_t power) {
    byte_list entry = bytes_of(name);
    if (entry.size() < 12) entry.push_back(0);
    entry.resize(12, 'x');
    for (const std::int64_t number : numbers)
        append(entry, number);
    entry.insert(entry.end(), {in_use, option, power});
    return entry;
}

interface_driver& put_whole_sensor(machine& host, std::string_view name) {
    using namespace std::string_view_literals;
    struct row {
        std::uint32_t id;
        byte_list bytes;
    };
    const byte_list matrix =
        words({0x10000, -0x8000, 0x4000, 0x2000, 0x20000, -0x30000, 1, INT32_MAX, INT32_MIN});
    interface_driver& sensor = put_service(host, name, 31);
    for (const row& report : {
             row{0x00, words({10'000})},
             row{0x33, words({-250'000})},
             row{0x40, words({125'000})},
             row{0x22, words({0x10000})},
             row{0x23, words({0})},
             row{0x24, words({0x100})},
             row{0x43, words({-110'000, -120'000, -130'000, -140'000, -150'000})},
             row{0x0a, words({0})},
             row{0x0d, words({INT32_MIN})},
             row{0x0f, bytes_of("Maker\0rest"sv)},
             row{0x10, bytes_of("M-1\0rest"sv)},
             row{0x0b, matrix},
             row{0x1a, words({1, -2, INT32_MAX})},
             row{0x18, {1, 0xff, 0, 0, 127, 128, 2, 3, 4}},
             row{0x3f, words({10'000, 5'000, 3})},
             row{0x2d, words({-210'000})},
             row{0x19, words({-220'000})},
             row{0x3d, words({2})},
             row{0x44, {'L', 0, 0, 0xff, 0xff}},
             row{0x06, words({-80'000})},
             row{0x36, words({2, 70'000, -8})},
             row{0x04, words({-1})},
             row{0x37, words({25, 0})},
             row{0x1d, matrix},
             row{0xd6, words({0x18000, -0x10000, 0})},
             row{0x39, bytes_of("\0\x0a\0\0\0\4\0\xff\0\0\0\3\2ok\0"sv)},
             row{0x3a, bytes_of("\0\xff\xff\xff\xff\5\2 \0\1\0\0\0\0\1\0\0\0\4"sv)},
             row{0x3b, {9, 'A'}},
             row{0x3c, bytes_of("\0\x0c\0\0\0"sv)},
             row{0x38, bytes_of("\2\0\0\0\x0f\0\xa0\0\x10\0\xbc\x0a"sv)},
             row{0x26, words({2})},
             row{0x31, bytes_of("\2\0\0\0"
                                "cycles\0x\0\0\0\1............"
                                "allmisse\xff\xff\xff\xff............"sv)},
         }) {
        sensor.set_report(report.id, report.bytes);
    }
    byte_list clients = client_entry("system", {-1'000'000, -200'000, -300'000, 40'000}, 1, 0, 7);
    for (const byte_list& further :
         {client_entry("gone", {1, 2, 3, 4}, 0, 1, 1),
          client_entry("twelve chars and more", {5, 6, 7, INT32_MIN}, 9, 8, 255)}) {
        clients.insert(clients.end(), further.begin(), further.end());
    }
    sensor.set_command(0x39, [clients](platform::byte_view, byte_list& reply) {
        reply = clients;
        return platform::success;
    });
    put_events(host, name);
    return sensor;
}

namespace {

const std::string summary =
    "Device      : Maker M-1\n"
    "Location    : 'L' alternate=-65536\n"
    "Sample intvl: 10000 us, hw=-250000 decimation=enabled\n"
    "Systck intvl: 125000 us\n"
    "Batching    : sensor=-110000 mux=-120000 ap_batch=-130000 ap_report=-140000 "
    "(-150000 samples in endpoint)\n"
    "Sensor mode : factory\n"
    "Filter      : enabled fixedOdr=disabled\n"
    "Calibrated  : sysconfig\n"
    "Cal matrix  : 1.000000 -0.500000 0.250000 | 0.125000 2.000000 -3.000000 | "
    "0.000015 32767.999985 -32768.000000\n"
    "Cal offset  : 1 -2 2147483647\n"
    "Orient. m.  : 1 -1 0, 0 127 -128, 2 3 4\n"
    "SampleRates : 100.00 200.00 333333.33 \n"
    "StartupTime : -210000\n"
    "intCal      : -220000 [at 100Hz]\n";

const std::map<std::string, std::string, std::less<>> motion_lines{
    {"accel",
     "fsr         : -80000\n"
     "SupportedFSR: 2 70000 -8 \n"
     "bw          : -1\n"
     "SupportedBW : 25 0 \n"},
    {"gyro",
     "range       : -80000\n"
     "SupportedRanges: 2 70000 -8 \n"},
    {"compass",
     "Sensitivity : 1.000000 -0.500000 0.250000 | 0.125000 2.000000 -3.000000 | "
     "0.000015 32767.999985 -32768.000000\n"
     "Compensation: 1.500000 -1.000000 0.000000\n"},
};

const std::string details =
    "Clients     : name                                report    batch threshold timelimit options "
    "power\n"
    "Clients     : system                          : -1000000  -200000   -300000     40000        "
    "     7\n"
    "Clients     : twelve chars                    :        5        6         7 -2147483648       "
    "d   255\n"
    "ExtraInfo   : 10ff\n"
    "ExtraInfo   : ok\n"
    "ExtraInfo   : ffffffff 4294967296\n"
    "ExtraInfo   : \n"
    "data error\n"
    "00000000: 09 41                                             | .A\n"
    "\n"
    "ExtraInfo   : c\n"
    "SensorRegs  : R0f=a0 R10=abc \n"
    "APPerfmon   : cycles: 16777216 allmisse: -1 \n";

}  // namespace

const std::string event_line =
    "APEvents    : 77 [enqueued=75 dropped=2; event_delta=1.500000 dropped_delta=62.000001]\n";

std::string whole_text(std::string_view name, std::int32_t level) {
    std::string text = "Sensor type : " + std::string(name) + "\n" + summary;
    if (const auto own = motion_lines.find(name); own != motion_lines.end()) text += own->second;
    if (level == 2) text += details + event_line;
    return text + "\n\n";
}

std::string too_short(std::size_t needed, std::string_view file) {
    return failure_line("nrxtoollib", "length >= " + std::to_string(needed),
                        "nrxctl/inspection/" + std::string(file));
}

outcome inspect(std::string_view name, std::int32_t level) {
    return capture([&] { nrx::print_sensor_info(name, level); });
}

void sensor_test::expect_changes(std::string_view name, const std::vector<change>& changes) {
    for (const change& one : changes) {
        interface_driver& sensor = put_whole_sensor(host, name);
        sensor.drop_report(one.id);
        if (one.bytes) sensor.set_report(one.id, *one.bytes);
        std::string expected = whole_text(name, 2);
        const std::size_t at = expected.find(one.text);
        ASSERT_NE(at, std::string::npos) << one.text;
        expected.replace(at, one.text.size(), one.changed);
        const outcome result = inspect(name, 2);
        EXPECT_EQ(result.out, expected) << one.id;
        EXPECT_EQ(result.err, one.err) << one.id;
        host.remove(name);
    }
}

}  // namespace tests
