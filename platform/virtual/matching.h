// How the registry compares an entry with a matching dictionary.
#pragma once

#include "platform/property.h"
#include "platform/virtual/entry.h"

namespace platform::simulated {

// Whether every key of the matching dictionary holds for the entry; a key that no look-up
// understands holds for none.
bool matches(const entry& candidate, const dictionary& matching);

}  // namespace platform::simulated
