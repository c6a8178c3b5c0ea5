// Names of the numbers that classify an event.
#pragma once

#include <cstdint>
#include <span>

#include "nrxctl/decoders/short_text.h"

namespace nrx {

struct id_name {
    std::uint32_t id;
    short_text name;
};

using name_table = std::span<const id_name>;

// An identifier in decimal.
short_text id_number(std::uint32_t id);

// The name of the first entry with that identifier, else the identifier in decimal.
short_text name_for_id(name_table table, std::uint32_t id);

}  // namespace nrx
