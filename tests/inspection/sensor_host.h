// A host with sensors, for the tests of sensor inspection.
#pragma once

#include <cstdint>
#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "tests/support/device_test.h"

namespace tests {

// Numbers of 32 bits, one after the other.
byte_list words(std::initializer_list<std::int64_t> numbers);

// Text as it stands, NULs included.
byte_list bytes_of(std::string_view text);

byte_list first_bytes(const byte_list& whole, std::size_t length);

// An entry of the client table; the bytes of its name behind the NUL are not blank.
byte_list client_entry(std::string_view name, std::initializer_list<std::int64_t> numbers,
                       std::uint8_t in_use, std::uint8_t option, std::uint8_t power);

// A sensor with the id 31 that answers whatever it may be asked; its events are on entries below
// it, "first" to "fourth".
interface_driver& put_whole_sensor(machine& host, std::string_view name);

// What it prints; a motion sensor has lines of its own.
std::string whole_text(std::string_view name, std::int32_t level);
extern const std::string event_line;

// What a check on a reply's length reports.
std::string too_short(std::size_t needed, std::string_view file = "sensor_reports.cpp");

// What print_sensor_info does.
outcome inspect(std::string_view name, std::int32_t level);

// A report of a whole sensor, what it is given (nothing: it is taken away), which part of the text
// becomes which, and what is reported.
struct change {
    std::uint32_t id;
    std::optional<byte_list> bytes;
    std::string text;
    std::string changed;
    std::string err = {};
};

class sensor_test : public device_test {
protected:
    // Makes each change to a sensor of its own: the rest of the text stays as it is.
    void expect_changes(std::string_view name, const std::vector<change>& changes);
};

}  // namespace tests
