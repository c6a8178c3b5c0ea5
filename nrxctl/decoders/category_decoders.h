// The decoders, by the category of a record.
#pragma once

#include <cstdint>

#include "nrxctl/decoders/profile_decoder.h"

namespace nrx {

// Returns the decoder of a category, or null if the category has none. It lives as long as the
// process.
const profile_decoder* decoder_for_category(std::uint32_t category);

// Returns the decoder of categories that have none of their own.
const profile_decoder& default_decoder();

}  // namespace nrx
