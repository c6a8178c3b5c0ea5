// The monitor: prints the events of the profiler as they arrive.
#pragma once

#include <cstdint>
#include <string_view>

#include "nrxctl/base/arguments.h"
#include "nrxctl/base/profile_record.h"
#include "platform/data_queue.h"
#include "platform/return_code.h"

namespace nrx {

struct monitor_args {
    std::uint32_t duration = 0;  // microseconds; 0: until the stream ends
    bool human = false;          // records are printed as text
};

// The arguments that ask for records as text, and for a monitor without end.
inline constexpr std::string_view human_keyword = "human";
inline constexpr std::string_view auto_keyword = "auto";

// Returns the duration in microseconds that an argument gives: 0 for "auto", otherwise a number of
// milliseconds. Any other argument, and a duration beyond 32 bits, ends the process with status 1
// after a message on standard output.
std::uint32_t parse_duration(std::string_view argument);

// Reads at most two arguments, [human] [auto | <duration>], and prints their values as a line on
// standard output.
monitor_args parse_monitor_args(argument_cursor& arguments);

// Prints the events in the driver's queue until the end marker or until the first events after the
// duration (microseconds; 0: none). The duration is also sent to the coprocessor; here it is
// measured with tick_period, which the front end sets. Then prints the events of another 100 ms,
// the coprocessor's log, and "done". All events together are a watch of print_limit.h. Returns
// false with a failure report if the monitor cannot start or the queue fails.
bool monitor_profiler(std::uint32_t duration, record_printer print);

// Prints the entries of the queue, up to the end marker, which sets ended and is not printed. An
// entry shorter than a record is reported, and what it lacks reads as 0; an empty entry is thus an
// end marker. Returns the code of the first entry that cannot be dequeued, with a failure report,
// or success.
platform::return_code drain_profile_queue(const platform::mapped_memory& queue, bool& ended,
                                          record_printer print);

}  // namespace nrx
