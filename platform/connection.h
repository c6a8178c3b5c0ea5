// Connections to drivers: numbered methods, shared memory, and notification ports.
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

// An open connection to a driver. Releasing it closes the connection.
using connection = handle<connection_kind>;

struct memory_kind {
    static void release(handle_id id);
};

// Driver memory that is mapped into this process. Releasing it unmaps the memory.
using mapped_memory = handle<memory_kind>;

struct port_kind {
    static void release(handle_id id);
};

// A port on which a driver signals.
using notification_port = handle<port_kind>;

// Arguments of a method. The callee keeps no reference to them.
struct call_inputs {
    std::span<const std::uint64_t> scalars;
    byte_view structure;
};

// Buffers for the results of a method. A successful call shrinks each span to what the driver
// returned. A failed call leaves both spans as they were; the contents of the buffers are then
// unspecified.
struct call_outputs {
    std::span<std::uint64_t> scalars;
    byte_span structure;
};

// Opens a connection of the given type to a service and stores it in conn. A host may report
// success without storing a connection. Fails with the driver's code, with unsupported if the
// driver does not know the type, and with not_found if the service is gone.
return_code open(const service& provider, std::uint32_t type, connection& conn);

// Calls the method with the given selector. Fails with the driver's code: unsupported for an
// unknown selector, report or command, bad_argument for a wrong number of scalars and for a missing
// structure or one of the wrong size, not_found if the driver is gone.
return_code call(const connection& conn, std::uint32_t selector, const call_inputs& inputs,
                 call_outputs& outputs);

// Maps the driver memory of the given type into this process and stores the mapping in memory. A
// host may report success without storing a mapping. Fails with unsupported if the driver has no
// memory of that type, and with not_found if the driver is gone.
return_code map_memory(const connection& conn, std::uint32_t type, mapped_memory& memory);

// Makes the driver signal its notifications of the given type on a port. The caller keeps the port.
// The driver passes the reference along with each notification. Fails with unsupported if the
// driver has no notifications of that type, with bad_argument if the port handle is empty, and with
// not_found if the driver is gone.
return_code attach_port(const connection& conn, std::uint32_t type, const notification_port& port,
                        std::uint64_t reference);

}  // namespace platform
