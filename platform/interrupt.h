// The interrupt: the request to end what is running.
//
// A user sends it with Ctrl-C, with a request to terminate, or by closing the terminal (on POSIX
// the signals INT, TERM and HUP). A program that reads the standard output sends it by going away.
#pragma once

namespace platform {

// Called for an interrupt. It may make platform calls.
using interrupt_handler = void (*)();

// Replaces the default action of the signals, which ends the process, with a handler. A hang-up
// that the process was started to ignore stays ignored. The first signal only sets a flag. A second
// one has the default action, unless it comes so soon that it repeats the first: one request may
// signal a process and its group, or come from the terminal and the shell. The handler runs on the
// thread that makes platform calls, at its next safe point: when a call that can fail returns, or
// during a wait, a sleep or the event loop, which an interrupt wakes at once. Interrupts that
// arrive before the handler runs are handled once.
void set_interrupt_handler(interrupt_handler handler);

// Restores the default actions; a signal that was received just now stays without effect if it is
// repeated. An interrupt that is still pending is handled first.
void restore_default_interrupt();

// Returns true if an interrupt has come since the handler was set. A call of the operating system
// that blocks should then be given up; each signal ends it with EINTR.
bool interrupt_received();

// Interrupts this process, if a handler is installed and has not run yet. Call it from the thread
// that makes platform calls.
void request_interrupt();

}  // namespace platform
