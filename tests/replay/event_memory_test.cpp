// The memory that events lie in.
#include "nrxctl/replay/event_memory.h"

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <malloc.h>
#include <vector>

#include <gtest/gtest.h>

namespace {

using nrx::event_memory::give_back;
using nrx::event_memory::take;

constexpr std::size_t event_size = 52;
constexpr std::size_t room = 56;  // of one event
constexpr std::size_t many = 100'000;

// What the process has from the system, more or less; 0 under a sanitizer.
std::size_t bytes_in_use() {
    const auto about = ::mallinfo2();
    return about.uordblks + about.hblkhd;
}

// Events filled each with a byte of its own.
std::vector<std::uint8_t*> take_many() {
    std::vector<std::uint8_t*> events;
    for (std::size_t i = 0; i < many; ++i) {
        events.push_back(static_cast<std::uint8_t*>(take(event_size)));
        std::memset(events[i], static_cast<int>(i % 251), event_size);
    }
    return events;
}

TEST(event_memory, events_lie_side_by_side_and_apart) {
    auto events = take_many();
    for (std::size_t i = 0; i < many; ++i) {
        EXPECT_EQ(reinterpret_cast<std::uintptr_t>(events[i]) % alignof(std::uint64_t), 0U);
        ASSERT_EQ(std::count(events[i], events[i] + event_size, static_cast<std::uint8_t>(i % 251)),
                  static_cast<std::ptrdiff_t>(event_size))
            << i;
    }
    std::size_t neighbours = 0;
    for (std::size_t i = 1; i < many; ++i)
        neighbours += events[i] == events[i - 1] + room ? 1U : 0U;
    EXPECT_GE(neighbours, many - 1 - many * room / 2'000'000);
    for (std::uint8_t* event : events)
        give_back(event);
}

TEST(event_memory, what_is_given_back_in_any_order_is_used_again_or_freed) {
    give_back(take(event_size));
    const std::size_t before = bytes_in_use();
    for (int round = 0; round < 4; ++round) {
        auto events = take_many();
        if (round % 2 == 1) std::reverse(events.begin(), events.end());
        if (round == 2) std::rotate(events.begin(), events.begin() + many / 3, events.end());
        for (std::uint8_t* event : events)
            give_back(event);
    }
    EXPECT_LT(bytes_in_use(), before + 1'000'000);
    auto* first = static_cast<std::uint8_t*>(take(event_size));
    std::memset(first, 0xff, event_size);
    auto* second = static_cast<std::uint8_t*>(take(event_size));
    EXPECT_EQ(second, first + room);
    give_back(second);
    give_back(first);
}

}  // namespace
