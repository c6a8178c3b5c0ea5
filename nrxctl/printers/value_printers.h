// Printers of reports that are one value: text, a number, raw bytes.
#pragma once

#include <string_view>

#include "nrxctl/base/identifiers.h"
#include "platform/bytes.h"

namespace nrx {

// Prints the bytes as text and a line feed if all but the last are printable characters or white
// space, otherwise as a dump. An empty report prints nothing.
void print_text_or_dump(std::string_view service_name, report_id id, platform::byte_view report);

// Prints a dump.
void print_hex(std::string_view service_name, report_id id, platform::byte_view report);

// Prints all bytes as text, and a line feed.
void print_text(std::string_view service_name, report_id id, platform::byte_view report);

// Prints all bytes as they are, and nothing else.
void print_raw(std::string_view service_name, report_id id, platform::byte_view report);

// Prints up to four bytes as an unsigned little-endian number in decimal; missing high bytes count
// as 0. A longer report prints nothing.
void print_u32(std::string_view service_name, report_id id, platform::byte_view report);

}  // namespace nrx
