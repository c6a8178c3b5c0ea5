// Replies cut off at every length. What is read of them stands in an allocation of its own size, so
// that a byte read beyond it is a sanitizer's find.
#include <algorithm>
#include <map>

#include "tests/inspection/sensor_host.h"

namespace tests {

using short_replies = device_test;

byte_list first_bytes(const byte_list& whole, std::size_t length) {
    return {whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length)};
}

std::ptrdiff_t count_lines(const std::string& text) {
    return std::count(text.begin(), text.end(), '\n');
}

// Reports of a fixed size.
const std::map<std::uint32_t, std::size_t> fixed_sizes{
    {0x00, 4}, {0x33, 4}, {0x40, 4},  {0x22, 4},  {0x23, 4},  {0x24, 4},  {0x43, 20},
    {0x0a, 4}, {0x0d, 4}, {0x0b, 36}, {0x1a, 12}, {0x18, 9},  {0x2d, 4},  {0x19, 4},
    {0x3d, 4}, {0x44, 5}, {0x06, 4},  {0x04, 4},  {0x1d, 36}, {0xd6, 12}, {0x26, 4}};

// Texts and lists are as long as they are.
const std::vector<std::uint32_t> open_ended{0x0f, 0x10, 0x3f, 0x36, 0x37};

TEST_F(short_replies, leave_every_line_in_its_place_and_are_reported_once) {
    for (const char* name : {"accel", "compass"}) {
        interface_driver& sensor = put_whole_sensor(host, name);
        sensor.set_report(0x3c, {});
        const auto lines = count_lines(inspect(name, 2).out);
        for (const auto& [id, size] : fixed_sizes) {
            const bool is_of_accel = id == 0x06 || id == 0x04;
            const bool is_of_compass = id == 0x1d || id == 0xd6;
            const bool is_read = name[0] == 'a' ? !is_of_compass : !is_of_accel;
            const byte_list whole = *sensor.report(id);
            ASSERT_EQ(whole.size(), size) << id;
            for (std::size_t length = 0; length < size; ++length) {
                sensor.set_report(id, first_bytes(whole, length));
                const outcome result = inspect(name, 2);
                EXPECT_EQ(result.err, is_read ? too_short(size) : "") << id << " " << length;
                EXPECT_EQ(count_lines(result.out), lines) << id << " " << length;
            }
            sensor.set_report(id, whole);
        }
        host.remove(name);
    }
}

TEST_F(short_replies, of_texts_and_lists_lack_nothing) {
    interface_driver& sensor = put_whole_sensor(host, "accel");
    const auto lines = count_lines(inspect("accel").out);
    for (const std::uint32_t id : open_ended) {
        const byte_list whole = *sensor.report(id);
        for (std::size_t length = 0; length < whole.size(); ++length) {
            sensor.set_report(id, first_bytes(whole, length));
            const outcome result = inspect("accel");
            EXPECT_EQ(result.err, "") << id << " " << length;
            EXPECT_EQ(count_lines(result.out), lines) << id << " " << length;
        }
        sensor.set_report(id, whole);
    }
    sensor.set_report(0x36, {2, 0, 0, 0, 4, 0, 0});
    sensor.set_report(0x3f, {0x10, 0x27, 0, 0, 1});
    const std::string text = inspect("accel").out;
    EXPECT_NE(text.find("\nSampleRates : 100.00 \n"), std::string::npos);
    EXPECT_NE(text.find("\nSupportedFSR: 2 \n"), std::string::npos);
}

TEST_F(short_replies, read_as_0_where_they_end) {
    interface_driver& sensor = put_whole_sensor(host, "sensor");
    struct cut_row {
        std::uint32_t id;
        std::size_t length;
        std::string line;
    };
    for (const cut_row& row : {
             cut_row{0x00, 3, "\nSample intvl: 0 us, hw=2500 decimation=enabled\n"},
             cut_row{0x33, 0, " us, hw=0 "},
             cut_row{0x40, 3, "\nSystck intvl: 0 us\n"},
             cut_row{0x43, 11, "sensor=11 mux=12 ap_batch=0 ap_report=0 (0 samples"},
             cut_row{0x1a, 4, "\nCal offset  : 1 0 0\n"},
             cut_row{0x18, 4, "\nOrient. m.  : 1 -1 0, 0 0 0, 0 0 0\n"},
             cut_row{0x0b, 19, " | 0.125000 0.000000 0.000000 | 0.000000 0.000000 0.000000\n"},
             cut_row{0x44, 4, "'L' alternate=0\n"},
         }) {
        const byte_list whole = *sensor.report(row.id);
        sensor.set_report(row.id, first_bytes(whole, row.length));
        const std::string text = inspect("sensor").out;
        EXPECT_NE(text.find(row.line), std::string::npos) << row.line << text;
        sensor.set_report(row.id, whole);
    }
}

// Every labelled line ends, wherever a block ends.
TEST_F(short_replies, of_extra_information_end_their_line) {
    interface_driver& sensor = put_whole_sensor(host, "sensor");
    const std::string_view after = "\nSensorRegs  : R0f=a0 R10=abc \nAPPerfmon   : ";
    for (const std::uint32_t id : {0x39U, 0x3aU, 0x3cU}) {
        const byte_list whole = *sensor.report(id);
        for (std::size_t length = 0; length < whole.size(); ++length) {
            sensor.set_report(id, first_bytes(whole, length));
            const outcome result = inspect("sensor", 2);
            EXPECT_NE(result.out.find(after), std::string::npos) << id << " " << length;
            EXPECT_LE(count_lines(result.err), 1) << id << " " << length;
        }
        sensor.set_report(id, whole);
    }
}

}  // namespace tests
