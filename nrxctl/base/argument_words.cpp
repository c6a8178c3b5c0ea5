#include "nrxctl/base/argument_words.h"

#include <utility>

namespace nrx {

std::size_t argument_words::left() const {
    const auto next = static_cast<std::size_t>(index_);
    const bool is_at_end = index_ < 0 || next >= words_.size();
    return (first_ ? 1 : 0) + (is_at_end ? 0 : words_.size() - next);
}

std::optional<std::string_view> argument_words::take() {
    if (first_) return std::exchange(first_, std::nullopt);
    if (left() == 0) return std::nullopt;
    return words_[static_cast<std::size_t>(index_++)];
}

}  // namespace nrx
