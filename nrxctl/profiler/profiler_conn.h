// A connection to the kernel's profiler driver.
#pragma once

#include <cstdint>
#include <string_view>

#include "nrxctl/base/service_conn.h"
#include "platform/data_queue.h"

namespace nrx {

inline constexpr std::string_view profiler_driver_name = "KeltoNRXProfileDriver";

// The methods of the driver.
namespace profiler_method {

inline constexpr std::uint32_t set_enabled = 0;       // scalar in: 1 enable, 0 disable
inline constexpr std::uint32_t read_status = 1;       // scalar out: not 0 if a client is connected
inline constexpr std::uint32_t configure = 2;         // structure in: configuration records
inline constexpr std::uint32_t read_configs = 3;      // structure out: configuration records
inline constexpr std::uint32_t read_error_dump = 8;   // structure out: event records
inline constexpr std::uint32_t read_log = 9;          // structure out: event records
inline constexpr std::uint32_t make_error_dump = 10;  // nothing in or out
inline constexpr std::uint32_t stop_monitor = 11;     // nothing in or out

}  // namespace profiler_method

// Lives for one operation. The connection is opened on the driver's service itself. Destruction
// unmaps the queue, gives the port back, then closes and releases.
class profiler_conn final : public service_conn {
public:
    profiler_conn() : service_conn(std::string(profiler_driver_name)) {}

    // Finds the driver by its registry name and opens a connection of type 0 on it. Whether the
    // connection is open; if not, the check that failed is reported, but for a missing driver if
    // that is to be silent.
    bool open(expected_failure missing = expected_failure::is_reported);

    // Opens, maps the driver's event queue and attaches a port that is signalled when events
    // arrive. Whether all of it stands; if not, the check that failed is reported, but for a
    // mapping that fails, or succeeds and hands over no memory, if that is to be silent.
    bool open_queue(expected_failure mapping = expected_failure::is_reported);

    // None before a successful open_queue.
    [[nodiscard]] const platform::mapped_memory& queue() const { return queue_; }
    [[nodiscard]] const platform::notification_port& port() const { return port_; }

private:
    // Members are given back from the last to the first.
    platform::notification_port port_;
    platform::mapped_memory queue_;
};

}  // namespace nrx
