// The command channel of an interface service: reports and commands.
//
// Each operation finds the service by name, opens a connection, makes one call, closes and
// releases, whatever happened. It returns the platform's code: not_found for a missing service, the
// code of the open or the call that failed, no_memory if opening hands back no connection. Each
// failed check writes one failure report.
#pragma once

#include <cstdint>
#include <string_view>

#include "nrxctl/base/failure_report.h"
#include "platform/bytes.h"
#include "platform/return_code.h"

namespace nrx {

// Reads a report into the room that report gives; on success report is cut to the bytes that came
// back, on failure it is as it was.
platform::return_code get_report(std::string_view service_name, std::uint32_t report_id,
                                 platform::byte_span& report);

// The same, for probing: a missing service and a failed call are not reported.
platform::return_code get_report_quiet(std::string_view service_name, std::uint32_t report_id,
                                       platform::byte_span& report);

// Writes a report.
platform::return_code set_report(std::string_view service_name, std::uint32_t report_id,
                                 platform::byte_view report);

// Sends a command with a payload, which may be empty. The response, if any is wanted, goes into the
// room that response gives, which is cut to what came back. A command that the driver does not
// support is also announced on standard output, with a dump of its payload. Silence is about the
// call alone: a missing service and a failed open are reported all the same.
platform::return_code send_command(std::string_view service_name, std::uint32_t command,
                                   platform::byte_view payload, platform::byte_span& response,
                                   expected_failure failure = expected_failure::is_reported);

}  // namespace nrx
