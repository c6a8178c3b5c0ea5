// The statistics of the coprocessor as tables.
#pragma once

#include "platform/bytes.h"

namespace nrx {

// The most that the coprocessor returns.
inline constexpr std::size_t event_sources_capacity = 12'800;
inline constexpr std::size_t wake_requests_capacity = 108;

// Prints the event sources on standard output: a header, and a line for each whole row of a reply.
// A row is 64 bytes: a thread name ended by 0 in 36 bytes, then little-endian 32-bit numbers: event
// source, function, context, count, total time, maximum time, maximum latency.
void print_event_sources(platform::byte_view rows);

// Prints the wake requests on standard output: a header, and a line for each whole little-endian
// 32-bit count of a reply, the n-th for the wake reason n.
void print_wake_requests(platform::byte_view counts);

}  // namespace nrx
