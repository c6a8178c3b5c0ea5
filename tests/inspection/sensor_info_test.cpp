#include "nrxctl/inspection/sensor_info.h"

#include <array>
#include <utility>

#include "platform/virtual/current_machine.h"
#include "platform/virtual/wrist_device.h"
#include "tests/inspection/sensor_host.h"

namespace tests {

using sensor_info = sensor_test;

TEST_F(sensor_info, sensors_of_every_kind_that_answer_everything) {
    for (const char* name : {"accel", "gyro", "compass", "pressure", "Accel", "accel2", "acce"}) {
        put_whole_sensor(host, name);
        for (const std::int32_t level : {1, 2}) {
            const outcome result = inspect(name, level);
            EXPECT_EQ(result.out, whole_text(name, level));
            EXPECT_EQ(result.err, "");
        }
    }
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
    EXPECT_EQ(inspect("als", 1).out, summary + "\n\n");
    const outcome result = inspect("als", 2);
    EXPECT_EQ(result.out, summary +
                              "ExtraInfo   : \n"
                              "ExtraInfo   : \n"
                              "ExtraInfo   : \n"
                              "ExtraInfo   : \n"
                              "SensorRegs  : <not supperted>\n"
                              "APPerfmon   : perfmon is not supported\n\n\n");
    EXPECT_EQ(result.err,
              failure_line("nrxtoollib", "child", "nrxctl/inspection/event_statistics.cpp"));
}

TEST_F(sensor_info, only_level_2_asks_for_more_than_the_properties_and_all_are_asked_in_order) {
    put_whole_sensor(host, "accel");
    const auto calls_for = [&](std::string_view name, std::int32_t level) {
        const auto before = static_cast<std::ptrdiff_t>(logged("call").size());
        inspect(name, level);
        const auto all = logged("call");
        return std::vector<std::string>(all.begin() + before, all.end());
    };
    std::vector<std::string> calls;
    const auto expect = [&](const std::string& selector, const std::string& scalar, int room) {
        calls.push_back("call accel " + selector + " scalars [0x" + scalar +
                        "] in [] results 0 room " + std::to_string(room));
    };
    for (const auto& [id, room] : std::to_array<std::pair<const char*, int>>(
             {{"0", 4},   {"33", 4}, {"40", 4},   {"22", 4}, {"23", 4},  {"24", 4},
              {"43", 20}, {"a", 4},  {"d", 4},    {"f", 32}, {"10", 32}, {"b", 36},
              {"1a", 12}, {"18", 9}, {"3f", 128}, {"2d", 4}, {"19", 4},  {"3d", 4},
              {"44", 5},  {"6", 4},  {"36", 128}, {"4", 4},  {"37", 128}})) {
        expect("2", id, room);
    }
    for (const std::int32_t level : {1, 0, 3, -2, INT32_MAX})
        EXPECT_EQ(calls_for("accel", level), calls) << level;
    expect("3", "39", 496);
    for (const char* id : {"39", "3a", "3b", "3c", "38"})
        expect("2", id, 1024);
    expect("2", "26", 4);
    expect("2", "31", 256);
    EXPECT_EQ(calls_for("accel", 2), calls);
    // Under its id the sensor is no motion sensor.
    EXPECT_EQ(calls_for("31", 2).size(), calls.size() - 4);
}

TEST_F(sensor_info, without_an_interval_nothing_but_the_reason_is_told) {
    put_whole_sensor(host, "accel").drop_report(0x00);
    const outcome refused = inspect("accel", 2);
    EXPECT_EQ(refused.out, "sensor accel doesn't provide sensor info (kr=e00002c7)\n\n");
    EXPECT_EQ(refused.err, "");
    EXPECT_EQ(logged("call").size(), 1U);
    // A reply that says "not found" is as good as no service.
    host.fail_call(4, failure::not_found);
    const std::string gone = inspect("accel", 1).out;
    EXPECT_TRUE(
        gone.starts_with("sensor accel doesn't provide sensor info (kr=e00002f0)\n\n"
                         "Available HID services: \n"
                         "Matching WQR_accel [0x"))
        << gone;
}

TEST(wrist_device_sensors, have_a_whole_text_each_without_any_failure) {
    const auto device = platform::simulated::make_wrist_device();
    const platform::simulated::installed_machine installed(*device);
    for (const char* name : {"accel", "gyro", "compass", "pressure", "als", "temperature"}) {
        const outcome result = inspect(name, 2);
        EXPECT_EQ(result.err, "") << name;
        EXPECT_TRUE(result.out.starts_with(std::string("Sensor type : ") + name + "\n"));
        EXPECT_EQ(result.out.find("data error"), std::string::npos) << name;
        EXPECT_NE(result.out.find("\nAPEvents    : "), std::string::npos) << name;
        if (std::string_view("accel gyro compass").find(name) == std::string_view::npos) continue;
        for (const char* line : {"\nCal matrix  : ", "\nCal offset  : ", "\nOrient. m.  : "})
            EXPECT_NE(result.out.find(line), std::string::npos) << name;
        for (const char* unread : {"N/A", "not supp", "Device      :  ", "FSR: \n", "BW : \n"})
            EXPECT_EQ(result.out.find(unread), std::string::npos) << name << unread;
    }
    EXPECT_EQ(device->open_handles(), 0U);
}

}  // namespace tests
