#include "nrxctl/base/reply_fields.h"

#include <string>

#include "nrxctl/base/check.h"

namespace nrx {

bool check_length(platform::byte_view bytes, std::size_t required, source_location location) {
    if (bytes.size() >= required) return true;
    return check(false, ("length >= " + std::to_string(required)).c_str(), location);
}

}  // namespace nrx
