#include "nrxctl/inspection/sensor_info.h"

#include <cstdio>
#include <optional>

#include "platform/virtual/wrist_device.h"
#include "tests/inspection/sensor_host.h"

namespace tests {

using sensor_info = device_test;

TEST_F(sensor_info, a_sensor_that_answers_everything_at_both_levels) {
    put_whole_sensor(host, "pressure");
    const outcome summary = inspect("pressure");
    EXPECT_EQ(summary.out, "Sensor type : pressure\n" + whole_summary + "\n\n");
    EXPECT_EQ(summary.err, "");
    const outcome detailed = inspect("pressure", 2);
    EXPECT_EQ(detailed.out, "Sensor type : pressure\n" + whole_summary + whole_details + "\n\n");
    EXPECT_EQ(detailed.err, "");
}

TEST_F(sensor_info, a_sensor_that_answers_its_interval_alone) {
    put_service(host, "als", 1).set_report(0, words({20'000}));
    const std::string summary =
        "Sensor type : als\n"
        "Device      :  \n"
        "Location    : N/A\n"
        "Sample intvl: 20000 us, hw=-1 decimation=disabled\n"
        "Systck intvl: sensor is not systick source\n"
        "Batching    : sensor=0 mux=0 ap_batch=0 ap_report=0 (0 samples in endpoint)\n"
        "Sensor mode : normal\n"
        "Filter      : disabled fixedOdr=disabled\n"
        "Calibrated  : uncalibrated\n"
        "SampleRates : \n"
        "StartupTime : 0\n"
        "intCal      : 0 [at 100Hz]\n";
    EXPECT_EQ(inspect("als").out, summary + "\n\n");
    EXPECT_EQ(inspect("als").err, "");
    const outcome detailed = inspect("als", 2);
    EXPECT_EQ(detailed.out, summary +
                                "ExtraInfo   : \n"
                                "ExtraInfo   : \n"
                                "ExtraInfo   : \n"
                                "ExtraInfo   : \n"
                                "SensorRegs  : <not supperted>\n"
                                "APPerfmon   : perfmon is not supported\n\n\n");
    EXPECT_EQ(detailed.err,
              failure_line("nrxtoollib", "child", "nrxctl/inspection/event_statistics.cpp"));
}

TEST_F(sensor_info, only_level_2_asks_for_more_than_the_properties_and_all_are_asked_in_order) {
    put_whole_sensor(host, "accel");
    const auto report_call = [](std::uint32_t id, std::size_t room) {
        char text[80];
        std::snprintf(text, sizeof(text), "call accel 2 scalars [0x%x] in [] results 0 room %zu",
                      id, room);
        return std::string(text);
    };
    const std::vector<std::size_t> rooms{4,  4,  4,  4, 4,   4, 20, 4, 4, 32,
                                         32, 36, 12, 9, 128, 4, 4,  4, 5};
    std::vector<std::string> calls;
    for (std::size_t i = 0; i < rooms.size(); ++i)
        calls.push_back(report_call(property_ids()[i], rooms[i]));
    calls.insert(calls.end(), {report_call(0x06, 4), report_call(0x36, 128), report_call(0x04, 4),
                               report_call(0x37, 128)});
    for (const std::int32_t level : {1, 0, 3, -2, INT32_MAX}) {
        const std::size_t before = logged("call").size();
        inspect("accel", level);
        const auto all = logged("call");
        EXPECT_EQ(
            std::vector<std::string>(all.begin() + static_cast<std::ptrdiff_t>(before), all.end()),
            calls)
            << level;
    }
    calls.emplace_back("call accel 3 scalars [0x39] in [] results 0 room 496");
    for (const std::uint32_t id : {0x39U, 0x3aU, 0x3bU, 0x3cU, 0x38U})
        calls.push_back(report_call(id, 1024));
    calls.push_back(report_call(0x26, 4));
    calls.push_back(report_call(0x31, 256));
    const std::size_t before = logged("call").size();
    inspect("31", 2);
    inspect("accel", 2);
    const auto all = logged("call");
    // Under its id the sensor is no motion sensor: four calls less.
    EXPECT_EQ(all.size(), before + 2 * calls.size() - 4);
    EXPECT_EQ(
        std::vector<std::string>(all.end() - static_cast<std::ptrdiff_t>(calls.size()), all.end()),
        calls);
}

// A report, what it is given (nothing: it is taken away), and which line becomes which.
struct change {
    std::uint32_t id;
    std::optional<byte_list> bytes;
    std::string line;
    std::string changed;
};

void expect_changes(machine& host, const std::vector<change>& changes) {
    for (const change& one : changes) {
        interface_driver& sensor = put_whole_sensor(host, "sensor");
        sensor.drop_report(one.id);
        if (one.bytes) sensor.set_report(one.id, *one.bytes);
        std::string expected = "Sensor type : sensor\n" + whole_summary + "\n\n";
        const std::size_t at = expected.find(one.line);
        ASSERT_NE(at, std::string::npos) << one.line;
        expected.replace(at, one.line.size(), one.changed);
        const outcome result = inspect("sensor");
        EXPECT_EQ(result.out, expected) << one.id;
        EXPECT_EQ(result.err, "") << one.id;
        host.remove("sensor");
    }
}

TEST_F(sensor_info, a_property_that_is_not_read_shows_its_failure_value_or_has_no_line) {
    const std::string batching =
        "sensor=11 mux=12 ap_batch=13 ap_report=14 (-15 samples in endpoint)";
    const std::size_t matrix = whole_summary.find("Cal matrix");
    const std::size_t offset = whole_summary.find("Cal offset");
    expect_changes(
        host,
        {
            {0x33, {}, "hw=2500", "hw=-1"},
            {0x40, {}, "1250 us", "sensor is not systick source"},
            {0x22, {}, ": enabled fixed", ": disabled fixed"},
            {0x24, {}, "decimation=enabled", "decimation=disabled"},
            {0x43, {}, batching, "sensor=0 mux=0 ap_batch=0 ap_report=0 (0 samples in endpoint)"},
            {0x0d, {}, "factory", "normal"},
            {0x0f, {}, "Maker M-1", " M-1"},
            {0x10, {}, "Maker M-1", "Maker "},
            {0x0b, {}, whole_summary.substr(matrix, offset - matrix), ""},
            {0x1a, {}, "Cal offset  : 1 -2 2147483647\n", ""},
            {0x18, {}, "Orient. m.  : 1 -1 0, 0 127 -128, 2 3 4\n", ""},
            {0x3f, {}, "100.00 200.00 333333.33 ", ""},
            {0x2d, {}, "StartupTime : 21", "StartupTime : 0"},
            {0x19, {}, "intCal      : -22", "intCal      : 0"},
            {0x3d, {}, "sysconfig", "uncalibrated"},
            {0x44, {}, "'L' alternate=-7", "N/A"},
        });
}

TEST_F(sensor_info, values_at_their_bounds) {
    const std::string thirty_two = "0123456789abcdef0123456789ABCDEF";
    const std::string interval = "10000 us, hw=2500 decimation=enabled";
    expect_changes(
        host, {
                  {0x00, words({0xffffffff}), interval, "unsupported"},
                  {0x00, words({INT32_MIN}), "10000 us", "-2147483648 us"},
                  {0x40, words({-2}), "1250 us", "-2 us"},
                  {0x40, words({-1}), "1250 us", "sensor is not systick source"},
                  {0x40, words({0}), "1250 us", "0 us"},
                  {0x23, words({INT32_MIN}), "fixedOdr=disabled", "fixedOdr=enabled"},
                  {0x0a, words({1}), "factory", "raw"},
                  {0x0f, bytes_of(thirty_two), "Maker", thirty_two},
                  {0x10, bytes_of("unended"), "M-1", "unended"},
                  {0x0f, {}, "Maker", ""},
                  {0x3f, words({0}), "100.00 200.00 333333.33", "inf"},
                  {0x3f, words({0xffffffff, 1}), "100.00 200.00 333333.33", "0.00 1000000.00"},
                  {0x3f, byte_list{}, "100.00 200.00 333333.33 ", ""},
                  {0x3d, words({0}), "sysconfig", "uncalibrated"},
                  {0x3d, words({1}), "sysconfig", "default"},
                  {0x3d, words({3}), "sysconfig", "3"},
                  {0x3d, words({-1}), "sysconfig", "-1"},
                  {0x44, byte_list{0, 1, 2, 3, 4}, "'L' alternate=-7", "N/A"},
                  {0x44, byte_list{0xe9, 1, 0, 0, 0}, "'L' alternate=-7", "'\xe9' alternate=1"},
              });
}

TEST_F(sensor_info, without_an_interval_nothing_but_the_reason_is_told) {
    interface_driver& sensor = put_whole_sensor(host, "accel");
    sensor.drop_report(0x00);
    const outcome refused = inspect("accel", 2);
    EXPECT_EQ(refused.out, "sensor accel doesn't provide sensor info (kr=e00002c7)\n\n");
    EXPECT_EQ(refused.err, "");
    EXPECT_EQ(logged("call").size(), 1U);
    // A reply that says "not found" is as good as no service.
    host.fail_call(4, failure::not_found);
    const outcome gone = inspect("accel");
    EXPECT_TRUE(
        gone.out.starts_with("sensor accel doesn't provide sensor info (kr=e00002f0)\n\n"
                             "Available HID services: \n"
                             "Matching WQR_accel [0x"))
        << gone.out;
}

TEST(wrist_device_sensors, have_a_summary_each_without_any_failure) {
    const auto device = platform::simulated::make_wrist_device();
    const platform::simulated::installed_machine installed(*device);
    for (const char* name : {"accel", "gyro", "compass", "pressure", "als", "temperature"}) {
        const outcome result = inspect(name, 2);
        EXPECT_EQ(result.err, "") << name;
        EXPECT_TRUE(result.out.starts_with(std::string("Sensor type : ") + name + "\n"));
        for (const char* line : {"\nCal matrix  : ", "\nCal offset  : ", "\nOrient. m.  : "}) {
            const bool is_motion_sensor =
                std::string_view("accel gyro compass").find(name) != std::string_view::npos;
            EXPECT_EQ(result.out.find(line) != std::string::npos, is_motion_sensor) << name;
        }
        EXPECT_EQ(result.out.find("data error"), std::string::npos) << name;
        EXPECT_NE(result.out.find("\nAPEvents    : "), std::string::npos) << name;
    }
    EXPECT_EQ(device->open_handles(), 0U);
}

}  // namespace tests
