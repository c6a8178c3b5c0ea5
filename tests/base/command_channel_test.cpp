// The calls of the drivers: what they have in common, then what each has of its own.
#include "nrxctl/base/command_channel.h"

#include <array>
#include <cstdlib>
#include <new>

#include "tests/base/base_host.h"
#include "tests/support/argument_vector.h"

namespace {

bool out_of_memory = false;

}  // namespace

// Allocates arrays, so that a test can let it fail.
void* operator new[](std::size_t size, const std::nothrow_t& /*tag*/) noexcept {
    return out_of_memory ? nullptr : std::malloc(size);
}
void* operator new[](std::size_t size) {
    if (void* memory = std::malloc(size)) return memory;
    throw std::bad_alloc();
}
void operator delete[](void* memory) noexcept {
    std::free(memory);
}
void operator delete[](void* memory, std::size_t /*size*/) noexcept {
    std::free(memory);
}

namespace tests {

namespace {

using platform::return_code;
constexpr const char* calls_file = source_file::command_channel;
const std::string unsupported_call = library_report(calls_file, "kr == 0 ", unsupported_text);

struct operation {
    std::string call;  // as the log writes it
    std::function<return_code()> run;
    byte_list reply = {};  // what the driver returns
};

class driver_calls : public device_test {
protected:
    driver_calls() {
        host.add({.name = "KeltoNRXHIDDriver", .properties = {{"LocationID", 1233}}});
        host.add({.name = "another", .properties = {{"LocationID", 1234}}});
        add_base_services(host);
    }

    // Runs an operation with the whole buffer, which must be unchanged on failure.
    std::string run(const operation& operation, return_code expected) {
        reply = buffer;
        std::string err = report_of(expected, operation.run);
        EXPECT_TRUE(expected == platform::success || reply.size() == buffer.size());
        return err;
    }

    [[nodiscard]] byte_list buffer_bytes() const { return {buffer.begin(), buffer.end()}; }

    std::array<std::uint8_t, 16> buffer{};
    platform::byte_span reply = buffer;
    const byte_list value{8, 9};
    const std::array<std::uint64_t, 2> scalars{7, 0xffffffff00000001};
    const std::vector<operation> operations{
        {"call accel 2 scalars [0xd0] in [] results 0 capacity 16",
         [&] { return nrx::get_report("31", 0xd0, reply); },
         {1, 2, 3}},
        {"call accel 1 scalars [0xd0] in [08 09] results 0 capacity 0",
         [&] { return nrx::set_report("0x1f", 0xd0, value); }},
        {"call accel 3 scalars [0x20] in [08 09] results 0 capacity 16",
         [&] { return nrx::send_command("31", 0x20, value, reply); },
         {9, 8}},
        {"call accel 0 scalars [0x7 0xffffffff00000001] in [] results 0 capacity 0",
         [&] { return nrx::call_scalar_method("31", scalars); }},
        {"call accel 0 scalars [] in [] results 0 capacity 0",
         [&] { return nrx::call_scalar_method("31", {}); }},
        {"call accel 5 scalars [] in [67 61 69 6e 00] results 0 capacity 16",
         [&] { return nrx::get_named_property("31", "gain", reply); },
         {4, 5, 6}},
        {"call accel 4 scalars [0x5] in [67 61 69 6e 00 08 09] results 0 capacity 0",
         [&] { return nrx::set_named_property("31", "gain", value); }},
        {"call KeltoNRXHIDDriver 0 scalars [] in [08 09] results 0 capacity 16",
         [&] { return nrx::call_hid_driver(value, reply); },
         {9, 8, 0xff}},
    };
};

TEST_F(driver_calls, find_open_call_close_and_release_in_that_order) {
    for (const operation& operation : operations) {
        const bool is_hid = operation.call.starts_with("call KeltoNRXHIDDriver ");
        const auto before = static_cast<std::ptrdiff_t>(host.log().size());
        EXPECT_EQ(run(operation, platform::success), "");
        const byte_list expected = operation.reply.empty() ? buffer_bytes() : operation.reply;
        EXPECT_EQ(byte_list(reply.begin(), reply.end()), expected);
        const std::string interface_31 =
            R"({IOProviderClass = "KeltoNRXInterface"; IOPropertyMatch = {service_id = 31}})";
        const lines on_accel{"first match " + interface_31, "open accel type 0", operation.call,
                             "close accel", "release accel"};
        const lines on_hid_driver{
            R"(first match {IONameMatch = "KeltoNRXHIDDriver"; LocationID = 1234})",
            "open KeltoNRXHIDDriver type 2054516079", operation.call, "close KeltoNRXHIDDriver",
            "release KeltoNRXHIDDriver"};
        EXPECT_EQ(lines(host.log().begin() + before, host.log().end()),
                  is_hid ? on_hid_driver : on_accel);
    }
    EXPECT_EQ(nrx::get_report("accel", 0xd0, reply = buffer), platform::success);
    EXPECT_EQ(byte_list(reply.begin(), reply.end()), value);
}

TEST_F(driver_calls, failed_step_is_reported_and_ends_the_call) {
    const char* channel = source_file::channel;
    for (const operation& operation : operations) {
        const std::size_t called = logged_calls("call").size();
        host.fail_call(2, failure::io);
        EXPECT_EQ(run(operation, platform::simulated::io_failure),
                  library_report(channel, "kr == 0 ", io_text));
        host.fail_call(2, failure::unsupported);
        EXPECT_EQ(run(operation, platform::unsupported),
                  library_report(channel, "kr == 0 ", unsupported_text));
        host.fail_call(2, failure::empty_result);
        EXPECT_EQ(run(operation, platform::no_memory), library_report(channel, "connect"));
        EXPECT_EQ(logged_calls("call").size(), called);
        host.fail_call(3, failure::no_memory);
        EXPECT_EQ(run(operation, platform::no_memory),
                  library_report(calls_file, "kr == 0 ", no_memory_text));
    }
    host.before_call(3, [&] { host.remove("accel"); });
    EXPECT_EQ(run(operations[0], platform::not_found),
              library_report(calls_file, "kr == 0 ", not_found_text));
    host.remove("KeltoNRXHIDDriver");
    host.remove("KeltoNRXHIDDriver");
    const std::size_t opened = logged_calls("open").size();
    for (const operation& operation : operations)
        EXPECT_EQ(run(operation, platform::not_found), library_report(channel, "service"));
    EXPECT_EQ(logged_calls("open").size(), opened);
}

class command_channel : public device_test {
protected:
    std::string probe(platform::return_code expected) {
        return report_of(expected, [&] { return nrx::get_report_quiet("accel", 0xd1, reply); });
    }

