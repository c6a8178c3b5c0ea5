#include "nrxctl/decoders/id_names.h"

#include <algorithm>
#include <array>
#include <charconv>

namespace nrx {

short_text id_number(std::uint32_t id) {
    std::array<char, 10> digits;
    const auto end = std::to_chars(digits.begin(), digits.end(), id);
    return short_text().append({digits.begin(), end.ptr});
}

short_text name_for_id(name_table table, std::uint32_t id) {
    // Where all identifiers before it have names, one stands at its own place.
    if (id < table.size() && table[id].id == id) return table[id].name;
    const auto found = std::find_if(table.begin(), table.end(),
                                    [&](const id_name& entry) { return entry.id == id; });
    return found == table.end() ? id_number(id) : found->name;
}

}  // namespace nrx
