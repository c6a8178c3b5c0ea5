// UTF-8 in the strict sense: no overlong form, no surrogate, nothing above U+10FFFF, nothing cut
// off.
#pragma once

#include <cstddef>
#include <string_view>

namespace nrx {

// Returns the size in bytes of the character that text begins with; 0 if text is empty or does not
// begin with a valid character.
std::size_t utf8_character_size(std::string_view text);

// Returns true if text is valid UTF-8.
bool is_utf8(std::string_view text);

}  // namespace nrx
