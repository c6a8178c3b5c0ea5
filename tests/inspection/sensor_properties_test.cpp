// The properties of a whole sensor, one changed at a time. What is read of a reply stands in an
// allocation of its own size, so that a byte read beyond it is a sanitizer's find.
#include <algorithm>

#include "tests/inspection/sensor_host.h"

namespace tests {

using sensor_properties = sensor_test;

const std::string matrix =
    "1.000000 -0.500000 0.250000 | 0.125000 2.000000 -3.000000 | "
    "0.000015 32767.999985 -32768.000000";
const std::string batching =
    "sensor=-110000 mux=-120000 ap_batch=-130000 ap_report=-140000 (-150000 samples in endpoint)";
const std::string not_batching = "sensor=0 mux=0 ap_batch=0 ap_report=0 (0 samples in endpoint)";
const std::string orientation = "Orient. m.  : 1 -1 0, 0 127 -128, 2 3 4\n";
const std::string rates = "100.00 200.00 333333.33 ";

TEST_F(sensor_properties, that_are_not_read_show_a_failure_value_or_have_no_line) {
    for (const char* name : {"accel", "gyro", "compass"}) {
        expect_changes(name, {
                                 {0x33, {}, "hw=-250000", "hw=-1"},
                                 {0x40, {}, "125000 us", "sensor is not systick source"},
                                 {0x22, {}, "enabled fixedOdr", "disabled fixedOdr"},
                                 {0x23, {}, "fixedOdr=disabled", "fixedOdr=disabled"},
                                 {0x24, {}, "decimation=enabled", "decimation=disabled"},
                                 {0x43, {}, batching, not_batching},
                                 {0x0a, {}, "factory", "factory"},
                                 {0x0d, {}, "factory", "normal"},
                                 {0x0f, {}, "Maker M-1", " M-1"},
                                 {0x10, {}, "Maker M-1", "Maker "},
                                 {0x0b, {}, "Cal matrix  : " + matrix + "\n", ""},
                                 {0x1a, {}, "Cal offset  : 1 -2 2147483647\n", ""},
                                 {0x18, {}, orientation, ""},
                                 {0x3f, {}, rates, ""},
                                 {0x2d, {}, "-210000", "0"},
                                 {0x19, {}, "-220000", "0"},
                                 {0x3d, {}, "sysconfig", "uncalibrated"},
                                 {0x44, {}, "'L' alternate=-65536", "N/A"},
                             });
    }
    expect_changes("accel", {
                                {0x06, {}, "fsr         : -80000", "fsr         : "},
                                {0x36, {}, "2 70000 -8 ", ""},
                                {0x04, {}, "bw          : -1", "bw          : "},
                                {0x37, {}, "25 0 ", ""},
                            });
    expect_changes("gyro", {{0x06, {}, "range       : -80000", "range       : "},
                            {0x36, {}, "2 70000 -8 ", ""}});
    expect_changes("compass", {{0x1d, {}, "Sensitivity : " + matrix, "Sensitivity : N/A"},
                               {0xd6, {}, "1.500000 -1.000000 0.000000", "N/A"}});
}

TEST_F(sensor_properties, at_their_bounds) {
    const std::string thirty_two = "0123456789abcdef0123456789ABCDEF";
    const std::string interval = "10000 us, hw=-250000 decimation=enabled";
    expect_changes(
        "accel",
        {
            {0x00, words({0xffffffff}), interval, "unsupported"},
            {0x00, words({INT32_MIN}), "10000 us", "-2147483648 us"},
            {0x40, words({-2}), "125000 us", "-2 us"},
            {0x40, words({-1}), "125000 us", "sensor is not systick source"},
            {0x40, words({0}), "125000 us", "0 us"},
            {0x23, words({INT32_MIN}), "fixedOdr=disabled", "fixedOdr=enabled"},
            {0x0a, words({INT32_MIN}), "factory", "raw"},
            {0x0f, bytes_of(thirty_two), "Maker", thirty_two},
            {0x10, bytes_of("unended"), "M-1", "unended"},
            {0x3f, words({0, 0xffffffff, 1}), rates, "inf 0.00 1000000.00 "},
            {0x3f, words({8'000'000, 64'000'000}), rates, "0.12 0.02 "},
            {0x3d, words({0}), "sysconfig", "uncalibrated"},
            {0x3d, words({1}), "sysconfig", "default"},
            {0x3d, words({3}), "sysconfig", "3"},
            {0x3d, words({-1}), "sysconfig", "-1"},
            {0x44, byte_list{0, 1, 2, 3, 4}, "'L' alternate=-65536", "N/A"},
            {0x44, byte_list{0xe9, 1, 0, 0, 0}, "'L' alternate=-65536", "'\xe9' alternate=1"},
            {0x04, words({0}), "bw          : -1", "bw          : auto"},
            {0x04, words({0x1000000}), "bw          : -1", "bw          : 16777216"},
        });
}

TEST_F(sensor_properties, read_as_0_where_their_reply_ends) {
    expect_changes(
        "accel",
        {
            {0x00, byte_list{1, 2, 3}, "10000 us", "0 us", too_short(4)},
            {0x33, byte_list{}, "hw=-250000", "hw=0", too_short(4)},
            {0x40, byte_list{1, 2, 3}, "125000 us", "0 us", too_short(4)},
            {0x43, byte_list{11, 0, 0, 0, 12, 0, 0, 0, 1, 1, 1}, batching,
             "sensor=11 mux=12 ap_batch=0 ap_report=0 (0 samples in endpoint)", too_short(20)},
            {0x1a, words({1}), "1 -2 2147483647", "1 0 0", too_short(12)},
            {0x18, byte_list{1, 0xff, 0, 0}, orientation, "Orient. m.  : 1 -1 0, 0 0 0, 0 0 0\n",
             too_short(9)},
            {0x0b, byte_list{0, 0, 1, 0, 1, 1, 1}, matrix,
             "1.000000 0.000000 0.000000 | 0.000000 0.000000 0.000000 | "
             "0.000000 0.000000 0.000000",
             too_short(36)},
            {0x44, byte_list{'L', 0, 0, 0xff}, "alternate=-65536", "alternate=0", too_short(5)},
            {0x3f, byte_list{0x10, 0x27, 0, 0, 1}, rates, "100.00 "},
            {0x36, byte_list{2, 0, 0, 0, 4, 0, 0}, "2 70000 -8 ", "2 "},
        });
}

TEST_F(sensor_properties, cut_anywhere_leave_each_line_in_its_place_and_are_reported_once) {
    struct cut_row {
        const char* name;
        std::vector<std::uint32_t> ids;
        bool is_of_fixed_size;
    };
    const auto count_lines = [](const std::string& text) {
        return std::count(text.begin(), text.end(), '\n');
    };
    for (const auto& [name, ids, is_of_fixed_size] :
         {cut_row{"accel",
                  {0x00, 0x33, 0x40, 0x22, 0x23, 0x24, 0x43, 0x0a, 0x0d, 0x0b, 0x1a, 0x18, 0x2d,
                   0x19, 0x3d, 0x44, 0x06, 0x04, 0x26},
                  true},
          cut_row{"compass", {0x1d, 0xd6}, true},
          cut_row{"accel", {0x0f, 0x10, 0x3f, 0x36, 0x37}, false}}) {
        interface_driver& sensor = put_whole_sensor(host, name);
        const auto lines = count_lines(whole_text(name, 2));
        for (const std::uint32_t id : ids) {
            const byte_list whole = *sensor.report(id);
            const std::string reported = is_of_fixed_size ? too_short(whole.size()) : "";
            for (std::size_t length = 0; length < whole.size(); ++length) {
                sensor.set_report(id, first_bytes(whole, length));
                const outcome result = inspect(name, 2);
                EXPECT_EQ(result.err, reported) << id << " " << length;
                EXPECT_EQ(count_lines(result.out), lines) << id << " " << length;
            }
            sensor.set_report(id, whole);
        }
        host.remove(name);
    }
}

}  // namespace tests
