// A platform call of the virtual host, from its beginning to its end.
#pragma once

#include <optional>

#include "platform/virtual/failure.h"
#include "platform/virtual/interrupts.h"

namespace platform::simulated {

// A platform call under way, and how it is to fail, if it is. Its end is a safe point: an interrupt
// noted by then is served.
class begun_call {
public:
    explicit begun_call(std::optional<failure> how) : how_(how) {}
    ~begun_call() { serve_interrupt(); }
    begun_call(const begun_call&) = delete;
    begun_call& operator=(const begun_call&) = delete;
    begun_call(begun_call&&) = delete;
    begun_call& operator=(begun_call&&) = delete;

    // Not of a temporary: its end would come before that of the call.
    explicit operator bool() const& { return how_.has_value(); }
    explicit operator bool() const&& = delete;
    failure operator*() const { return *how_; }

private:
    std::optional<failure> how_;
};

}  // namespace platform::simulated
