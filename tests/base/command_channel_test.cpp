#include "nrxctl/base/command_channel.h"

#include <array>

#include "tests/support/device_test.h"

namespace {

using tests::byte_list;
using tests::capture;
using tests::failure;
using tests::failure_line;
using tests::put_service;

constexpr const char* channel_source = "nrxctl/base/channel.cpp";
constexpr const char* source = "nrxctl/base/command_channel.cpp";
constexpr const char* io_failure = "device i/o failure (0xe0000401)";

class command_channel : public tests::device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        accel->set_report(0xd0, {1, 2, 3});
        accel->set_command(0x20, [this](platform::byte_view payload, byte_list& reply) {
            received.assign(payload.begin(), payload.end());
            reply = {9, 8};
            return platform::success;
        });
        host.record_calls();
    }

    tests::interface_driver* accel = &put_service(host, "accel", 31);
    std::array<std::uint8_t, 16> buffer{};
    platform::byte_span room = buffer;
    platform::byte_span none;
    byte_list received;
};

TEST_F(command_channel, reads_a_report_and_closes_what_it_opened) {
    EXPECT_EQ(nrx::get_report("accel", 0xd0, room), platform::success);
    EXPECT_EQ(byte_list(room.begin(), room.end()), (byte_list{1, 2, 3}));
    EXPECT_EQ(std::vector<std::string>(host.log().begin() + 2, host.log().end()),
              (std::vector<std::string>{"open accel type 0",
                                        "call accel 2 scalars [0xd0] in [] results 0 room 16",
                                        "close accel", "release accel"}));
}

TEST_F(command_channel, writes_a_report) {
    EXPECT_EQ(nrx::set_report("31", 0xd0, byte_list{7, 0xff}), platform::success);
    EXPECT_EQ(*accel->report(0xd0), (byte_list{7, 0xff}));
    EXPECT_EQ(
        logged("call"),
        (std::vector<std::string>{"call accel 1 scalars [0xd0] in [07 ff] results 0 room 0"}));
}

TEST_F(command_channel, sends_a_command_with_or_without_payload_and_response) {
    EXPECT_EQ(nrx::send_command("accel", 0x20, byte_list{5, 6}, room), platform::success);
    EXPECT_EQ(received, (byte_list{5, 6}));
    EXPECT_EQ(byte_list(room.begin(), room.end()), (byte_list{9, 8}));
    accel->set_command(0x23, [](platform::byte_view, byte_list&) { return platform::success; });
    EXPECT_EQ(nrx::send_command("accel", 0x23, {}, none), platform::success);
    EXPECT_EQ(logged("call"),
              (std::vector<std::string>{"call accel 3 scalars [0x20] in [05 06] results 0 room 16",
                                        "call accel 3 scalars [0x23] in [] results 0 room 0"}));
}

TEST_F(command_channel, reports_a_missing_service_unless_it_only_probes) {
    const std::string missing = failure_line("nrxtoollib", "service", channel_source);
    const auto result = capture([&] {
        EXPECT_EQ(nrx::get_report("nope", 0xd0, room), platform::not_found);
        EXPECT_EQ(nrx::set_report("nope", 0xd0, byte_list{1}), platform::not_found);
        EXPECT_EQ(nrx::send_command("nope", 1, {}, none), platform::not_found);
        EXPECT_EQ(nrx::send_command("nope", 1, {}, none, nrx::command_failure::is_silent),
                  platform::not_found);
    });
    EXPECT_EQ(result.err, missing + missing + missing + missing);
    const auto quiet =
        capture([&] { EXPECT_EQ(nrx::get_report_quiet("nope", 0xd0, room), platform::not_found); });
    EXPECT_EQ(quiet.err, "");
    EXPECT_TRUE(logged("open").empty());
}

TEST_F(command_channel, reports_a_failed_open_even_when_it_probes) {
    for (const bool probing : {false, true}) {
        host.fail_call(3, failure::io);
        const auto result = capture([&] {
            EXPECT_EQ(probing ? nrx::get_report_quiet("accel", 0xd0, room)
                              : nrx::get_report("accel", 0xd0, room),
                      platform::simulated::io_failure);
        });
        EXPECT_EQ(result.err, failure_line("nrxtoollib", "kr == 0 ", channel_source, io_failure));
    }
}

TEST_F(command_channel, an_open_without_a_connection_ends_without_a_call) {
    host.fail_call(3, failure::nothing);
    const auto result =
        capture([&] { EXPECT_NE(nrx::get_report("accel", 0xd0, room), platform::success); });
    EXPECT_EQ(result.err, failure_line("nrxtoollib", "connect", channel_source));
    EXPECT_TRUE(logged("call").empty());
    EXPECT_EQ(room.size(), buffer.size());
}

TEST_F(command_channel, a_failed_call_leaves_the_room_as_it_was) {
    host.fail_call(4, failure::io);
    const auto result = capture(
        [&] { EXPECT_EQ(nrx::get_report("accel", 0xd0, room), platform::simulated::io_failure); });
    EXPECT_EQ(result.err, failure_line("nrxtoollib", "kr == 0 ", source, io_failure));
    EXPECT_EQ(room.size(), buffer.size());
    const auto quiet = capture(
        [&] { EXPECT_EQ(nrx::get_report_quiet("accel", 0x99, room), platform::unsupported); });
    EXPECT_EQ(quiet.err, "");
    const auto write = capture(
        [&] { EXPECT_EQ(nrx::set_report("accel", 0x99, byte_list{1}), platform::unsupported); });
    EXPECT_EQ(write.err,
              failure_line("nrxtoollib", "kr == 0 ", source, "unsupported request (0xe00002c7)"));
}

TEST_F(command_channel, announces_an_unsupported_command_with_its_payload) {
    const auto result = capture([&] {
        EXPECT_EQ(nrx::send_command("accel", 0xab, byte_list{'h', 'i'}, none),
                  platform::unsupported);
    });
    EXPECT_EQ(result.out,
              "command 0xab is not supported for device\n"
              "payload 00000000: 68 69                                             | hi\n");
    EXPECT_EQ(result.err,
              failure_line("nrxtoollib", "kr == 0 ", source, "unsupported request (0xe00002c7)"));
    const auto quiet = capture([&] {
        EXPECT_EQ(nrx::send_command("accel", 0xab, {}, none, nrx::command_failure::is_silent),
                  platform::unsupported);
    });
    EXPECT_EQ(quiet.out + quiet.err, "");
}

TEST_F(command_channel, any_other_failure_of_a_command_is_only_reported) {
    host.fail_call(4, failure::no_memory);
    const auto result = capture([&] {
        EXPECT_EQ(nrx::send_command("accel", 0x20, byte_list{1}, none), platform::no_memory);
    });
    EXPECT_EQ(result.out, "");
    EXPECT_EQ(result.err,
              failure_line("nrxtoollib", "kr == 0 ", source, "out of memory (0xe00002bd)"));
}

TEST_F(command_channel, a_service_that_goes_away_before_the_call_is_a_failed_call) {
    host.before_call(4, [&] { host.remove("accel"); });
    const auto result =
        capture([&] { EXPECT_EQ(nrx::get_report("accel", 0xd0, room), platform::not_found); });
    EXPECT_EQ(result.err,
              failure_line("nrxtoollib", "kr == 0 ", source, "service not found (0xe00002f0)"));
}

}  // namespace
