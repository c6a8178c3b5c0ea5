// Text in fields of a fixed size.
#pragma once

#include <algorithm>
#include <string_view>

#include "platform/bytes.h"

namespace nrx {

// The bytes of a field before its first NUL; the whole field if it has none. A view into the field.
inline std::string_view text_before_nul(platform::byte_view field) {
    const auto end = std::find(field.begin(), field.end(), 0);
    return {reinterpret_cast<const char*>(field.data()),
            static_cast<std::string_view::size_type>(end - field.begin())};
}

}  // namespace nrx
