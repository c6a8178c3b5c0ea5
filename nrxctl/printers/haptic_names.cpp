#include "nrxctl/printers/haptic_names.h"

#include <cstddef>

namespace nrx {

std::string_view name_of(code_names names, std::int32_t code) {
    const auto index = static_cast<std::size_t>(code);
    return code >= 0 && index < names.size() ? names[index] : std::string_view();
}

}  // namespace nrx
