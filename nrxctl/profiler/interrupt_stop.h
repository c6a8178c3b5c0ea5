// What an interrupt does to a command of the profiler family.
#pragma once

namespace nrx {

// As long as it lives, an interrupt is handled by stop_on_interrupt; then by the default action,
// which ends the process.
class interrupt_stop {
public:
    interrupt_stop();
    ~interrupt_stop();
    interrupt_stop(const interrupt_stop&) = delete;
    interrupt_stop& operator=(const interrupt_stop&) = delete;
};

}  // namespace nrx
