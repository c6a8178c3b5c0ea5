// Queues in memory that a driver shares with this process.
#pragma once

#include "platform/bytes.h"
#include "platform/connection.h"
#include "platform/return_code.h"

namespace platform {

// Allocates a port for the notifications of a data queue. Returns an empty handle if the host
// cannot allocate one.
notification_port allocate_port();

// Returns true if the queue holds an entry; false if it is empty or not mapped, or if its driver is
// gone.
bool data_available(const mapped_memory& queue);

// Moves the first entry of the queue into the buffer and shrinks the span to the length of the
// entry. Fails with the host's code if the queue is empty or the buffer is too small, with
// bad_argument if the queue is not mapped, and with not_found if its driver is gone. A failure
// leaves the span as it was.
return_code dequeue(const mapped_memory& queue, byte_span& entry);

// Blocks until the queue holds data, without a timeout and without using the processor. Returns at
// once if there is data already. The port must be attached to the queue's driver. Interrupt
// handlers run during the wait. Fails with bad_argument if the queue is not mapped or is not
// signalled on this port, with not_found if the driver is gone or goes away, and with the host's
// code if nothing can ever end the wait.
return_code wait_for_data(const mapped_memory& queue, const notification_port& port);

}  // namespace platform
