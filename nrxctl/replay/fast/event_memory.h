// Memory for events, which lie side by side because a file has millions of them.
#pragma once

#include <cstddef>

namespace nrx::event_memory {

// Allocates memory for an event of the given size; deallocate frees it. Events are cut one after
// the other from blocks, and a block is freed with its last event. Not thread-safe.
void* allocate(std::size_t size);
void deallocate(void* event) noexcept;

// Asks the system to back the memory with huge pages where it is aligned for them.
// Mapping 4 KiB pages one by one takes longer than filling them.
void prefer_huge_pages(void* memory, std::size_t size) noexcept;

}  // namespace nrx::event_memory
