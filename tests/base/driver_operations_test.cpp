// The scalar call of a service and the structure call of the HID driver.

#include <array>

#include "nrxctl/base/hid_driver.h"
#include "nrxctl/base/scalar_method.h"
#include "tests/support/device_test.h"

namespace {

using tests::byte_list;
using tests::capture;
using tests::failure;
using tests::failure_line;
using lines = std::vector<std::string>;

constexpr const char* channel_source = "nrxctl/base/channel.cpp";
constexpr const char* io_failure = "device i/o failure (0xe0000401)";

class scalar_method : public tests::device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        accel->set_scalar_method([](std::span<const std::uint64_t> scalars) {
            return scalars.size() == 3 ? platform::bad_argument : platform::success;
        });
    }

    tests::interface_driver* accel = &tests::put_service(host, "accel", 31);
};

TEST_F(scalar_method, is_called_with_any_count_of_scalars) {
    const std::array<std::uint64_t, 2> scalars{7, 0xffffffff00000001};
    EXPECT_EQ(nrx::call_scalar_method("31", scalars), platform::success);
    EXPECT_EQ(nrx::call_scalar_method("31", {}), platform::success);
    EXPECT_EQ(lines(host.log().begin() + 1, host.log().begin() + 5),
              (lines{"open accel type 0",
                     "call accel 0 scalars [0x7 0xffffffff00000001] in [] results 0 room 0",
                     "close accel", "release accel"}));
    EXPECT_EQ(logged("call").back(), "call accel 0 scalars [] in [] results 0 room 0");
}

TEST_F(scalar_method, reports_the_step_that_fails) {
    const auto call = [](std::string_view service, platform::return_code expected) {
        const std::array<std::uint64_t, 3> scalars{};
        return capture([&] { EXPECT_EQ(nrx::call_scalar_method(service, scalars), expected); }).err;
    };
    EXPECT_EQ(call("nope", platform::not_found),
              failure_line("nrxtoollib", "service", channel_source));
    host.fail_call(2, failure::io);
    EXPECT_EQ(call("31", platform::simulated::io_failure),
              failure_line("nrxtoollib", "kr == 0 ", channel_source, io_failure));
    host.fail_call(2, failure::nothing);
    EXPECT_EQ(call("31", platform::no_memory),
              failure_line("nrxtoollib", "connect", channel_source));
    EXPECT_TRUE(logged("call").empty());
    EXPECT_EQ(call("31", platform::bad_argument),
              failure_line("nrxtoollib", "kr == 0 ", "nrxctl/base/scalar_method.cpp",
                           "bad argument (0xe00002c2)"));
}

// Answers with its input, reversed, and one byte more.
class mirror final : public platform::simulated::driver {
public:
    platform::return_code open(std::uint32_t type) override {
        return type == 0x7a756d6f ? platform::success : platform::unsupported;
    }
    platform::return_code call(std::uint32_t /*selector*/, const platform::call_inputs& inputs,
                               platform::call_outputs& outputs) override {
        byte_list reply(inputs.structure.rbegin(), inputs.structure.rend());
        reply.push_back(0xff);
        return platform::simulated::answer(reply, outputs);
    }
};

class hid_driver : public tests::device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        host.add({.name = "KeltoNRXHIDDriver", .properties = {{"LocationID", 1233}}});
        host.add({.name = "another", .properties = {{"LocationID", 1234}}});
    }
    void put_driver() {
        host.add({.name = "KeltoNRXHIDDriver",
                  .properties = {{"LocationID", 1234}},
                  .unit = std::make_shared<mirror>()});
    }
    std::string call(platform::return_code expected) {
        return capture([&] {
                   EXPECT_EQ(nrx::call_hid_driver(byte_list{1, 2}, room), expected);
               })
            .err;
    }

    std::array<std::uint8_t, 8> buffer{};
    platform::byte_span room = buffer;
};

TEST_F(hid_driver, is_found_by_name_and_location_and_opened_as_a_type_of_its_own) {
    put_driver();
    EXPECT_EQ(call(platform::success), "");
    EXPECT_EQ(byte_list(room.begin(), room.end()), (byte_list{2, 1, 0xff}));
    EXPECT_EQ(host.log(),
              (lines{R"(first match {IONameMatch = "KeltoNRXHIDDriver"; LocationID = 1234})",
                     "open KeltoNRXHIDDriver type 2054516079",
                     "call KeltoNRXHIDDriver 0 scalars [] in [01 02] results 0 room 8",
                     "close KeltoNRXHIDDriver", "release KeltoNRXHIDDriver"}));
}

TEST_F(hid_driver, reports_the_step_that_fails_and_leaves_the_room_as_it_was) {
    EXPECT_EQ(call(platform::not_found), failure_line("nrxtoollib", "service", channel_source));
    put_driver();
    host.fail_call(2, failure::io);
    EXPECT_EQ(call(platform::simulated::io_failure),
              failure_line("nrxtoollib", "kr == 0 ", channel_source, io_failure));
    host.fail_call(2, failure::nothing);
    EXPECT_EQ(call(platform::no_memory), failure_line("nrxtoollib", "connect", channel_source));
    EXPECT_TRUE(logged("call").empty());
    host.fail_call(3, failure::io);
    EXPECT_EQ(call(platform::simulated::io_failure),
              failure_line("nrxtoollib", "kr == 0 ", "nrxctl/base/hid_driver.cpp", io_failure));
    EXPECT_EQ(room.size(), 8U);
}

}  // namespace