    interface_driver& accel = add_service(host, "accel", 31);
    std::array<std::uint8_t, 16> buffer{};
    platform::byte_span reply = buffer;
    platform::byte_span none;
};

TEST_F(command_channel, probing_reports_only_a_failed_open) {
    EXPECT_EQ(probe(platform::unsupported), "");
    EXPECT_EQ(reply.size(), buffer.size());
    accel.set_report(0xd1, {1, 2});
    EXPECT_EQ(probe(platform::success), "");
    EXPECT_EQ(byte_list(reply.begin(), reply.end()), (byte_list{1, 2}));
    host.fail_call(3, failure::io);
    EXPECT_EQ(probe(platform::simulated::io_failure),
              library_report(source_file::channel, "kr == 0 ", io_text));
    host.remove("accel");
    EXPECT_EQ(probe(platform::not_found), "");
}

TEST_F(command_channel, command_needs_neither_payload_nor_response) {
    accel.set_command(0x23, [](platform::byte_view, byte_list&) { return platform::success; });
    EXPECT_EQ(nrx::send_command("accel", 0x23, {}, none), platform::success);
    EXPECT_EQ(logged_calls("call").back(),
              "call accel 3 scalars [0x23] in [] results 0 capacity 0");
}

TEST_F(command_channel, unsupported_command_is_printed_with_its_payload) {
    const auto send = [&](platform::return_code expected, nrx::on_failure on_call_failure) {
        return capture([&] {
            EXPECT_EQ(nrx::send_command("accel", 0xab, byte_list{'h', 'i'}, none, on_call_failure),
                      expected);
        });
    };
    const auto result = send(platform::unsupported, nrx::on_failure::report);
    EXPECT_EQ(result.out,
              "command 0xab is not supported for device\n"
              "payload 00000000: 68 69                                             | hi\n");
    EXPECT_EQ(result.err, unsupported_call);
    const auto quiet = send(platform::unsupported, nrx::on_failure::ignore);
    EXPECT_EQ(quiet.out + quiet.err, "");
    host.remove("accel");
    EXPECT_EQ(send(platform::not_found, nrx::on_failure::ignore).err,
              library_report(source_file::channel, "service"));
}

class named_property : public device_test {
protected:
    static platform::return_code set() {
        return nrx::set_named_property("31", "gain", byte_list{8, 9});
    }
    platform::return_code get() { return nrx::get_named_property("31", "gain", reply); }

    interface_driver& accel = add_service(host, "accel", 31);
    std::array<std::uint8_t, 16> buffer{};
    platform::byte_span reply = buffer;
};

TEST_F(named_property, reads_back_as_set_if_the_buffer_is_large_enough) {
    accel.set_named_property("gain", {1, 2, 3});
    reply = reply.first(2);
    EXPECT_EQ(
        report_of(platform::simulated::buffer_too_small, [&] { return get(); }),
        library_report(calls_file, "kr == 0 ", "reply larger than the room for it (0xe0000402)"));
    EXPECT_EQ(reply.size(), 2U);
    EXPECT_EQ(set(), platform::success);
    EXPECT_EQ(get(), platform::success);
    EXPECT_EQ(byte_list(reply.begin(), reply.end()), (byte_list{8, 9}));
    EXPECT_EQ(nrx::set_named_property("31", "", {}), platform::success);
    EXPECT_EQ(logged_calls("call").back(),
              "call accel 4 scalars [0x1] in [00] results 0 capacity 0");
}

TEST_F(named_property, nothing_is_sent_without_memory_for_the_message) {
    out_of_memory = true;
    EXPECT_EQ(report_of(platform::no_memory, set), library_report(calls_file, "buffer"));
    out_of_memory = false;
    EXPECT_TRUE(logged_calls("call").empty());
    EXPECT_EQ(logged_calls("close"), std::vector<std::string>{"close accel"});
}

TEST_F(named_property, unsupported_read_prints_a_line_and_unsupported_set_does_not) {
    const std::string report = library_report(calls_file, "kr == 0 ", unsupported_text);
    const auto read = capture([&] { EXPECT_EQ(get(), platform::unsupported); });
    EXPECT_EQ(read.out, "\nget named property not supported\n");
    EXPECT_EQ(read.err, report);
    EXPECT_EQ(report_of(platform::unsupported, set), report);
}

}  // namespace

}  // namespace tests
