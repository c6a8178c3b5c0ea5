// Connections to drivers: the numbered methods called on them, the memory that they share, and the
// ports that they signal on.
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

struct memory_kind {
    static void release(handle_id id);
};

// Memory of a driver, mapped into this process; unmapped by whoever holds it.
using mapped_memory = handle<memory_kind>;

struct port_kind {
    static void release(handle_id id);
};

// A port that a driver signals on; released by whoever holds it.
using notification_port = handle<port_kind>;

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

// Maps the driver's memory of the given type anywhere into this process. On success it is handed
// over in mapped; a host may also report success and hand over none. Fails with unsupported for a
// type that the driver does not have, and with not_found if the driver is gone.
return_code map_memory(const connection& connected, std::uint32_t type, mapped_memory& mapped);

// Lets the driver signal its notifications of the given type on a port, which stays the caller's.
// The driver hands the reference back with each of them. Fails with unsupported for a type that the
// driver does not have, with bad_argument if there is no such port, and with not_found if the
// driver is gone.
return_code attach_port(const connection& connected, std::uint32_t type,
                        const notification_port& port, std::uint64_t reference);

}  // namespace platform
