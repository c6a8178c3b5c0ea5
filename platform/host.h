// The host that the tool runs on.
#pragma once

#include <string>

namespace platform {

// Says in a few words which host and device answer, for people: "virtual NRX, embedded".
std::string host_description();

}  // namespace platform
