#include "nrxctl/decoders/short_text.h"

#include <charconv>

namespace nrx {

short_text id_number(std::uint32_t id) {
    std::array<char, 10> digits;
    const auto end = std::to_chars(digits.begin(), digits.end(), id);
    return short_text().append({digits.begin(), end.ptr});
}

short_text name_for_id(const id_name_table& names, std::uint32_t id) {
    const short_text* name = names.find(id);
    return name == nullptr ? id_number(id) : *name;
}

}  // namespace nrx
