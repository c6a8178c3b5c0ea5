// Options of nrxctl for services, their reports and commands.
#pragma once

#include "nrxctl/options/option_words.h"

namespace nrx::nrxctl {

// Each takes the words that option_rows names.
outcome list(const option_words& words);
outcome read_report(const option_words& words);
outcome write_report(const option_words& words);
outcome run_command(const option_words& words);

}  // namespace nrx::nrxctl
