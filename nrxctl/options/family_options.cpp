#include "nrxctl/options/family_options.h"

#include <algorithm>
#include <limits>

#include "nrxctl/nrxtoollib.h"

namespace nrx::nrxctl {

namespace {

using family_command = void (*)(std::string_view argument, std::span<char* const> words,
                                int& index);

// A family has the words before the next option. Those that it leaves aside, for it does not need
// them or has failed before, are passed over.
outcome run_family(family_command command, const option_words& words) {
    const auto further = words.all.subspan(static_cast<std::size_t>(words.index));
    const auto end = std::find_if(further.begin(), further.end(),
                                  [](std::string_view word) { return word.starts_with("--"); });
    const auto own = words.all.first(static_cast<std::size_t>(end - words.all.begin()));
    command(words.argument, own, words.index);
    words.index = static_cast<int>(own.size());
    return outcome::done;
}

}  // namespace

outcome profile(const option_words& words) {
    return run_family(profile_command, words);
}

outcome scm(const option_words& words) {
    return run_family(scm_monitor, words);
}

outcome replay(const option_words& words) {
    return run_family(replay_command, words);
}

outcome show_sensor(const option_words& words) {
    std::uint32_t level = 1;
    if (const auto word = words.take()) {
        level =
            parse_number_up_to(std::numeric_limits<std::int32_t>::max(), *word, "level is invalid");
    }
    print_sensor_info(words.argument, static_cast<std::int32_t>(level));
    return outcome::done;
}

}  // namespace nrx::nrxctl
