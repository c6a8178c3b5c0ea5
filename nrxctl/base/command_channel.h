// The calls of the coprocessor's drivers: reports, commands, the scalar method and named properties
// of an interface service, and the structure method of the HID driver.
//
// Each operation finds its service, opens a connection, makes one call, closes and releases. It
// returns not_found if the service is missing, no_memory if the platform returns no connection, or
// the platform's code for the failed open or call. Each failed check writes one failure report.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/identifiers.h"
#include "platform/bytes.h"
#include "platform/return_code.h"

namespace nrx {

// Reads a report into the buffer that report refers to. On success report is shrunk to the bytes
// returned; on failure it is unchanged.
platform::return_code get_report(std::string_view service_name, report_id id,
                                 platform::byte_span& report);

// Like get_report, for probing: a missing service and a failed call are not reported.
platform::return_code get_report_quiet(std::string_view service_name, report_id id,
                                       platform::byte_span& report);

// Writes a report.
platform::return_code set_report(std::string_view service_name, report_id id,
                                 platform::byte_view report);

// Sends a command with a payload, which may be empty. The response goes into the buffer that
// response refers to, which is shrunk to the bytes returned; it may be empty if no response is
// wanted. If the driver does not support the command, a line and a dump of the payload on standard
// output say so. on_call_failure concerns the call alone: a missing service and a failed open are
// always reported.
platform::return_code send_command(std::string_view service_name, std::uint32_t command,
                                   platform::byte_view payload, platform::byte_span& response,
                                   on_failure on_call_failure = on_failure::report);

// Calls the scalar method with any number of scalars. It returns no data.
platform::return_code call_scalar_method(std::string_view service_name,
                                         std::span<const std::uint64_t> scalars);

// Sets a named property, which the service's driver keeps, to any bytes. Also fails with no_memory
// if the message cannot be allocated. Properties of the registry are in services.h.
platform::return_code set_named_property(std::string_view service_name,
                                         std::string_view property_name, platform::byte_view value);

// Reads a named property into the buffer that value refers to. On success value is shrunk to the
// bytes returned; on failure it is unchanged. If the driver has no named properties, a line on
// standard output says so.
platform::return_code get_named_property(std::string_view service_name,
                                         std::string_view property_name,
                                         platform::byte_span& value);

// Calls the structure method of the driver that serves all HID devices of the coprocessor. The
// reply goes into the buffer that output refers to; on success output is shrunk to the bytes
// returned, on failure it is unchanged.
platform::return_code call_hid_driver(platform::byte_view input, platform::byte_span& output);

}  // namespace nrx
