// Texts with a delimiter.
#pragma once

#include <string_view>
#include <vector>

namespace nrx {

// The fields of a text between its delimiters. Fields may be empty, but there is none behind a
// delimiter at the very end, and none in an empty text.
std::vector<std::string_view> split(std::string_view text, char delimiter);

}  // namespace nrx
