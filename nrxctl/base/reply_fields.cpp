#include "nrxctl/base/reply_fields.h"

#include <string>

#include "nrxctl/base/failure_report.h"

namespace nrx {

bool check_length(platform::byte_view bytes, std::size_t needed, source_place place) {
    if (bytes.size() >= needed) return true;
    return check(false, ("length >= " + std::to_string(needed)).c_str(), place);
}

}  // namespace nrx
