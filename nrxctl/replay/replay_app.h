// The replay application of the coprocessor: how it is named and spoken to.
#pragma once

#include <cstdint>

namespace nrx::replay_app {

// Its registry name.
inline constexpr const char* service_name = "NRXApp";

// The report with the replay state of every service, read and written.
inline constexpr std::uint32_t state_report = 0x47;

// Methods of its driver. Loading takes the service's samples behind a header of five words: service
// id, completion policy, location, filter, and the byte count of the samples. Unloading takes a
// service id.
inline constexpr std::uint32_t load_method = 0;
inline constexpr std::uint32_t unload_method = 1;

}  // namespace nrx::replay_app
