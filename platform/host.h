// The host that the tool runs on.
#pragma once

#include <string>

namespace platform {

// Returns a short description of the host and its device, for people, such as "virtual NRX,
// embedded".
std::string host_description();

}  // namespace platform
