// Which decoder is in charge of a record.
#pragma once

#include <cstdint>

#include "nrxctl/decoders/profile_decoder.h"

namespace nrx {

// The decoder of a category, which lives as long as the process; null if the category has none.
const profile_decoder* decoder_for_category(std::uint32_t category);

// The decoder of categories that have none of their own.
const profile_decoder& default_decoder();

}  // namespace nrx
