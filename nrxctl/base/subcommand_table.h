// The subcommands of a command family.
#pragma once

#include <span>
#include <string_view>

#include "nrxctl/base/argument_words.h"

namespace nrx {

struct subcommand_row {
    std::string_view word;
    void (*run)(argument_words& words);  // takes its own words, and reports its own failures
};

// Carries out the subcommand with that word. False if the table has none.
bool run_subcommand(std::span<const subcommand_row> table, std::string_view word,
                    argument_words& words);

}  // namespace nrx
