// What reports and commands have of their own, beside the operations on a service in general.
#include "nrxctl/base/command_channel.h"

#include <array>

#include "tests/support/device_test.h"

namespace tests {

namespace {

const std::string unsupported_call =
    failed("base/command_channel.cpp", "kr == 0 ", unsupported_text);

class command_channel : public device_test {
protected:
    std::string probing(platform::return_code expected) {
        return reported(expected, [&] { return nrx::get_report_quiet("accel", 0xd1, room); });
    }

    interface_driver& accel = put_service(host, "accel", 31);
    std::array<std::uint8_t, 16> buffer{};
    platform::byte_span room = buffer;
    platform::byte_span none;
};

TEST_F(command_channel, refused_reports_and_replies_leave_the_room_as_it_was) {
    EXPECT_EQ(reported(platform::unsupported, [&] { return nrx::get_report("31", 1, room); }),
              unsupported_call);
    EXPECT_EQ(
        reported(platform::unsupported, [] { return nrx::set_report("31", 1, byte_list{1}); }),
        unsupported_call);
    EXPECT_EQ(room.size(), buffer.size());
}

TEST_F(command_channel, probing_reports_a_failed_open_alone) {
    EXPECT_EQ(probing(platform::unsupported), "");
    EXPECT_EQ(room.size(), buffer.size());
    accel.set_report(0xd1, {1, 2});
    EXPECT_EQ(probing(platform::success), "");
    EXPECT_EQ(byte_list(room.begin(), room.end()), (byte_list{1, 2}));
    host.fail_call(3, failure::io);
    EXPECT_EQ(probing(platform::simulated::io_failure),
              failed("base/channel.cpp", "kr == 0 ", io_text));
    host.remove("accel");
    EXPECT_EQ(probing(platform::not_found), "");
}

TEST_F(command_channel, commands_may_have_neither_payload_nor_response) {
    accel.set_command(0x23, [](platform::byte_view, byte_list&) { return platform::success; });
    EXPECT_EQ(nrx::send_command("accel", 0x23, {}, none), platform::success);
    EXPECT_EQ(logged("call").back(), "call accel 3 scalars [0x23] in [] results 0 room 0");
}

TEST_F(command_channel, announces_an_unsupported_command_with_its_payload_and_no_other) {
    const auto sending = [&](platform::return_code expected, nrx::expected_failure how) {
        return capture([&] {
            EXPECT_EQ(nrx::send_command("accel", 0xab, byte_list{'h', 'i'}, none, how), expected);
        });
    };
    const auto result = sending(platform::unsupported, nrx::expected_failure::is_reported);
    EXPECT_EQ(result.out,
              "command 0xab is not supported for device\n"
              "payload 00000000: 68 69                                             | hi\n");
    EXPECT_EQ(result.err, unsupported_call);
    const auto quiet = sending(platform::unsupported, nrx::expected_failure::is_silent);
    EXPECT_EQ(quiet.out + quiet.err, "");
    host.remove("accel");
    EXPECT_EQ(sending(platform::not_found, nrx::expected_failure::is_silent).err,
              failed("base/channel.cpp", "service"));
}

}  // namespace

}  // namespace tests
