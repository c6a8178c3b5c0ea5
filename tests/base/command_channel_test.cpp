#include "nrxctl/base/command_channel.h"

#include <array>

#include "tests/support/device_test.h"

namespace {

using namespace tests;
using platform::return_code;
using lines = std::vector<std::string>;

std::string failed(std::string_view condition, std::string_view code) {
    return failure_line("nrxtoollib", condition, "nrxctl/base/command_channel.cpp", code);
}

std::string channel_failed(std::string_view condition, std::string_view code = "") {
    return failure_line("nrxtoollib", condition, "nrxctl/base/channel.cpp", code);
}

class command_channel : public device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        accel->set_report(0xd0, {1, 2, 3});
        accel->set_command(0x20, [this](platform::byte_view payload, byte_list& reply) {
            received.assign(payload.begin(), payload.end());
            reply = {9, 8};
            return platform::success;
        });
    }

    // What an operation that must end with a code writes on standard error.
    static std::string reported(return_code expected, const std::function<return_code()>& action) {
        return capture([&] { EXPECT_EQ(action(), expected); }).err;
    }
    std::string reading(std::uint32_t id, return_code expected) {
        return reported(expected, [&] { return nrx::get_report("accel", id, room); });
    }
    std::string probing(std::uint32_t id, return_code expected) {
        return reported(expected, [&] { return nrx::get_report_quiet("accel", id, room); });
    }

    interface_driver* accel = &put_service(host, "accel", 31);
    std::array<std::uint8_t, 16> buffer{};
    platform::byte_span room = buffer;
    platform::byte_span none;
    byte_list received;
};

TEST_F(command_channel, reads_a_report_and_closes_what_it_opened) {
    EXPECT_EQ(nrx::get_report("accel", 0xd0, room), platform::success);
    EXPECT_EQ(byte_list(room.begin(), room.end()), (byte_list{1, 2, 3}));
    EXPECT_EQ(lines(host.log().begin() + 2, host.log().end()),
              (lines{"open accel type 0", "call accel 2 scalars [0xd0] in [] results 0 room 16",
                     "close accel", "release accel"}));
}

TEST_F(command_channel, writes_a_report_and_sends_commands_with_or_without_payload_and_response) {
    EXPECT_EQ(nrx::set_report("31", 0xd0, byte_list{7, 0xff}), platform::success);
    EXPECT_EQ(*accel->report(0xd0), (byte_list{7, 0xff}));
    EXPECT_EQ(nrx::send_command("accel", 0x20, byte_list{5, 6}, room), platform::success);
    EXPECT_EQ(received, (byte_list{5, 6}));
    EXPECT_EQ(byte_list(room.begin(), room.end()), (byte_list{9, 8}));
    accel->set_command(0x23, [](platform::byte_view, byte_list&) { return platform::success; });
    EXPECT_EQ(nrx::send_command("accel", 0x23, {}, none), platform::success);
    EXPECT_EQ(logged("call"), (lines{"call accel 1 scalars [0xd0] in [07 ff] results 0 room 0",
                                     "call accel 3 scalars [0x20] in [05 06] results 0 room 16",
                                     "call accel 3 scalars [0x23] in [] results 0 room 0"}));
}

TEST_F(command_channel, reports_a_missing_service_unless_it_only_probes) {
    host.remove("accel");
    const std::string missing = channel_failed("service");
    EXPECT_EQ(reading(0xd0, platform::not_found), missing);
    EXPECT_EQ(probing(0xd0, platform::not_found), "");
    EXPECT_EQ(
        reported(platform::not_found, [] { return nrx::set_report("nope", 0xd0, byte_list{1}); }),
        missing);
    for (const auto how : {nrx::command_failure::is_reported, nrx::command_failure::is_silent}) {
        EXPECT_EQ(reported(platform::not_found,
                           [&] { return nrx::send_command("nope", 1, {}, none, how); }),
                  missing);
    }
    EXPECT_TRUE(logged("open").empty());
}

TEST_F(command_channel, reports_a_failed_open_even_when_it_probes) {
    host.fail_call(3, failure::io);
    EXPECT_EQ(reading(0xd0, platform::simulated::io_failure), channel_failed("kr == 0 ", io_text));
    host.fail_call(3, failure::io);
    EXPECT_EQ(probing(0xd0, platform::simulated::io_failure), channel_failed("kr == 0 ", io_text));
    host.fail_call(3, failure::nothing);
    EXPECT_EQ(reading(0xd0, platform::no_memory), channel_failed("connect"));
    EXPECT_TRUE(logged("call").empty());
    EXPECT_EQ(room.size(), buffer.size());
}

TEST_F(command_channel, a_failed_call_is_reported_and_leaves_the_room_as_it_was) {
    host.fail_call(4, failure::io);
    EXPECT_EQ(reading(0xd0, platform::simulated::io_failure), failed("kr == 0 ", io_text));
    EXPECT_EQ(probing(0x99, platform::unsupported), "");
    EXPECT_EQ(reported(platform::unsupported,
                       [] { return nrx::set_report("accel", 0x99, byte_list{1}); }),
              failed("kr == 0 ", unsupported_text));
    host.before_call(4, [&] { host.remove("accel"); });
    EXPECT_EQ(reading(0xd0, platform::not_found), failed("kr == 0 ", not_found_text));
    EXPECT_EQ(room.size(), buffer.size());
}

TEST_F(command_channel, announces_an_unsupported_command_with_its_payload_and_no_other) {
    const auto result = capture([&] {
        EXPECT_EQ(nrx::send_command("accel", 0xab, byte_list{'h', 'i'}, none),
                  platform::unsupported);
    });
    EXPECT_EQ(result.out,
              "command 0xab is not supported for device\n"
              "payload 00000000: 68 69                                             | hi\n");
    EXPECT_EQ(result.err, failed("kr == 0 ", unsupported_text));
    const auto quiet = capture([&] {
        EXPECT_EQ(nrx::send_command("accel", 0xab, {}, none, nrx::command_failure::is_silent),
                  platform::unsupported);
    });
    EXPECT_EQ(quiet.out + quiet.err, "");
    host.fail_call(4, failure::no_memory);
    const auto other = capture([&] {
        EXPECT_EQ(nrx::send_command("accel", 0x20, byte_list{1}, none), platform::no_memory);
    });
    EXPECT_EQ(other.out, "");
    EXPECT_EQ(other.err, failed("kr == 0 ", no_memory_text));
}

}  // namespace
