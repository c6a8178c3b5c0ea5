// Event records as lines of text: decoded, or in hexadecimal.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

#include "nrxctl/base/profile_record.h"
#include "nrxctl/decoders/event_text.h"
#include "platform/bytes.h"

namespace nrx {

// Writes the text of a record into line, replacing its content, and returns it. It is one line
// without a line feed, written by the decoder of the record's category, or by the default decoder.
std::string_view decode_profile_record(const profile_record& record, event_text& line);

// The same, but returns nullopt if the text is not UTF-8, because the record's text fields hold
// other bytes.
std::optional<std::string_view> format_profile_record(const profile_record& record,
                                                      event_text& line);

// Prints the text of a record as a line on standard output. If it is not UTF-8, prints nothing and
// counts the record. A record_printer.
void print_profile_record(const profile_record& record);

// The number of records that this process has not printed because their text is not UTF-8.
std::uint64_t unprintable_record_count();

// Writes a line on standard output: the label, then each byte as two lower-case hexadecimal digits,
// each followed by a space if spaced is 1 (no other value). The label's length + 3 * the number of
// bytes + 1 must be less than 256; otherwise the process stops, with a report on standard error.
void nrx_profile_hexdump(std::string_view label, platform::byte_view bytes, int spaced);

// Prints a record as "prof-event " and its 48 bytes in hexadecimal. A record_printer.
void dump_profile_record(const profile_record& record);

// Returns the printer of records as text, or as a hexadecimal dump.
record_printer select_record_printer(bool decode);

}  // namespace nrx
