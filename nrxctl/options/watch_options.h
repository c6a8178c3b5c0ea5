// Options of nrxctl that run the event loop, until their time is over or an interrupt stops it.
#pragma once

#include "nrxctl/options/option_words.h"

namespace nrx::nrxctl {

// Each takes the words that option_rows names.
outcome watch_events(const option_words& words);
outcome watch_spi(const option_words& words);

}  // namespace nrx::nrxctl
