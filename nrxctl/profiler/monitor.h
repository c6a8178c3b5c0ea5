// The monitor: hands on the events of the profiler as they come.
#pragma once

#include <cstdint>
#include <string_view>

#include "nrxctl/base/argument_words.h"
#include "nrxctl/base/profile_record.h"
#include "platform/data_queue.h"
#include "platform/return_code.h"

namespace nrx {

// How a user wants to monitor.
struct monitor_args {
    std::uint32_t duration = 0;  // microseconds; 0: until the stream ends
    bool human = false;          // records as text
};

// The duration that a word gives: "auto", which is 0, or a number of milliseconds, in microseconds.
// Any other word, and a duration beyond 32 bits, ends the process with status 1 after a message on
// standard output.
std::uint32_t parse_duration(std::string_view word);

// Takes at most two words, [human] [auto | <duration>], and prints what they mean as a line on
// standard output.
monitor_args parse_monitor_args(argument_words& words);

// Prints the events of the driver's queue until the end marker or, with a duration (microseconds;
// 0: none), until events arrive after it is over. The coprocessor is told the duration; this side
// measures it by the tick period, which the front end has set. Then prints what arrives in another
// 100 ms, the coprocessor's log, and "done". False, with a failure report, if the monitor cannot
// start or the queue fails.
bool monitor_profiler(std::uint32_t duration, record_printer print);

// Prints the entries that the queue holds, up to the end marker, which sets ended and is not
// printed. What an entry lacks of a record reads as 0 and is a failure report; so one without any
// byte is an end marker. Success, or the code of an entry that could not be taken, with a failure
// report.
platform::return_code drain_profile_queue(const platform::mapped_memory& queue, bool& ended,
                                          record_printer print);

}  // namespace nrx
