// The subcommands that upload samples to the coprocessor and remove them.
#pragma once

#include <cstdint>

#include "nrxctl/base/arguments.h"
#include "nrxctl/base/identifiers.h"

namespace nrx {

// The header of a load request: five 32-bit words in the order of the members. The records of the
// service's samples follow.
struct replay_load_header {
    nrx::service_id service_id;
    std::uint32_t completion = 1;  // what happens after the last sample
    std::uint32_t location = 1;    // the memory that holds the samples
    std::uint32_t filter = 0;      // 1 if the samples are filtered
    std::uint32_t byte_count;      // of the records
};

namespace replay {

// Each reads its own arguments and reports its own failures.
void load(argument_cursor& arguments);
void unload(argument_cursor& arguments);

// Read the same arguments with the same messages, and do nothing else.
arguments_check check_load(argument_cursor& arguments);
arguments_check check_unload(argument_cursor& arguments);

}  // namespace replay

}  // namespace nrx
