// Properties of a registry service.
#pragma once

#include "platform/property.h"
#include "platform/registry.h"
#include "platform/return_code.h"

namespace nrx {

// Sets a property. Fails, with a failure report, with bad_argument if there is no name or no value
// (null), else with the platform's code.
platform::return_code set_service_property(const platform::service& service, const char* name,
                                           const platform::property* value);

// Prints the platform's description of a property as a line on standard error; a missing name
// (null) or property is a failure report. Returns success always.
platform::return_code show_service_property(const platform::service& service, const char* name);

}  // namespace nrx
