// The replay state of the coprocessor's services, and the subcommands that show and set it.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

#include "nrxctl/base/arguments.h"
#include "nrxctl/base/identifiers.h"

namespace nrx {

// The registry name of the coprocessor's replay application.
inline constexpr const char* replay_app_name = "NRXApp";

// The known states. The coprocessor may send others.
namespace replay_state {
inline constexpr std::uint32_t inactive = 0;
inline constexpr std::uint32_t loaded = 1;
inline constexpr std::uint32_t enabled = 2;
}  // namespace replay_state

// An entry of the state report: three 32-bit words in the order of the members.
struct replay_state_entry {
    static constexpr std::size_t wire_size = 12;

    nrx::service_id service_id;
    std::uint32_t delay;  // seconds until playback starts; meaningless when read
    std::uint32_t state;
};

// Returns the state of every service that can play samples back, in the coprocessor's order.
// Returns nothing if replay is not enabled, or, with a failure report, if the state cannot be read.
std::vector<replay_state_entry> replay_status();

// Sets the state of some services; playback starts after a delay in seconds. Sends nothing unless
// every service is found. Failures are reported.
void set_replay_state(std::span<const std::string_view> services, std::uint32_t delay,
                      std::uint32_t state);

namespace replay {

// Returns true if replay is enabled; otherwise says so in a line on standard output, a failure.
bool is_enabled();

// Subcommands. Each reads its own arguments and reports its own failures.
void enable(argument_cursor& arguments);
void disable(argument_cursor& arguments);
void schedule_enable(argument_cursor& arguments);
void show_status(argument_cursor& arguments);

// Read the same arguments as enable, disable and schedule_enable, with the same messages, and do
// nothing else. A delay that is not a number of 32 bits is a usage error.
arguments_check check_services(argument_cursor& arguments);
arguments_check check_schedule(argument_cursor& arguments);

}  // namespace replay

}  // namespace nrx
