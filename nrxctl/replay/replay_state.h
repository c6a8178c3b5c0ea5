// The replay state of the coprocessor's services.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

namespace nrx {

// States; the coprocessor may know further ones.
namespace replay_state {
inline constexpr std::uint32_t inactive = 0;
inline constexpr std::uint32_t loaded = 1;
inline constexpr std::uint32_t enabled = 2;
}  // namespace replay_state

// An entry of the state report: three 32-bit words in the order of the members.
struct replay_state_entry {
    static constexpr std::size_t wire_size = 12;

    std::uint32_t service_id;
    std::uint32_t delay;  // seconds before playback starts; of no meaning when read
    std::uint32_t state;
};

// The state of every service that can play samples back, in the coprocessor's order; none if replay
// is not enabled, or, with a failure report, if the state cannot be read.
std::vector<replay_state_entry> replay_status();

// Sets the state of some services, playback to start after a delay in seconds. Sends nothing unless
// every service is found. Failures are reported.
void set_replay_state(std::span<const std::string_view> services, std::uint32_t delay,
                      std::uint32_t state);

}  // namespace nrx
