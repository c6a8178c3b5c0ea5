#include "nrxctl/base/argument_words.h"

#include <cstddef>
#include <utility>

namespace nrx {

std::optional<std::string_view> argument_words::take() {
    if (first_) return std::exchange(first_, std::nullopt);
    const auto next = static_cast<std::size_t>(index_);
    if (index_ < 0 || next >= words_.size()) return std::nullopt;
    ++index_;
    return words_[next];
}

}  // namespace nrx
