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

namespace {

using tests::byte_list;
using tests::capture;
using tests::failure;
using tests::failure_line;
using lines = std::vector<std::string>;

constexpr const char* channel_source = "nrxctl/base/channel.cpp";
constexpr const char* source = "nrxctl/base/named_property.cpp";
constexpr const char* io_failure = "device i/o failure (0xe0000401)";

class named_property : public tests::device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        accel->set_named_property("gain", {1, 2, 3});
    }

    static std::string set(std::string_view service, platform::return_code expected) {
        return capture([&] {
                   EXPECT_EQ(nrx::set_named_property(service, "gain", byte_list{8, 9}), expected);
               })
            .err;
    }
    std::string get(std::string_view service, platform::return_code expected) {
        const auto result =
            capture([&] { EXPECT_EQ(nrx::get_named_property(service, "gain", room), expected); });
        EXPECT_EQ(result.out, "");
        return result.err;
    }

    tests::interface_driver* accel = &tests::put_service(host, "accel", 31);
    std::array<std::uint8_t, 16> buffer{};
    platform::byte_span room = buffer;
};

TEST_F(named_property, is_set_by_name_and_value_in_one_structure) {
    EXPECT_EQ(set("31", platform::success), "");
    EXPECT_EQ(nrx::set_named_property("31", "", {}), platform::success);
    EXPECT_EQ(lines(host.log().begin() + 1, host.log().begin() + 5),
              (lines{"open accel type 0",
                     "call accel 4 scalars [0x5] in [67 61 69 6e 00 08 09] results 0 room 0",
                     "close accel", "release accel"}));
    EXPECT_EQ(logged("call").back(), "call accel 4 scalars [0x1] in [00] results 0 room 0");
    EXPECT_EQ(get("31", platform::success), "");
    EXPECT_EQ(byte_list(room.begin(), room.end()), (byte_list{8, 9}));
}

TEST_F(named_property, is_read_into_the_room_that_there_is) {
    EXPECT_EQ(get("31", platform::success), "");
    EXPECT_EQ(byte_list(room.begin(), room.end()), (byte_list{1, 2, 3}));
    EXPECT_EQ(
        lines(host.log().begin() + 1, host.log().end()),
        (lines{"open accel type 0", "call accel 5 scalars [] in [67 61 69 6e 00] results 0 room 16",
               "close accel", "release accel"}));
    room = room.first(2);
    EXPECT_EQ(get("31", platform::simulated::no_room),
              failure_line("nrxtoollib", "kr == 0 ", source,
                           "reply larger than the room for it (0xe0000402)"));
    EXPECT_EQ(room.size(), 2U);
}

TEST_F(named_property, reports_the_step_that_fails) {
    const std::string missing = failure_line("nrxtoollib", "service", channel_source);
    EXPECT_EQ(set("nope", platform::not_found), missing);
    EXPECT_EQ(get("nope", platform::not_found), missing);
    const std::string unopened = failure_line("nrxtoollib", "kr == 0 ", channel_source, io_failure);
    host.fail_call(2, failure::io);
    EXPECT_EQ(set("31", platform::simulated::io_failure), unopened);
    host.fail_call(2, failure::io);
    EXPECT_EQ(get("31", platform::simulated::io_failure), unopened);
    const std::string unconnected = failure_line("nrxtoollib", "connect", channel_source);
    host.fail_call(2, failure::nothing);
    EXPECT_EQ(set("31", platform::no_memory), unconnected);
    host.fail_call(2, failure::nothing);
    EXPECT_EQ(get("31", platform::no_memory), unconnected);
    EXPECT_TRUE(logged("call").empty());
    const std::string failed = failure_line("nrxtoollib", "kr == 0 ", source, io_failure);
    host.fail_call(3, failure::io);
    EXPECT_EQ(set("31", platform::simulated::io_failure), failed);
    host.fail_call(3, failure::io);
    EXPECT_EQ(get("31", platform::simulated::io_failure), failed);
    EXPECT_EQ(room.size(), buffer.size());
}

TEST_F(named_property, without_memory_for_the_message_nothing_is_sent) {
    memory_is_used_up = true;
    EXPECT_EQ(set("31", platform::no_memory), failure_line("nrxtoollib", "buffer", source));
    memory_is_used_up = false;
    EXPECT_TRUE(logged("call").empty());
    EXPECT_EQ(logged("close"), lines{"close accel"});
}

TEST_F(named_property, a_driver_without_any_is_announced_by_a_read_alone) {
    tests::put_service(host, "bare", 32);
    const std::string report =
        failure_line("nrxtoollib", "kr == 0 ", source, "unsupported request (0xe00002c7)");
    const auto read = capture(
        [&] { EXPECT_EQ(nrx::get_named_property("bare", "gain", room), platform::unsupported); });
    EXPECT_EQ(read.out, "\nget named property not supported\n");
    EXPECT_EQ(read.err, report);
    const auto write = capture([&] {
        EXPECT_EQ(nrx::set_named_property("bare", "gain", byte_list{1}), platform::unsupported);
    });
    EXPECT_EQ(write.out, "");
    EXPECT_EQ(write.err, report);
}

}  // namespace
