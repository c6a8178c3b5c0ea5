#include "nrxctl/replay/fast/event_memory.h"

#include <cstdint>
#include <cstdlib>
#include <memory>
#include <new>
#include <sys/mman.h>

namespace nrx::event_memory {

namespace {

constexpr std::size_t huge_page_size = std::size_t{1} << 21;

// A block is as large as a huge page and aligned to its size, so that the address of an event gives
// its block, and the system can map the block as a whole.
constexpr std::size_t block_size = huge_page_size;

struct block {
    std::size_t used = sizeof(block);
    std::size_t events = 0;
};

// The block in which the next event is allocated. It is kept even if it becomes empty.
block* current = nullptr;

block* block_of(void* event) {
    const auto offset = reinterpret_cast<std::uintptr_t>(event) % block_size;
    return reinterpret_cast<block*>(static_cast<std::byte*>(event) - offset);
}

// The first block may never fill up, so it does not ask for huge pages.
block* make_block(bool is_first) {
    void* memory = std::aligned_alloc(block_size, block_size);
    if (memory == nullptr) throw std::bad_alloc();
    if (!is_first) prefer_huge_pages(memory, block_size);
    return new (memory) block;
}

}  // namespace

void* allocate(std::size_t size) {
    constexpr std::size_t alignment = alignof(std::uint64_t);
    const std::size_t aligned_size = (size + alignment - 1) / alignment * alignment;
    if (current == nullptr || current->used + aligned_size > block_size)
        current = make_block(current == nullptr);
    void* event = reinterpret_cast<std::byte*>(current) + current->used;
    current->used += aligned_size;
    ++current->events;
    return event;
}

void deallocate(void* event) noexcept {
    block* owner = block_of(event);
    if (--owner->events > 0) return;
    if (owner == current) {
        owner->used = sizeof(block);
    } else {
        std::free(owner);
    }
}

void prefer_huge_pages(void* memory, std::size_t size) noexcept {
    void* first = memory;
    if (std::align(huge_page_size, huge_page_size, first, size) == nullptr) return;
    ::madvise(first, size / huge_page_size * huge_page_size, MADV_HUGEPAGE);
}

}  // namespace nrx::event_memory
