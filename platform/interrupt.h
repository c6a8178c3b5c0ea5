// The interrupt: the request to end what is running.
//
// A user sends it with Ctrl-C, with a request to terminate, or by closing the terminal (on POSIX
// the signals INT, TERM and HUP). A program that reads the standard output sends it by going away.
#pragma once

namespace platform {

// Called for an interrupt. It may make platform calls.
using interrupt_handler = void (*)();

// Replaces the default action of the signals, which ends the process, with a handler. A hang-up
// that the process was started to ignore stays ignored. A signal itself only sets a flag, and
// restores the default actions: a second signal ends the process. The handler runs on the calling
// thread at its next safe point: when a platform call that can fail returns, or during a wait, a
// sleep or the event loop, which an interrupt wakes at once. Interrupts that arrive before the
// handler runs are handled once.
void set_interrupt_handler(interrupt_handler handler);

// Restores the default actions. An interrupt that is still pending is handled first.
void restore_default_interrupt();

// Interrupts this process, if a handler is installed and has not run yet.
void request_interrupt();

}  // namespace platform
