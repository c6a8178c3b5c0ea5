#include "nrxctl/profiler/scm_monitor.h"

#include <chrono>
#include <csignal>

#include "tests/profiler/profiler_host.h"
#include "tests/support/word_vector.h"

namespace tests {

namespace {

constexpr const char* scm_file = "profiler/scm_monitor.cpp";

std::string config(const std::string& component, const std::string& state,
                   const std::string& mask) {
    return "call profile 3 scalars [0x24] in [" + config_bytes("09", component, state, mask) +
           "] results 0 room 0";
}

const std::string duration_call = "call profile 1 scalars [0xd2] in [10 27 00 00] results 0 room 0";
const std::string log_call = "call profile 2 scalars [0xd1] in [] results 0 room 65536";
const std::string stop_call = config("00", "02", "ff ff ff ff");
const std::string start_call = config("02", "00", "80 00 00 00");

}  // namespace

class scm_monitor : public profiler_test {
protected:
    // A transfer on smb1, channel 7, and the end of the stream.
    void stream_a_transfer() {
        driver->queue->add(joined({{3, 7, 2, 9}, words_of({1, 100, 0, 1, 5000}), byte_list(24)}));
        driver->queue->add(record_bytes(0, 0));
    }

    static outcome monitor(const std::string& duration, const std::string& words = "scm:smb1:ch7") {
        const word_vector further(split(words));
        int index = 0;
        return capture([&] { nrx::scm_monitor(duration, further.all(), index); });
    }
};

TEST_F(scm_monitor, configures_the_coprocessor_alone_and_prints_the_transfers) {
    put_both_halves();
    stream_a_transfer();
    const outcome written = monitor("10");
    EXPECT_EQ(written.out, "smb1.7: scm_write wqr_timestamp=100 scm_timestamp=5000\ndone\n");
    EXPECT_EQ(written.err, "");
    EXPECT_EQ(logged("call"), (lines{status_call, enable_call, start_call, duration_call, log_call,
                                     stop_call, disable_call}));
}

TEST_F(scm_monitor, takes_interrupts_until_just_before_it_disables) {
    put_both_halves();
    stream_a_transfer();
    std::map<std::string, bool> handled;  // by call
    for (std::size_t call = 1; call < 100; ++call)
        host.before_call(call, [&] { handled[host.log().back()] = !has_default_action(); });
    monitor("10");
    EXPECT_TRUE(handled.at(enable_call));
    EXPECT_FALSE(handled.at(disable_call));
}

TEST_F(scm_monitor, leaves_the_profiler_enabled_for_a_client_that_is_connected) {
    put_both_halves();
    driver->answers[1] = {{.scalar = 1}};
    stream_a_transfer();
    EXPECT_EQ(monitor("10").err, "");
    EXPECT_EQ(logged("call"), (lines{status_call, start_call, duration_call, log_call, stop_call}));
}

TEST_F(scm_monitor, disables_what_it_enabled_after_every_failure) {
    put_both_halves();
    answer(0x24, platform::unsupported);
    const outcome refused = monitor("10");
    EXPECT_EQ(refused.out, "Can't enable SCM profiler\n");
    EXPECT_EQ(refused.err, failed(scm_file, "success"));
    EXPECT_EQ(logged("call"), (lines{status_call, enable_call, start_call, disable_call}));

    service->set_command(0x24, [times = 0](platform::byte_view, byte_list&) mutable {
        return times++ == 0 ? platform::success : platform::simulated::io_failure;
    });
    driver->queue = nullptr;
    const outcome unmapped = monitor("10");
    EXPECT_TRUE(
        unmapped.err.ends_with(failed(monitor_file, "success") + failed(scm_file, "success")));
    EXPECT_EQ(logged("call").back(), disable_call);
}

TEST_F(scm_monitor, goes_on_if_the_driver_will_not_enable_but_not_if_it_tells_no_status) {
    put_both_halves();
    stream_a_transfer();
    driver->answers[0] = {{.code = platform::simulated::io_failure}};
    const std::string refused = failed(kernel_file, "kr == 0 ", io_text);
    const outcome not_enabled = monitor("10");
    EXPECT_EQ(not_enabled.out, "smb1.7: scm_write wqr_timestamp=100 scm_timestamp=5000\ndone\n");
    EXPECT_EQ(not_enabled.err, refused + refused);
    happened();

    driver->answers[1] = {{.code = platform::simulated::io_failure}};
    const outcome no_status = monitor("10");
    EXPECT_EQ(no_status.out, "");
    EXPECT_EQ(no_status.err, refused + failed(scm_file, "success"));
    EXPECT_EQ(happened(), (lines{"open KeltoNRXProfileDriver type 0", status_call,
                                 "close KeltoNRXProfileDriver"}));
}

TEST_F(scm_monitor, interrupted_in_its_wait_it_stops_the_stream_and_puts_everything_back) {
    put_both_halves();
    driver->actions[11] = [this] { driver->queue->add(record_bytes(0, 0)); };
    host.clock().plan(std::chrono::milliseconds(30), [] { std::raise(SIGINT); });
    const outcome written = monitor("auto");
    EXPECT_EQ(written.out, "done\n");
    EXPECT_EQ(written.err, "");
    const lines calls = logged("call");
    ASSERT_EQ(calls.size(), 8U);
    EXPECT_EQ(lines(calls.begin() + 4, calls.end()),
              (lines{end_stream_call, log_call, stop_call, disable_call}));
}

TEST_F(scm_monitor, ends_early_without_profiler_status_duration_or_configurations) {
    EXPECT_EQ(monitor("10", "scm:smb1").out, "wqr fw profiler is not available\n");
    put_profile_service();
    EXPECT_EQ(monitor("10", "scm:smb1").err, failed(conn_file, "service") +
                                                 failed(kernel_file, "success") +
                                                 failed(scm_file, "success"));
    put_driver();
    EXPECT_EQ(monitor("10", "").err, failed(scm_file, "configs.size() != 0"));
    EXPECT_EQ(monitor("auto", "smb1").err,
              failed(grammar_file, "result") + failed(scm_file, "success"));
    const outcome refused = monitor("human", "scm:smb1");
    EXPECT_EQ(refused.out, "duration parameter is invalid (human)\n");
    EXPECT_EQ(refused.status, 1);
    EXPECT_EQ(logged("call"), lines(3, status_call));
}

}  // namespace tests
