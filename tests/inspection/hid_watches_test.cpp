// HID events, statistics updates and SPI records, and the watches that print them.
#include <array>
#include <bit>
#include <cmath>
#include <sstream>

#include "nrxctl/base/clock_references.h"
#include "nrxctl/base/output.h"
#include "nrxctl/inspection/hid_event_state.h"
#include "nrxctl/inspection/hid_event_watch.h"
#include "nrxctl/inspection/hid_events.h"
#include "nrxctl/inspection/hid_statistics.h"
#include "nrxctl/inspection/spi_watch.h"
#include "platform/clock.h"
#include "platform/run_loop.h"
#include "tests/golden/golden_text.h"
#include "tests/support/argument_vector.h"
#include "tests/support/hid_host.h"
#include "tests/support/report_bytes.h"
#include "tests/support/rows.h"

namespace tests {

using namespace std::chrono_literals;
using platform::hid_event;
const std::array initial_times{nrx::first_event_time, nrx::last_event_time, nrx::last_wall_time};

// A tick is a microsecond, no event has been printed, and the number format is the default.
void start_over() {
    nrx::tick_period = 1e-6;
    nrx::wall_reference = nrx::monotonic_reference = 0;
    nrx::first_event_time = nrx::last_event_time = nrx::last_wall_time = 0;
    nrx::event_stream().copyfmt(std::ostringstream());
}

hid_event event_at(double time, std::uint32_t type, std::int64_t latency_nanoseconds = 0) {
    const auto ticks = static_cast<std::uint64_t>(std::llround(time * 1e6));
    return {.ticks = ticks, .type = type, .latency_nanoseconds = latency_nanoseconds};
}

hid_event vendor_event_at(double time, const std::string& data) {
    auto event = event_at(time, 1);
    event.vendor_data.assign(data.begin(), data.end());
    return event;
}

byte_list record(std::uint8_t operation, std::uint8_t key, std::int32_t value) {
    return report_with(7, {{1, 1, {operation, key}}, {3, 4, static_cast<std::uint32_t>(value)}});
}

std::string text_of(const hid_event& event, const std::string& label = "") {
    return capture([&] { nrx::print_hid_event(event, label); }).out;
}

std::string text_of(const byte_list& records) {
    return capture([&] { nrx::stats_callback(records); }).out;
}

const std::string marker = "<-------------------------------\n";

struct hid_events : device_test {
    hid_events() { start_over(); }
};
using hid_statistics = hid_events;
using hid_event_watch = hid_events;

TEST_F(hid_events, sequence_of_events_prints_a_line_each) {
    EXPECT_EQ(initial_times, (std::array{0.0, 0.0, 0.0}));
    hid_event acceleration = event_at(2.5, 13, 352'999);
    acceleration.reals = {{0xd0001, -0.0625}, {0xd0000, 0.125}, {0xd0002, -1}};
    acceleration.integers = {{0xd0005, 7}, {0xd0003, 1}, {0xd0004, -2}};
    for (const auto& [starts_over, event, text] : rows<bool, hid_event, std::string>{
             {true, {.ticks = 1ULL << 63}, "[null] 0 ∂=9.22337e+12 latency: 0"},
             {true, event_at(1234.5678, 0, 84'999), "[null] 0 ∂=1234.57 latency: 8.4e-05"},
             {false, event_at(1234.8178, 0), "[null] 0.25 ∂=0.25 latency: 0"},
             {false, event_at(1236.8178, 0), "[null] 2.25 ∂=2 latency: 0"},
             // An event at the start of the clock does not count as the first one.
             {true, event_at(0, 0), "[null] 0 ∂=0 latency: 0"},
             {false, event_at(2, 0), "[null] 0 ∂=2 latency: 0"},
             {false, event_at(3, 0), "[null] 1 ∂=1 latency: 0"},
             {true, event_at(2, 12, 640'000), "type: 12latency: 0.00064 µs"},
             {false, event_at(2, 0xffffffff, -3'000'000), "type: 4294967295latency: -0.003 µs"},
             {false, event_at(2, 14), "type: 14latency: 0 µs"},
             // An accelerometer event sets the number format.
             {false, acceleration,
              "[accelerometer] 0.500000 ∂=0.500000 latency: 0.000352 "
              "0.125000, -0.062500, -1.000000 [1/-2] 7"},
             {false, event_at(3, 0), "[null] 1.000000 ∂=0.500000 latency: 0.000000"},
             {false, event_at(4, 13),
              "[accelerometer] 2.000000 ∂=1.000000 latency: 0.000000 "
              "0.000000, 0.000000, 0.000000 [0/0] 0"}}) {
        if (starts_over) start_over();
        EXPECT_EQ(text_of(event), text + "\n");
    }
}

TEST_F(hid_events, vendor_event_prints_times_and_sets_the_format) {
    nrx::tick_period = platform::tick_period();
    nrx::monotonic_reference = 1;
    nrx::wall_reference = 100;
    platform::sleep(1'502'000us);
    EXPECT_EQ(text_of(vendor_event_at(24 * 1.5, {"µ∂ '\0cut", 11}), " here"),
              "now: 1.502000    ts: 1.500000    delta: 0.002000   \t 'µ∂ '' \t wall: 100.500000 "
              " delta:            100.500000 here " +
                  marker);
    EXPECT_EQ(text_of(record(6, 48, 98'304)), "TALY_CALLBACK: push ? 1.500000\n");
    platform::sleep(12'000'000us);
    EXPECT_EQ(text_of(vendor_event_at(24 * 2, "")),
              "now: 13.502000   ts: 2.000000    delta: 11.502000  \t '' \t wall: 101.000000 "
              " delta:            0.500000 \n");
    EXPECT_EQ(text_of(event_at(24 * 2.25, 0)), "[null] 0.750000 ∂=0.250000 latency: 0.000000\n");
    EXPECT_EQ(text_of(event_at(24 * 2.25, 2)), "type: 2latency: 0.000000 µs\n");
    // The time since the last vendor-defined event.
    nrx::wall_reference = 1'700'000'000;
    EXPECT_EQ(text_of(vendor_event_at(24 * 2.5, "x"), "L"),
              "now: 13.502000   ts: 2.500000    delta: 11.002000  \t 'x' \t wall: "
              "1700000001.500000 delta:            1699999900.500000L " +
                  marker);
}

TEST_F(hid_events, vendor_event_half_a_second_later_has_no_marker) {
    const auto ending_after = [](double interval) {
        start_over();
        nrx::tick_period = interval;
        const std::string text = text_of(hid_event{.ticks = 1, .type = 1});
        return text.substr(text.rfind(std::to_string(interval)));
    };
    for (const double interval : {0.400001, 0.5, 0.599999})
        EXPECT_EQ(ending_after(interval), std::to_string(interval) + " \n");
    for (const double interval : {0.4, 0.6, 0.0, -0.5, 1.0})
        EXPECT_EQ(ending_after(interval), std::to_string(interval) + " " + marker);
}

TEST_F(hid_events, reset_prints_client_context_and_services) {
    set_hid_events_script(host, {});
    const platform::hid_event_client client = platform::create_hid_event_client();
    const auto* context = std::bit_cast<const void*>(std::uintptr_t{0x1234});
    EXPECT_EQ(capture([&] { nrx::reset_callback(client, context); }).out,
              "ResetCallback 0x1 0x1234 services: 0x2\n");
    EXPECT_EQ(capture([] { nrx::reset_callback({}, nullptr); }).out,
              "ResetCallback 0 0 services: 0\n");
    EXPECT_EQ(host.open_handles(), 1U);
}

TEST_F(hid_statistics, each_operation_prints_its_label_and_value) {
    for (const auto& [operation, key, value, text] :
         rows<std::uint8_t, std::uint8_t, std::int32_t, std::string>{
             {1, 57, 98'304, "clear com.kelto.wqr.test"},
             {2, 57, 98'304, "set com.kelto.wqr.test 98304"},
             {3, 57, -98'304, "add com.kelto.wqr.test -98304"},
             {4, 57, 98'304, "clear com.kelto.wqr.test"},
             {5, 57, 98'304, "set com.kelto.wqr.test 1.5"},
             {2, 48, INT32_MIN, "set ? -2147483648"},
             {5, 48, INT32_MAX, "set ? 32768"},
             {5, 48, 1, "set ? 1.52588e-05"}}) {
        EXPECT_EQ(text_of(record(operation, key, value)), "TALY_CALLBACK: " + text + "\n");
    }
    for (int operation = 6; operation < 256; ++operation) {
        EXPECT_EQ(text_of(record(static_cast<std::uint8_t>(operation), 57, -98'304)),
                  "TALY_CALLBACK: push com.kelto.wqr.test -1.5\n");
    }
}

TEST_F(hid_statistics, incomplete_record_at_the_end_is_ignored) {
    byte_list records;
    std::string expected;
    for (std::uint8_t key = 48; key < 51; ++key) {
        for (const std::uint8_t byte : record(2, 48, key)) {
            EXPECT_EQ(text_of(byte_list(records.begin(), records.end())), expected);
            records.push_back(byte);
        }
        expected += "TALY_CALLBACK: set ? " + std::to_string(key) + "\n";
    }
    EXPECT_EQ(text_of(records), expected);
}

TEST_F(hid_statistics, each_key_prints_its_name_or_a_question_mark) {
    std::istringstream names(golden_text("hid_statistics_names.txt"));
    for (int key = 0; key < 256; ++key) {
        std::string word;
        const std::string name = names >> word && word != "?" ? "com.kelto." + word : "?";
        EXPECT_EQ(text_of(record(0, static_cast<std::uint8_t>(key), 0)),
                  "TALY_CALLBACK: NOP" + name + "\n");
    }
}

TEST_F(hid_event_watch, notifications_print_for_the_duration) {
    set_hid_events_script(host, {{1s, event_at(0.75, 0)},
                                 {2s, platform::simulated::hid_reset{}},
                                 {3s, record(1, 57, 0)},
                                 {5s, vendor_event_at(4.875, "beat")},
                                 {6s, event_at(5.75, 0)}});
    EXPECT_EQ(capture([] { EXPECT_EQ(nrx::watch_hid_events(5s), platform::success); }).out,
              "[null] 0 ∂=0.75 latency: 0\n"
              "ResetCallback 0x1 0 services: 0x2\n"
              "TALY_CALLBACK: clear com.kelto.wqr.test\n"
              "now: 120.000000  ts: 4.875000    delta: 115.125000 \t 'beat' \t wall: 4.875000   "
              " delta:            4.875000 " +
                  marker);
    EXPECT_EQ(host.clock().now(), 5s);
    EXPECT_EQ(host.log(),
              (lines{"create hid event client", "set event callback", "set reset callback",
                     "set statistics callback", "schedule hid event client",
                     "run loop for 5000000 us", "services of hid event client",
                     "release list of 0 hid services", "release hid event client"}));
}

TEST_F(hid_event_watch, no_duration_lasts_until_the_loop_stops) {
    set_hid_events_script(host, {});
    host.clock().run_at(3500ms, platform::stop_loop);
    EXPECT_EQ(nrx::watch_hid_events(std::nullopt), platform::success);
    EXPECT_EQ(host.clock().now(), 3500ms);
}

TEST_F(hid_event_watch, failed_step_is_reported_and_ends_the_watch) {
    set_hid_events_script(host, {});
    const char* file = source_file::hid_event_watch;
    const auto watch = [] { return nrx::watch_hid_events(5s); };
    host.fail_call(1, failure::io);
    EXPECT_EQ(report_of(platform::not_found, watch), library_report(file, "client"));
    for (std::size_t call = 2; call <= 6; ++call) {
        const std::size_t previous = host.calls_made();
        host.fail_call(call, failure::io);
        EXPECT_EQ(report_of(platform::simulated::io_failure, watch),
                  library_report(file, "kr == 0 ", io_text));
        EXPECT_EQ(host.calls_made() - previous, call);
    }
}

TEST_F(hid_event_watch, and_spi_watch_flush_output_before_they_wait) {
    set_hid_events_script(host, {});
    add_hid_device(host, "accel-hid", 16);
    for (const auto& watch : std::vector<std::function<void()>>{
             [] { nrx::watch_hid_events(5s); }, [] { nrx::watch_spi_status(16, 1); }}) {
        nrx::memory_sink target;
        const nrx::scoped_sink installed(nrx::standard_stream::output, target);
        const nrx::block_output blocks;
        nrx::print_line("buffered");
        std::string seen;
        host.clock().run_at(host.clock().now() + 1s, [&] {
            seen = target.text();
            platform::stop_loop();
        });
        watch();
        EXPECT_TRUE(seen.starts_with("buffered\n"));
    }
}

const std::string first_line = "Found an id for service = 16\n";

// The failure report of a step.
std::string step_report(std::string_view condition, const std::string& message,
                        std::string_view code = "") {
    return failure_line("nrxtoollib", condition, message + " " + source_file::spi_watch, code);
}

struct spi_watch : device_test {
    spi_watch() {
        add_service(host, "accel", 16);
        records.script = {
            {10ms, report_with(11, {{0, 8, 1}, {8, 1, 0}, {9, 2, 0x4241}})},
            {15ms, {}},
            {20ms, report_with(9, {{0, 8, 2}, {8, 1, 1}})},
            {30ms, report_with(17, {{0, 8, 3}, {8, 1, 2}, {9, 4, 0x7005}, {13, 4, 4}})},
            {60ms, report_with(9, {{0, 8, 4}, {8, 1, 3}})}};
    }

    static outcome watch(std::uint32_t mode, std::int32_t id = 16) {
        return capture([=] { EXPECT_EQ(nrx::watch_spi_status(id, mode), platform::success); });
    }

    scripted_records& records = add_hid_device(host, "accel-hid", 16);
};

TEST_F(spi_watch, records_print_until_the_loop_stops) {
    host.clock().run_at(55ms, platform::stop_loop);
    const auto result = watch(0xffffffff);
    EXPECT_EQ(result.out,
              first_line +
                  "\ntimestamp: 1, MOSI: \n"
                  "00000000: 41 42                                             | AB\n"
                  "\ntimestamp: 2, MISO: \n"
                  "\ntimestamp: 3, STATUS: errorCode(0x7005), 4 packet_drops observed\n");
    EXPECT_EQ(result.err, "");
    EXPECT_EQ(host.log(),
              (lines{R"(first match {IOProviderClass = "KeltoNRXHIDDevice"; LocationID = 16})",
                     "create hid plugin accel-hid", "query hid interface accel-hid",
                     "schedule hid interface accel-hid", "set record callback accel-hid",
                     "set mode accel-hid service 16 mode 4294967295", "run loop",
                     "release hid interface accel-hid", "destroy hid plugin accel-hid",
                     "release accel-hid"}));
    EXPECT_EQ(records.script.size(), 1U);
}

TEST_F(spi_watch, mode_0_is_set_without_a_watch) {
    EXPECT_EQ(watch(0).out, first_line);
    EXPECT_EQ(records.modes, (decltype(records.modes){{16, 0}}));
    EXPECT_EQ(logged_calls("run"), lines());
}

TEST_F(spi_watch, missing_device_is_reported_after_its_id) {
    const auto result = watch(1, -17);
    EXPECT_EQ(result.out + result.err, "Found an id for service = -17\n" +
                                           step_report("service", "Service instance not found"));
    EXPECT_EQ(host.log(),
              lines{R"(first match {IOProviderClass = "KeltoNRXHIDDevice"; LocationID = -17})"});
}

TEST_F(spi_watch, failed_step_is_reported_and_ends_the_watch) {
    const std::string no_callback = step_report("kr == 0 ", "Failed in adding callback", io_text);
    for (const auto& [mode, call, report] : rows<std::uint32_t, std::size_t, std::string>{
             {1, 2, step_report("cfPlugInInterface", "Plugin Interface not found")},
             {1, 3, step_report("hidDeviceInterface", "HID Device Interface not found")},
             {1, 4, no_callback},
             {1, 5, no_callback},
             {1, 6, step_report("kr == 0 ", "Failed in setting mode", io_text)},
             {1, 7, library_report(source_file::spi_watch, "kr == 0 ", io_text)},
             {0, 4, step_report("kr == 0 ", "Failed in setting mode to OFF", io_text)}}) {
        const std::size_t previous = host.calls_made();
        host.fail_call(call, failure::io);
        const auto result = watch(mode);
        EXPECT_EQ(result.out + result.err, first_line + report);
        EXPECT_EQ(host.calls_made() - previous, call);
    }
}

}  // namespace tests
