// What stands behind an option of nrxctl, and how an option went.
#pragma once

#include <optional>
#include <span>
#include <string_view>

#include "platform/return_code.h"

namespace nrx::nrxctl {

// How an option went. The command families, the inspection of a sensor and the watch of SPI status
// records say all that there is to say themselves: they are always done.
enum class outcome { done, failed, misused };

inline outcome outcome_of(platform::return_code result) {
    return result == platform::success ? outcome::done : outcome::failed;
}

// The option's own argument and all words of the command line, with the option parser's index.
struct option_words {
    std::string_view argument;
    std::span<char* const> all;
    int& index;

    // The next word; none at the end, and before the next option.
    [[nodiscard]] std::optional<std::string_view> take() const;
};

}  // namespace nrx::nrxctl
