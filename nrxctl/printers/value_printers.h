// Small printers for reports that are one value: text, a number, raw bytes.
#pragma once

#include "nrxctl/printers/report_printer.h"

namespace nrx {

// The bytes as text and a line feed if all but the last are printable characters or white space;
// else a dump. An empty report prints nothing.
void print_text_or_dump(std::string_view service_name, std::int32_t report_id,
                        platform::byte_view report);

// A dump.
void print_hex(std::string_view service_name, std::int32_t report_id, platform::byte_view report);

// All bytes as text, and a line feed.
void print_text(std::string_view service_name, std::int32_t report_id, platform::byte_view report);

// All bytes as they are, and nothing else.
void print_raw(std::string_view service_name, std::int32_t report_id, platform::byte_view report);

// Up to four bytes as an unsigned little-endian number in decimal, high bytes that are missing
// being 0. A longer report prints nothing.
void print_u32(std::string_view service_name, std::int32_t report_id, platform::byte_view report);

}  // namespace nrx
