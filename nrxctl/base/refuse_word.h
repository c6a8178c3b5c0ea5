// How a word of the user's is refused.
#pragma once

#include <string_view>

namespace nrx {

// Writes "message (word)" as a line on standard output and ends the process with status 1.
[[noreturn]] void refuse_word(std::string_view message, std::string_view word);

}  // namespace nrx
