#include "nrxctl/inspection/motion_sensor.h"

#include "tests/inspection/sensor_host.h"

namespace tests {

using motion_sensor = device_test;

struct motion_line {
    std::uint32_t id;  // its report
    std::string whole;
    std::string unread;
};

struct motion_case {
    std::string name;
    std::vector<motion_line> lines;
};

const std::vector<motion_case> motion_sensors{
    {"accel",
     {{0x06, "fsr         : 8\n", "fsr         : \n"},
      {0x36, "SupportedFSR: 2 4 -8 \n", "SupportedFSR: \n"},
      {0x04, "bw          : 50\n", "bw          : \n"},
      {0x37, "SupportedBW : 25 0 \n", "SupportedBW : \n"}}},
    {"gyro",
     {{0x06, "range       : 8\n", "range       : \n"},
      {0x36, "SupportedRanges: 2 4 -8 \n", "SupportedRanges: \n"}}},
    {"compass",
     {{0x1d,
       "Sensitivity : 1.000000 -0.500000 0.250000 | 0.125000 2.000000 -3.000000 | "
       "0.000015 32767.999985 -32768.000000\n",
       "Sensitivity : N/A\n"},
      {0xd6, "Compensation: 1.500000 -1.000000 0.000000\n", "Compensation: N/A\n"}}},
};

TEST_F(motion_sensor, has_lines_of_its_own_between_the_properties_and_the_details) {
    for (const motion_case& one : motion_sensors) {
        put_whole_sensor(host, one.name);
        std::string lines = "Sensor type : " + one.name + "\n" + whole_summary;
        for (const motion_line& line : one.lines)
            lines += line.whole;
        EXPECT_EQ(inspect(one.name).out, lines + "\n\n");
        EXPECT_EQ(inspect(one.name, 2).out, lines + whole_details + "\n\n");
    }
}

TEST_F(motion_sensor, shows_each_report_that_is_not_read_as_such) {
    for (const motion_case& one : motion_sensors) {
        for (const motion_line& missing : one.lines) {
            interface_driver& sensor = put_whole_sensor(host, one.name);
            sensor.drop_report(missing.id);
            std::string lines;
            for (const motion_line& line : one.lines)
                lines += line.id == missing.id ? line.unread : line.whole;
            const outcome result = capture([&] { nrx::print_motion_sensor(one.name); });
            EXPECT_EQ(result.out, lines);
            EXPECT_EQ(result.err, "");
            host.remove(one.name);
        }
    }
}

TEST_F(motion_sensor, an_accelerometer_without_a_bandwidth_of_its_own_chooses_it) {
    put_whole_sensor(host, "accel").set_report(0x04, words({0}));
    const std::string text = inspect("accel").out;
    EXPECT_NE(text.find("-8 \nbw          : auto\nSupportedBW "), std::string::npos) << text;
}

TEST_F(motion_sensor, is_known_by_its_exact_name) {
    for (const char* name : {"Accel", "accel2", "acce", "31", ""})
        EXPECT_EQ(capture([&] { nrx::print_motion_sensor(name); }).out, "") << name;
}

}  // namespace tests
