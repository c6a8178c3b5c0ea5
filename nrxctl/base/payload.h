// Payloads as users type them on the command line.
#pragma once

#include <cstdint>
#include <span>
#include <vector>

namespace nrx {

// Packs arguments into payload, which is cleared first, as little-endian values of equal width. The
// first argument may give the width as "u8", "u16" or "u32"; otherwise values are one byte wide.
// Values are hexadecimal, with or without "0x", or decimal after "0d".
//
// Reads arguments from position on, up to the end or to one that begins with "-", and leaves
// position there. A value that is not a signed 32-bit number, or too large for the width, ends the
// process with status 1 after a message on standard output.
void parse_payload(std::span<char* const> arguments, int& position,
                   std::vector<std::uint8_t>& payload);

}  // namespace nrx
