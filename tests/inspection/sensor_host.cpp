#include "tests/inspection/sensor_host.h"

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

void set_clients(interface_driver& sensor, const byte_list& entries) {
    sensor.set_command(0x39, [entries](platform::byte_view payload, byte_list& reply) {
        if (!payload.empty()) return platform::bad_argument;
        reply = entries;
        return platform::success;
    });
}

const std::vector<std::uint32_t>& property_ids() {
    static const std::vector<std::uint32_t> ids{0x00, 0x33, 0x40, 0x22, 0x23, 0x24, 0x43,
                                                0x0a, 0x0d, 0x0f, 0x10, 0x0b, 0x1a, 0x18,
                                                0x3f, 0x2d, 0x19, 0x3d, 0x44};
    return ids;
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
             row{0x33, words({2'500})},
             row{0x40, words({1'250})},
             row{0x22, words({1})},
             row{0x23, words({0})},
             row{0x24, words({0x100})},
             row{0x43, words({11, 12, 13, 14, -15})},
             row{0x0a, words({0})},
             row{0x0d, words({0x80})},
             row{0x0f, bytes_of("Maker\0rest"sv)},
             row{0x10, bytes_of("M-1\0rest"sv)},
             row{0x0b, matrix},
             row{0x1a, words({1, -2, INT32_MAX})},
             row{0x18, {1, 0xff, 0, 0, 127, 128, 2, 3, 4}},
             row{0x3f, words({10'000, 5'000, 3})},
             row{0x2d, words({21})},
             row{0x19, words({-22})},
             row{0x3d, words({2})},
             row{0x44, {'L', 0xf9, 0xff, 0xff, 0xff}},
             row{0x06, words({8})},
             row{0x36, words({2, 4, -8})},
             row{0x04, words({50})},
             row{0x37, words({25, 0})},
             row{0x1d, matrix},
             row{0xd6, words({0x18000, -0x10000, 0})},
             row{0x39, bytes_of("\4\0\xff\0\0\0\3\2ok\0"sv)},
             row{0x3a, bytes_of("\0\xff\xff\xff\xff\5\2 \0\1\0\0\0\0\1\0\0\0"sv)},
             row{0x3b, {}},
             row{0x3c, {9, 'A'}},
             row{0x38, bytes_of("\2\0\0\0\x0f\0\xa0\0\x10\0\xbc\x0a"sv)},
             row{0x26, words({2})},
             row{0x31, bytes_of("\2\0\0\0"
                                "cycles\0x\x2a\0\0\0............"
                                "allmisse\xff\xff\xff\xff............"sv)},
         }) {
        sensor.set_report(report.id, report.bytes);
    }
    byte_list clients = client_entry("system", {10'000, 20'000, -3, 40'000}, 1, 0, 7);
    for (const byte_list& further :
         {client_entry("gone", {1, 2, 3, 4}, 0, 1, 1),
          client_entry("twelve chars and more", {5, 6, 7, INT32_MIN}, 9, 8, 255)}) {
        clients.insert(clients.end(), further.begin(), further.end());
    }
    clients.resize(93);
    set_clients(sensor, clients);
    put_events(host, name);
    return sensor;
}

const std::string whole_summary =
    "Device      : Maker M-1\n"
    "Location    : 'L' alternate=-7\n"
    "Sample intvl: 10000 us, hw=2500 decimation=enabled\n"
    "Systck intvl: 1250 us\n"
    "Batching    : sensor=11 mux=12 ap_batch=13 ap_report=14 (-15 samples in endpoint)\n"
    "Sensor mode : factory\n"
    "Filter      : enabled fixedOdr=disabled\n"
    "Calibrated  : sysconfig\n"
    "Cal matrix  : 1.000000 -0.500000 0.250000 | 0.125000 2.000000 -3.000000 | "
    "0.000015 32767.999985 -32768.000000\n"
    "Cal offset  : 1 -2 2147483647\n"
    "Orient. m.  : 1 -1 0, 0 127 -128, 2 3 4\n"
    "SampleRates : 100.00 200.00 333333.33 \n"
    "StartupTime : 21\n"
    "intCal      : -22 [at 100Hz]\n";

const std::string whole_details =
    "Clients     : name                                report    batch threshold timelimit options "
    "power\n"
    "Clients     : system                          :    10000    20000        -3     40000        "
    "     7\n"
    "Clients     : twelve chars                    :        5        6         7 -2147483648       "
    "d   255\n"
    "ExtraInfo   : ff\n"
    "ExtraInfo   : ok\n"
    "ExtraInfo   : ffffffff 4294967296\n"
    "ExtraInfo   : \n"
    "ExtraInfo   : \n"
    "data error\n"
    "00000000: 09 41                                             | .A\n"
    "\n"
    "SensorRegs  : R0f=a0 R10=abc \n"
    "APPerfmon   : cycles: 42 allmisse: -1 \n"
    "APEvents    : 77 [enqueued=75 dropped=2; event_delta=1.500000 dropped_delta=62.000001]\n";

std::string too_short(std::size_t needed, std::string_view file) {
    return failure_line("nrxtoollib", "length >= " + std::to_string(needed),
                        "nrxctl/inspection/" + std::string(file));
}

outcome inspect(std::string_view name, std::int32_t level) {
    return capture([&] { nrx::print_sensor_info(name, level); });
}

}  // namespace tests
