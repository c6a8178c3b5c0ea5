// Options of nrxctl that call drivers beside their reports and commands.
#pragma once

#include "nrxctl/options/option_words.h"

namespace nrx::nrxctl {

// Each takes the words that option_rows names.
outcome call_scalar(const option_words& words);
outcome get_property(const option_words& words);
outcome set_property(const option_words& words);
outcome ask_hid_driver(const option_words& words);
outcome turn_mca(const option_words& words);

}  // namespace nrx::nrxctl
