// Connections to drivers and the numbered methods called on them.
#pragma once

#include <cstdint>
#include <span>

#include "platform/bytes.h"
#include "platform/handle.h"
#include "platform/registry.h"
#include "platform/return_code.h"

namespace platform {

struct connection_kind {
    static void release(handle_id id);
};

// An open connection to a driver; closed by whoever holds it.
using connection = handle<connection_kind>;

// What a method is given. The callee keeps neither.
struct call_inputs {
    std::span<const std::uint64_t> scalars;
    byte_view structure;
};

// Room for what a method gives back. After a successful call each span is cut to what the driver
// returned; after a failed one both are as they were, and what they hold is undefined.
struct call_outputs {
    std::span<std::uint64_t> scalars;
    byte_span structure;
};

// Opens a connection of the given type on a service for this process. On success it is handed over
// in opened; a host may also report success and hand over none. Fails with the driver's code, with
// unsupported for a type that it does not know, and with not_found if the service is gone.
return_code open(const service& provider, std::uint32_t type, connection& opened);

// Calls a method by its selector. Fails with the driver's code: unsupported for a selector, report
// or command that it does not know, bad_argument for the wrong count of scalars or a missing or
// badly sized structure, not_found if the driver is gone.
return_code call(const connection& connected, std::uint32_t selector, const call_inputs& inputs,
                 call_outputs& outputs);

}  // namespace platform
