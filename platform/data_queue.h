// Queues in memory that a driver shares with this process.
#pragma once

#include "platform/bytes.h"
#include "platform/connection.h"
#include "platform/return_code.h"

namespace platform {

// A new port for the notifications of a data queue; none if the host has none to give. The caller
// owns it.
notification_port allocate_port();

// Whether the queue holds an entry. It holds none if it is not mapped, or its driver is gone.
bool data_available(const mapped_memory& queue);

// Takes the first entry out of the queue into the room that entry gives, which is cut to the length
// of what was taken. Fails with the host's code if the queue is empty or the entry needs more room,
// with bad_argument if the queue is not mapped, and with not_found if its driver is gone; entry is
// then as it was.
return_code dequeue(const mapped_memory& queue, byte_span& entry);

// Blocks, without using the processor and without a time-out, until the queue holds data; returns
// at once if it does already. The driver must have been given the port to signal on. The interrupt
// handler runs inside. Fails with bad_argument if the queue is not mapped or the port is not the
// one that is signalled for it, with not_found if the driver is gone or goes, and with the host's
// code if nothing can ever end the wait.
return_code wait_for_data(const mapped_memory& queue, const notification_port& port);

}  // namespace platform
