#include "nrxctl/profiler/interrupt_stop.h"

#include "nrxctl/profiler/kernel_profiler.h"
#include "platform/interrupt.h"

namespace nrx {

interrupt_stop::interrupt_stop() {
    platform::handle_interrupt(stop_on_interrupt);
}

interrupt_stop::~interrupt_stop() {
    platform::restore_default_interrupt();
}

}  // namespace nrx
