// Options of nrxctl that hand their words to a command family of the library.
#pragma once

#include "nrxctl/options/option_words.h"

namespace nrx::nrxctl {

// Each takes the words that option_rows names.
outcome profile(const option_words& words);
outcome scm(const option_words& words);
outcome replay(const option_words& words);
outcome show_sensor(const option_words& words);

}  // namespace nrx::nrxctl
