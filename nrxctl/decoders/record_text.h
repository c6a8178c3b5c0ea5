// Event records as text.
#pragma once

#include <optional>
#include <string_view>

#include "nrxctl/base/profile_record.h"
#include "nrxctl/decoders/event_text.h"

namespace nrx {

// The text of a record, one line without its line feed, as the decoder of its category writes it
// (the default decoder for a category that has none). It stands in line, which it replaces.
std::string_view decode_profile_record(const profile_record& record, event_text& line);

// The same, as text that any reader may take for UTF-8: none if the record's text fields hold other
// bytes.
std::optional<std::string_view> format_profile_record(const profile_record& record,
                                                      event_text& line);

// Prints the text of a record as a line on standard output; nothing if it is not UTF-8. A
// record_printer.
void print_profile_record(const profile_record& record);

// The printer of records as text, or as a hexadecimal dump.
record_printer select_record_printer(bool decode);

}  // namespace nrx
