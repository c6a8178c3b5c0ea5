#include "nrxctl/inspection/spi_watch.h"

#include <csignal>
#include <fstream>

#include "platform/interrupt.h"
#include "platform/run_loop.h"
#include "tests/support/hid_host.h"
#include "tests/support/report_bytes.h"

namespace tests {

namespace {

using namespace std::chrono_literals;
using lines = std::vector<std::string>;

constexpr const char* file = "nrxctl/inspection/spi_watch.cpp";
const std::string found = "Found an id for service = 16\n";

// A failure report of the watch with its message.
std::string failed_step(std::string_view condition, const std::string& message,
                        std::string_view code = "") {
    return failure_line("nrxtoollib", condition, message + " " + file, code);
}

class spi_watch : public device_test {
protected:
    spi_watch() {
        put_service(host, "accel", 16);
        records.script = {
            {10ms, report_with(11, {{0, 8, 1}, {8, 1, 0}, {9, 2, 0x4241}})},
            {15ms, {}},
            {20ms, report_with(9, {{0, 8, 2}, {8, 1, 1}})},
            {25ms, {'s', 'h', 'o', 'r', 't'}},
            {30ms, report_with(17, {{0, 8, 3}, {8, 1, 2}, {9, 4, 0x7005}, {13, 4, 4}})},
            {40ms, report_with(9, {{0, 8, 4}, {8, 1, 3}})},
            {50ms, report_with(9, {{0, 8, 5}, {8, 1, 4}})},
            {60ms, report_with(9, {{0, 8, 6}, {8, 1, 1}})},
        };
    }

    static outcome watch(std::uint32_t mode) {
        return capture([&] { EXPECT_EQ(nrx::watch_spi_status(16, mode), platform::success); });
    }

    scripted_records& records = put_hid_device(host, "accel-hid", 16);
};

TEST_F(spi_watch, prints_records_of_every_type_until_the_loop_is_stopped) {
    host.clock().plan(55ms, platform::stop_loop);
    const auto result = watch(0xffffffff);
    EXPECT_EQ(result.out,
              found +
                  "\ntimestamp: 1, MOSI: \n"
                  "00000000: 41 42                                             | AB\n"
                  "\ntimestamp: 2, MISO: \n"
                  "00000000: 73 68 6f 72 74                                    | short\n"
                  "\ntimestamp: 3, STATUS: errorCode(0x7005), 4 packet_drops observed\n"
                  "\ntimestamp: 4, AccelVar: \n");
    EXPECT_EQ(result.err, failed("printers/spi_status.cpp", "length >= 9"));
    EXPECT_EQ(host.log(),
              (lines{R"(first match {IOProviderClass = "KeltoNRXHIDDevice"; LocationID = 16})",
                     "create hid plugin accel-hid", "query hid interface accel-hid",
                     "schedule hid interface accel-hid", "set record callback accel-hid",
                     "set mode accel-hid service 16 mode 4294967295", "run loop",
                     "release hid interface accel-hid", "destroy hid plugin accel-hid",
                     "release accel-hid"}));
    EXPECT_EQ(records.script.size(), 1U);
}

TEST_F(spi_watch, ends_cleanly_when_it_is_interrupted) {
    platform::handle_interrupt(platform::stop_loop);
    host.clock().plan(22ms, [] { std::raise(SIGINT); });
    const auto result = watch(1);
    platform::restore_default_interrupt();
    EXPECT_TRUE(result.out.ends_with("timestamp: 2, MISO: \n"));
    EXPECT_EQ(result.err, "");
    EXPECT_EQ(host.clock().now(), 22ms);
}

TEST_F(spi_watch, with_mode_0_only_sets_it) {
    const auto result = watch(0);
    EXPECT_EQ(result.out, found);
    EXPECT_EQ(result.err, "");
    EXPECT_EQ(lines(host.log().begin() + 1, host.log().end()),
              (lines{"create hid plugin accel-hid", "query hid interface accel-hid",
                     "set mode accel-hid service 16 mode 0", "release hid interface accel-hid",
                     "destroy hid plugin accel-hid", "release accel-hid"}));
}

TEST_F(spi_watch, tells_the_id_before_it_looks_for_the_device_and_reports_a_missing_one) {
    std::string written_before;
    host.before_call(1, [&] { std::getline(std::ifstream("/proc/self/fd/1"), written_before); });
    const auto result = capture([] { nrx::watch_spi_status(-17, 1); });
    EXPECT_EQ(written_before, "Found an id for service = -17");
    EXPECT_EQ(result.out, written_before + "\n");
    EXPECT_EQ(result.err, failed_step("service", "Service instance not found"));
    EXPECT_EQ(host.log(),
              (lines{R"(first match {IOProviderClass = "KeltoNRXHIDDevice"; LocationID = -17})"}));
}

TEST_F(spi_watch, each_step_that_fails_is_reported_with_its_message_and_ends_the_watch) {
    struct step {
        std::uint32_t mode;
        std::size_t call;
        std::string report;
    };
    const std::string no_plugin = failed_step("cfPlugInInterface", "Plugin Interface not found");
    const std::string no_device =
        failed_step("hidDeviceInterface", "HID Device Interface not found");
    const std::string no_callback = failed_step("kr == 0 ", "Failed in adding callback", io_text);
    const std::vector<step> steps{
        {1, 2, no_plugin},
        {1, 3, no_device},
        {1, 4, no_callback},
        {1, 5, no_callback},
        {1, 6, failed_step("kr == 0 ", "Failed in setting mode", io_text)},
        {1, 7, failed("inspection/spi_watch.cpp", "kr == 0 ", io_text)},
        {0, 2, no_plugin},
        {0, 3, no_device},
        {0, 4, failed_step("kr == 0 ", "Failed in setting mode to OFF", io_text)},
    };
    for (const step& one : steps) {
        const std::size_t made = host.calls_made();
        host.fail_call(one.call, failure::io);
        const auto result = watch(one.mode);
        EXPECT_EQ(result.out, found);
        EXPECT_EQ(result.err, one.report);
        EXPECT_EQ(host.calls_made() - made, one.call);
        EXPECT_EQ(host.open_handles(), 0U);
    }
    // So is a code of the device's own.
    records.mode_result = platform::bad_argument;
    EXPECT_EQ(watch(1).err, failed_step("kr == 0 ", "Failed in setting mode", bad_argument_text));
    EXPECT_EQ(watch(0).err,
              failed_step("kr == 0 ", "Failed in setting mode to OFF", bad_argument_text));
}

}  // namespace

}  // namespace tests
