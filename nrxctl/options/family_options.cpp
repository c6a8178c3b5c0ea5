#include "nrxctl/options/family_options.h"

#include <algorithm>
#include <limits>

#include "nrxctl/nrxtoollib.h"

namespace nrx::nrxctl {

outcome profile(const option_words& words) {
    nrx::profile_command(words.argument, words.all, words.index);
    return outcome::done;
}

outcome scm(const option_words& words) {
    nrx::scm_monitor(words.argument, words.all, words.index);
    return outcome::done;
}

// The command takes the words before the next option, and leaves those aside that it does not need.
outcome replay(const option_words& words) {
    const auto further = words.all.subspan(static_cast<std::size_t>(words.index));
    const auto end = std::find_if(further.begin(), further.end(),
                                  [](std::string_view word) { return word.starts_with("--"); });
    const auto own = words.all.first(static_cast<std::size_t>(end - words.all.begin()));
    nrx::replay_command(words.argument, own, words.index);
    words.index = static_cast<int>(own.size());
    return outcome::done;
}

outcome show_sensor(const option_words& words) {
    std::uint32_t level = 1;
    if (const auto word = words.take()) {
        level = nrx::parse_number_up_to(std::numeric_limits<std::int32_t>::max(), *word,
                                        "level is invalid");
    }
    nrx::print_sensor_info(words.argument, static_cast<std::int32_t>(level));
    return outcome::done;
}

}  // namespace nrx::nrxctl
