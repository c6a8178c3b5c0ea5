// Whether bytes are text.
#pragma once

#include <string_view>

namespace nrx {

// Whether text is UTF-8 in the strict sense: no overlong form, no surrogate, nothing above
// U+10FFFF, nothing cut off.
bool is_utf8(std::string_view text);

}  // namespace nrx
