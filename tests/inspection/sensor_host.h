// A host with sensors, for the tests of sensor inspection.
#pragma once

#include <cstdint>
#include <functional>
#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "nrxctl/inspection/sensor_info.h"
#include "tests/support/device_test.h"

namespace tests {

// Standard output, then standard error.
inline std::string output_of(const std::function<void()>& operation) {
    const outcome result = capture(operation);
    return result.out + result.err;
}

// Little-endian 32-bit numbers.
byte_list numbers(std::initializer_list<std::int64_t> values);

// The bytes of a text, NULs included.
inline byte_list bytes_of(std::string_view text) {
    return {text.begin(), text.end()};
}

// A prefix in an allocation of its own size, so that a sanitizer finds a read beyond it.
inline byte_list prefix(const byte_list& bytes, std::size_t length) {
    return {bytes.begin(), bytes.begin() + static_cast<std::ptrdiff_t>(length)};
}

// Three entries of a client table. The second one is not in use.
byte_list client_entries();

// Adds a sensor with service id 31 that replies to every request. Below it are the entries "first"
// to "fourth" with its event statistics.
interface_driver& add_sensor(machine& host, std::string_view name);

// Adds HID interfaces with these names.
void add_hid_interfaces(machine& host, std::initializer_list<const char*> names);

// What that sensor prints.
std::string sensor_text(std::string_view name, std::int32_t level);

// Replies of fixed and of variable length, and those that have a structure of their own.
enum class reply_kind { fixed, variable, structured };

// A report of that sensor, what is printed of it, and what is printed instead if it is missing.
struct report_row {
    std::uint32_t id;
    reply_kind kind;
    byte_list reply;
    std::string text;
    std::string missing_text;
};

// The reports that the sensor with that name is asked for.
std::vector<report_row> reports_of(std::string_view name);

inline std::string inspect(std::string_view name, std::int32_t level) {
    return output_of([&] { nrx::print_sensor_info(name, level); });
}

// The failure report about a reply shorter than required.
std::string length_report(std::size_t required, const char* file = source_file::sensor_reports);

// A sensor one of whose reports has another reply, or none: the part of its text that changes, and
// the failure report.
struct change {
    std::uint32_t id;
    std::optional<byte_list> reply;
    std::string text;
    std::string changed_text;
    std::string err = {};
};

struct sensor_test : device_test {
    // Makes each change to a new sensor. The rest of its text must stay the same.
    void expect_changes(std::string_view name, const std::vector<change>& changes);
};

}  // namespace tests
