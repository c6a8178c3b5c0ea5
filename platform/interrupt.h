// The interrupt signal, as a user sends it with Ctrl-C.
#pragma once

namespace platform {

// Called for an interrupt. It may make platform calls.
using interrupt_handler = void (*)();

// Replaces the default action, which ends the process, with a handler. The signal itself only sets
// a flag. The handler runs on the calling thread at its next safe point: when a platform call that
// can fail returns, or during a wait or a sleep, which an interrupt wakes at once. Interrupts that
// arrive before the handler runs are handled once; one that arrives while it runs makes it run
// again.
void set_interrupt_handler(interrupt_handler handler);

// Restores the default action. An interrupt that is still pending is handled first.
void restore_default_interrupt();

}  // namespace platform
