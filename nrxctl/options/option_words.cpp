#include "nrxctl/options/option_words.h"

#include <cstddef>

namespace nrx::nrxctl {

std::optional<std::string_view> option_words::take() const {
    const auto next = static_cast<std::size_t>(index);
    if (next >= all.size() || *all[next] == '-') return std::nullopt;
    ++index;
    return all[next];
}

}  // namespace nrx::nrxctl
