// The interrupt signal, as a user sends it with Ctrl-C.
#pragma once

namespace platform {

// What to do about an interrupt. It may make platform calls.
using interrupt_handler = void (*)();

// Registers a handler in place of the default action, which ends the process. An interrupt is only
// noted when it comes in; the handler runs on the calling thread at its next safe point: inside a
// wait or a sleep, which an interrupt wakes at once, or when a platform call that can fail returns.
// Interrupts that come in before the handler runs are one; one that comes in while it runs makes it
// run again.
void handle_interrupt(interrupt_handler handler);

// Gives the interrupt its default action back. An interrupt noted before still gets its handler,
// now.
void restore_default_interrupt();

}  // namespace platform
