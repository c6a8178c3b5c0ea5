// Records of one size, back to back, as drivers hand them over.
#pragma once

#include <cstddef>

#include "platform/bytes.h"

namespace nrx {

// Calls use with the bytes of each whole record, in their order; a trailing part is no record.
template <class Use>
void for_each_record(platform::byte_view records, std::size_t size, const Use& use) {
    for (; records.size() >= size; records = records.subspan(size))
        use(records.first(size));
}

}  // namespace nrx
