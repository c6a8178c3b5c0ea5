// What the operations on a service have in common: each finds it, opens it, and calls it once.

#include <array>

#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/hid_driver.h"
#include "nrxctl/base/named_property.h"
#include "nrxctl/base/scalar_method.h"
#include "tests/base/base_host.h"

namespace tests {

namespace {

using platform::return_code;
using lines = std::vector<std::string>;

struct operation {
    const char* file;
    std::string call;  // in the words of the log
    std::function<return_code()> run;
    byte_list reply = {};  // which comes into the room
};

class channel_operations : public device_test {
protected:
    channel_operations() {
        host.add({.name = "KeltoNRXHIDDriver", .properties = {{"LocationID", 1233}}});
        host.add({.name = "another", .properties = {{"LocationID", 1234}}});
        put_base_services(host);
    }

    // Runs an operation with the whole room, of which one that fails leaves all.
    std::string run(const operation& one, return_code expected) {
        room = buffer;
        std::string err = reported(expected, one.run);
        EXPECT_TRUE(expected == platform::success || room.size() == buffer.size());
        return err;
    }

    [[nodiscard]] byte_list buffer_bytes() const { return {buffer.begin(), buffer.end()}; }

    std::array<std::uint8_t, 16> buffer{};
    platform::byte_span room = buffer;
    const byte_list value{8, 9};
    const std::array<std::uint64_t, 2> scalars{7, 0xffffffff00000001};
    const std::vector<operation> operations{
        {"base/command_channel.cpp",
         "call accel 2 scalars [0xd0] in [] results 0 room 16",
         [&] { return nrx::get_report("31", 0xd0, room); },
         {1, 2, 3}},
        {"base/command_channel.cpp", "call accel 1 scalars [0xd0] in [08 09] results 0 room 0",
         [&] { return nrx::set_report("0x1f", 0xd0, value); }},
        {"base/command_channel.cpp",
         "call accel 3 scalars [0x20] in [08 09] results 0 room 16",
         [&] { return nrx::send_command("31", 0x20, value, room); },
         {9, 8}},
        {"base/scalar_method.cpp",
         "call accel 0 scalars [0x7 0xffffffff00000001] in [] results 0 room 0",
         [&] { return nrx::call_scalar_method("31", scalars); }},
        {"base/scalar_method.cpp", "call accel 0 scalars [] in [] results 0 room 0",
         [&] { return nrx::call_scalar_method("31", {}); }},
        {"base/named_property.cpp",
         "call accel 5 scalars [] in [67 61 69 6e 00] results 0 room 16",
         [&] { return nrx::get_named_property("31", "gain", room); },
         {4, 5, 6}},
        {"base/named_property.cpp",
         "call accel 4 scalars [0x5] in [67 61 69 6e 00 08 09] results 0 room 0",
         [&] { return nrx::set_named_property("31", "gain", value); }},
        {"base/hid_driver.cpp",
         "call KeltoNRXHIDDriver 0 scalars [] in [08 09] results 0 room 16",
         [&] { return nrx::call_hid_driver(value, room); },
         {9, 8, 0xff}},
    };
};

TEST_F(channel_operations, find_open_call_close_and_release) {
    for (const operation& one : operations) {
        const bool is_hid = one.call.starts_with("call KeltoNRXHIDDriver ");
        const auto before = static_cast<std::ptrdiff_t>(host.log().size());
        EXPECT_EQ(run(one, platform::success), "");
        const byte_list reply = one.reply.empty() ? buffer_bytes() : one.reply;
        EXPECT_EQ(byte_list(room.begin(), room.end()), reply);
        const std::string interface_31 =
            R"({IOProviderClass = "KeltoNRXInterface"; IOPropertyMatch = {service_id = 31}})";
        const lines on_accel{"first match " + interface_31, "open accel type 0", one.call,
                             "close accel", "release accel"};
        const lines on_hid_driver{
            R"(first match {IONameMatch = "KeltoNRXHIDDriver"; LocationID = 1234})",
            "open KeltoNRXHIDDriver type 2054516079", one.call, "close KeltoNRXHIDDriver",
            "release KeltoNRXHIDDriver"};
        EXPECT_EQ(lines(host.log().begin() + before, host.log().end()),
                  is_hid ? on_hid_driver : on_accel);
    }
    EXPECT_EQ(nrx::get_report("accel", 0xd0, room = buffer), platform::success);
    EXPECT_EQ(byte_list(room.begin(), room.end()), value);
}

TEST_F(channel_operations, report_the_step_that_fails_and_end_there) {
    const char* channel = "base/channel.cpp";
    for (const operation& one : operations) {
        const std::size_t called = logged("call").size();
        host.fail_call(2, failure::io);
        EXPECT_EQ(run(one, platform::simulated::io_failure), failed(channel, "kr == 0 ", io_text));
        host.fail_call(2, failure::unsupported);
        EXPECT_EQ(run(one, platform::unsupported), failed(channel, "kr == 0 ", unsupported_text));
        host.fail_call(2, failure::nothing);
        EXPECT_EQ(run(one, platform::no_memory), failed(channel, "connect"));
        EXPECT_EQ(logged("call").size(), called);
        host.fail_call(3, failure::no_memory);
        EXPECT_EQ(run(one, platform::no_memory), failed(one.file, "kr == 0 ", no_memory_text));
    }
    host.before_call(3, [&] { host.remove("accel"); });
    EXPECT_EQ(run(operations[0], platform::not_found),
              failed(operations[0].file, "kr == 0 ", not_found_text));
    host.remove("KeltoNRXHIDDriver");
    host.remove("KeltoNRXHIDDriver");
    const std::size_t opened = logged("open").size();
    for (const operation& one : operations)
        EXPECT_EQ(run(one, platform::not_found), failed(channel, "service"));
    EXPECT_EQ(logged("open").size(), opened);
}

}  // namespace

}  // namespace tests
