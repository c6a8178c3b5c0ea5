// Where events lie: side by side, as a file has millions of them.
#pragma once

#include <cstddef>

namespace nrx::event_memory {

// Room for an event of this size, to be given back with give_back. Blocks of memory are cut into
// events one after the other; a block goes back to the system with its last event. One thread at a
// time.
void* take(std::size_t size);
void give_back(void* event) noexcept;

// Asks the system to map the whole huge pages in a piece of memory each at once, as they come to be
// used. Mapping a page of four kilobytes at a time takes longer than filling it.
void prefer_huge_pages(void* memory, std::size_t size) noexcept;

}  // namespace nrx::event_memory
