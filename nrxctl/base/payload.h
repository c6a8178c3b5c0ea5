// Payloads as users type them.
#pragma once

#include <cstdint>
#include <span>
#include <vector>

namespace nrx {

// Packs words of a command line into payload, which is emptied first, as equally wide little-endian
// values. "u8", "u16" or "u32" as the first word gives the width; without it values are one byte
// wide. Values are hexadecimal, with or without "0x", or decimal after "0d".
//
// Words are taken from position on, which is left at the first word not taken: the end, or a word
// that begins with "-". A word that is no number in signed 32 bits, or a value too large for the
// width, ends the process with status 1 after a message on standard output.
void parse_payload(std::span<char* const> words, int& position, std::vector<std::uint8_t>& payload);

}  // namespace nrx
