#include "nrxctl/decoders/id_names.h"

#include <algorithm>
#include <charconv>

namespace nrx {

id_text::id_text(std::uint32_t id) {
    const auto end = std::to_chars(digits_.begin(), digits_.end(), id);
    digit_count_ = static_cast<std::uint8_t>(end.ptr - digits_.begin());
}

id_text name_for_id(std::span<const id_name> table, std::uint32_t id) {
    const auto found = std::find_if(table.begin(), table.end(),
                                    [&](const id_name& entry) { return entry.id == id; });
    return found == table.end() ? id_text(id) : id_text(found->name);
}

}  // namespace nrx
