#include "nrxctl/base/print_limit.h"

#include "platform/interrupt.h"

namespace nrx {

namespace {

std::optional<std::uint32_t> limit;
std::optional<std::uint32_t> remaining;  // nullopt: no limit applies

}  // namespace

void set_print_limit(std::optional<std::uint32_t> events) {
    limit = events;
}

limited_watch::limited_watch() {
    remaining = limit;
}

limited_watch::~limited_watch() {
    remaining.reset();
}

bool may_print_event() {
    if (!remaining) return true;
    if (*remaining == 0) return false;
    if (--*remaining == 0) platform::request_interrupt();
    return true;
}

}  // namespace nrx
