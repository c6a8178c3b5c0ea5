// A host with sensors, for the tests of sensor inspection.
#pragma once

#include <cstdint>
#include <initializer_list>
#include <string>
#include <string_view>
#include <vector>

#include "tests/support/device_test.h"

namespace tests {

// Numbers of 32 bits, one after the other.
byte_list words(std::initializer_list<std::int64_t> numbers);

// Text as it stands, NULs included.
byte_list bytes_of(std::string_view text);

// An entry of the client table; the bytes of its name behind the NUL are not blank.
byte_list client_entry(std::string_view name, std::initializer_list<std::int64_t> numbers,
                       std::uint8_t in_use, std::uint8_t option, std::uint8_t power);

// Gives a service the command that tells its clients.
void set_clients(interface_driver& sensor, const byte_list& entries);

// The identifiers of the reports that every sensor is asked for, in order.
const std::vector<std::uint32_t>& property_ids();

// A sensor that answers whatever it may be asked; its events are on entries below it, "first" to
// "fourth".
interface_driver& put_whole_sensor(machine& host, std::string_view name);

// What it prints: its properties, and its details. The lines between them, for the motion sensors,
// are those of the sensor.
extern const std::string whole_summary;  // without the first line, the sensor's name
extern const std::string whole_details;

// Where a report of a check on a reply's length comes from.
std::string too_short(std::size_t needed, std::string_view file = "sensor_reports.cpp");

// What print_sensor_info does.
outcome inspect(std::string_view name, std::int32_t level = 1);

}  // namespace tests
