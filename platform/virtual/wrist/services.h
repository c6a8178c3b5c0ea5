// How the parts of the wrist device reach its interface services.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>

#include "platform/bytes.h"
#include "platform/virtual/interface_driver.h"
#include "platform/virtual/machine.h"

namespace platform::simulated {

// The driver behind an interface service, which must have been added before.
interface_driver& interface_of(const machine& device, std::string_view service);

// A report and the service that it belongs to.
struct service_report {
    std::string_view service;
    std::uint32_t id;
    byte_view bytes;
};

// Gives each service its reports.
void put_reports(const machine& device, std::span<const service_report> reports);

}  // namespace platform::simulated
