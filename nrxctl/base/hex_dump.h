// The hexadecimal dump of raw report and payload bytes.
#pragma once

#include <string_view>

#include "platform/bytes.h"

namespace nrx {

// Writes bytes on standard output, 16 to a line: the offset in eight hexadecimal digits, the bytes
// in hexadecimal, and as characters (a dot for spaces, control characters and everything from 0x7f
// up). Each line begins with the label and a space unless the label is empty; a label is cut to
// max_dump_label characters. Writes nothing if there are no bytes.
void hex_dump(platform::byte_view bytes, std::string_view label = {});

inline constexpr std::size_t max_dump_label = 175;

}  // namespace nrx
