// The hexadecimal dump of raw report and payload bytes.
#pragma once

#include <string_view>

#include "platform/bytes.h"

namespace nrx {

// Writes bytes on standard output, 16 to a line: the offset in eight hexadecimal digits, the bytes
// in hexadecimal, and as characters (a full stop for blanks, control characters and everything from
// 0x7f up). A label, if not empty, and a blank begin each line; a label longer than a dump line has
// room for is cut to longest_dump_label characters. No bytes, no lines.
void hex_dump(platform::byte_view bytes, std::string_view label = {});

inline constexpr std::size_t longest_dump_label = 175;

}  // namespace nrx
