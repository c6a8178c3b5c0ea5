#include "nrxctl/base/named_property.h"

#include <array>
#include <cstdlib>
#include <new>

#include "tests/support/device_test.h"

namespace {

bool memory_is_used_up = false;

}  // namespace

// Room for arrays comes from here, so that it can be refused.
void* operator new[](std::size_t size, const std::nothrow_t& /*tag*/) noexcept {
    return memory_is_used_up ? nullptr : std::malloc(size);
}
void* operator new[](std::size_t size) {
    if (void* room = std::malloc(size)) return room;
    throw std::bad_alloc();
}
void operator delete[](void* room) noexcept {
    std::free(room);
}
void operator delete[](void* room, std::size_t /*size*/) noexcept {
    std::free(room);
}

namespace tests {

namespace {

constexpr const char* file = "base/named_property.cpp";

class named_property : public device_test {
protected:
    static platform::return_code set() {
        return nrx::set_named_property("31", "gain", byte_list{8, 9});
    }
    platform::return_code get() { return nrx::get_named_property("31", "gain", room); }

    interface_driver& accel = put_service(host, "accel", 31);
    std::array<std::uint8_t, 16> buffer{};
    platform::byte_span room = buffer;
};

TEST_F(named_property, reads_back_as_it_was_set_into_the_room_that_there_is) {
    accel.set_named_property("gain", {1, 2, 3});
    room = room.first(2);
    EXPECT_EQ(reported(platform::simulated::no_room, [&] { return get(); }),
              failed(file, "kr == 0 ", "reply larger than the room for it (0xe0000402)"));
    EXPECT_EQ(room.size(), 2U);
    EXPECT_EQ(set(), platform::success);
    EXPECT_EQ(get(), platform::success);
    EXPECT_EQ(byte_list(room.begin(), room.end()), (byte_list{8, 9}));
    EXPECT_EQ(nrx::set_named_property("31", "", {}), platform::success);
    EXPECT_EQ(logged("call").back(), "call accel 4 scalars [0x1] in [00] results 0 room 0");
}

TEST_F(named_property, without_memory_for_the_message_nothing_is_sent) {
    memory_is_used_up = true;
    EXPECT_EQ(reported(platform::no_memory, set), failed(file, "buffer"));
    memory_is_used_up = false;
    EXPECT_TRUE(logged("call").empty());
    EXPECT_EQ(logged("close"), std::vector<std::string>{"close accel"});
}

// It is the call that must have refused, not the opening.
TEST_F(named_property, a_driver_without_any_is_announced_by_a_read_alone) {
    const std::string report = failed(file, "kr == 0 ", unsupported_text);
    const auto read = capture([&] { EXPECT_EQ(get(), platform::unsupported); });
    EXPECT_EQ(read.out, "\nget named property not supported\n");
    EXPECT_EQ(read.err, report);
    EXPECT_EQ(reported(platform::unsupported, set), report);
}

}  // namespace

}  // namespace tests
