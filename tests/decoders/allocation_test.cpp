// Printing a record allocates nothing, once the first ones are printed.
#include <atomic>
#include <cstdlib>
#include <new>

#include "nrxctl/decoders/record_text.h"
#include "platform/virtual/time_sync.h"
#include "tests/decoders/event_record.h"
#include "tests/support/device_test.h"

namespace {

std::atomic<std::size_t> allocations = 0;

void* allocate(std::size_t size) {
    ++allocations;
    if (void* room = std::malloc(size)) return room;
    throw std::bad_alloc();
}

}  // namespace

// All other forms of the standard library end in these.
void* operator new(std::size_t size) {
    return allocate(size);
}
void operator delete(void* room) noexcept {
    std::free(room);
}
void operator delete(void* room, std::size_t /*size*/) noexcept {
    std::free(room);
}

namespace {

TEST(allocation, no_record_allocates_in_the_steady_state) {
    tests::machine host;
    const platform::simulated::installed_machine installed(host);
    add_time_sync(host, [] { return platform::simulated::sync_point{1, 2}; });
    host.set_boot_time({1, 2});
    std::vector<nrx::profile_record> records;
    for (int id = 0; id < 256; ++id) {
        const auto byte = static_cast<std::uint8_t>(id);
        records.push_back(tests::record_of({byte, byte, 0, 3}, {}, 'x'));
        records.push_back(tests::record_of({4, 0, 0, byte}, {}, 0xff));
        records.back().bytes[13] = byte;
    }
    std::size_t counted = 1;
    const auto result = tests::capture([&] {
        nrx::print_profile_record(records[0]);
        const std::size_t before = allocations;
        for (const nrx::profile_record& record : records)
            nrx::print_profile_record(record);
        counted = allocations - before;
    });
    EXPECT_EQ(counted, 0U);
    EXPECT_NE(result.out.find("'calendar-time'"), std::string::npos);
    EXPECT_GT(allocations, 0U);
}

}  // namespace
