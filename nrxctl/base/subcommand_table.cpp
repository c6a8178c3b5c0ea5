#include "nrxctl/base/subcommand_table.h"

#include "nrxctl/base/word_table.h"

namespace nrx {

bool run_subcommand(std::span<const subcommand_row> table, std::string_view word,
                    argument_words& words) {
    const subcommand_row* known = find_word_row(table, word);
    if (known == nullptr) return false;
    known->run(words);
    return true;
}

}  // namespace nrx
