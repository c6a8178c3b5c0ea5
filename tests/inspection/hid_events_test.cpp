#include "nrxctl/inspection/hid_events.h"

#include <sstream>

#include "nrxctl/base/tick_period.h"
#include "nrxctl/inspection/clock_references.h"
#include "nrxctl/inspection/hid_event_times.h"
#include "nrxctl/inspection/hid_statistics.h"
#include "platform/clock.h"
#include "tests/inspection/event_host.h"

namespace tests {

namespace {

using namespace std::chrono_literals;
using platform::hid_event;

const std::string marker = "<-------------------------------";

using hid_events = event_test;

hid_event acceleration_at(double time) {
    auto event = event_at(time, platform::accelerometer_event);
    event.latency_nanoseconds = 352'999;
    event.fractions = {{0xd0001, -0.0625}, {0xd0000, 0.125}, {0xd0002, -1}};
    event.integers = {{0xd0005, 7}, {0xd0003, 1}, {0xd0004, -2}};
    return event;
}

TEST_F(hid_events, null_events_tell_their_times_in_the_streams_own_format) {
    EXPECT_EQ(printed_event(hid_event{.ticks = 1ULL << 63, .type = platform::null_event}),
              "[null] 0 ∂=9.22337e+12 latency: 0\n");
    forget_events();
    auto event = event_at(1234.5678, platform::null_event);
    event.latency_nanoseconds = 84'999;
    EXPECT_EQ(printed_event(event), "[null] 0 ∂=1234.57 latency: 8.4e-05\n");
    EXPECT_EQ(printed_event(event_at(1234.8178, platform::null_event)),
              "[null] 0.25 ∂=0.25 latency: 0\n");
    EXPECT_EQ(printed_event(event_at(1236.8178, platform::null_event)),
              "[null] 2.25 ∂=2 latency: 0\n");
}

TEST_F(hid_events, an_event_at_the_start_of_the_clock_does_not_count_as_the_first) {
    EXPECT_EQ(printed_event(event_at(0, platform::null_event)), "[null] 0 ∂=0 latency: 0\n");
    EXPECT_EQ(printed_event(event_at(2, platform::null_event)), "[null] 0 ∂=2 latency: 0\n");
    EXPECT_EQ(printed_event(event_at(3, platform::null_event)), "[null] 1 ∂=1 latency: 0\n");
}

TEST_F(hid_events, accelerometer_events_have_six_fields_and_switch_the_format_for_good) {
    EXPECT_EQ(printed_event(event_at(2, platform::null_event)), "[null] 0 ∂=2 latency: 0\n");
    EXPECT_EQ(printed_event(acceleration_at(2.5)),
              "[accelerometer] 0.500000 ∂=0.500000 latency: 0.000352 "
              "0.125000, -0.062500, -1.000000 [1/-2] 7\n");
    EXPECT_EQ(printed_event(event_at(3, platform::null_event)),
              "[null] 1.000000 ∂=0.500000 latency: 0.000000\n");
    EXPECT_EQ(printed_event(event_at(4, platform::accelerometer_event)),
              "[accelerometer] 2.000000 ∂=1.000000 latency: 0.000000 "
              "0.000000, 0.000000, 0.000000 [0/0] 0\n");
}

TEST_F(hid_events, other_types_print_their_number_and_latency) {
    auto event = event_at(5, 2);
    event.latency_nanoseconds = 640'000;
    EXPECT_EQ(printed_event(event), "type: 2latency: 0.00064 µs\n");
    event.type = 0xffffffff;
    event.latency_nanoseconds = -3'000'000;
    EXPECT_EQ(printed_event(event), "type: 4294967295latency: -0.003 µs\n");
    EXPECT_EQ(printed_event(event_at(6, 12)), "type: 12latency: 0 µs\n");
    EXPECT_EQ(printed_event(event_at(6.5, 14)), "type: 14latency: 0 µs\n");
    EXPECT_EQ(printed_event(event_at(7, platform::null_event)), "[null] 2 ∂=0.5 latency: 0\n");
}

TEST_F(hid_events, vendor_events_are_placed_on_both_clocks) {
    nrx::tick_period = platform::tick_period();
    nrx::monotonic_reference = 1;
    nrx::wall_reference = 100;
    const auto at = [](double time, const std::string& data) {
        auto event = vendor_event_at(time, data);
        event.ticks *= 24;
        return event;
    };
    platform::sleep(1'502'000us);
    EXPECT_EQ(printed_event(at(1.5, "hello"), " here"),
              "now: 1.502000    ts: 1.500000    delta: 0.002000   \t 'hello' \t wall: 100.500000 "
              " delta:            100.500000 here " +
                  marker + "\n");
    platform::sleep(12'000'000us);
    EXPECT_EQ(printed_event(at(2, "")),
              "now: 13.502000   ts: 2.000000    delta: 11.502000  \t '' \t wall: 101.000000 "
              " delta:            0.500000 \n");
    EXPECT_EQ(printed_event(event_at(2.25 * 24, platform::null_event)),
              "[null] 0.750000 ∂=0.250000 latency: 0.000000\n");
    nrx::wall_reference = 1'700'000'000;
    EXPECT_EQ(printed_event(at(2.5, "x"), "L"),
              "now: 13.502000   ts: 2.500000    delta: 11.002000  \t 'x' \t wall: "
              "1700000001.500000 delta:            1699999900.500000L " +
                  marker + "\n");
}

TEST_F(hid_events, vendor_events_half_a_second_apart_bear_no_marker) {
    struct beat {
        double since_last;
        bool marked;
    };
    for (const auto& [since_last, marked] :
         {beat{0.4, true}, beat{0.400001, false}, beat{0.5, false}, beat{0.599999, false},
          beat{0.6, true}, beat{0, true}, beat{-0.5, true}, beat{1, true}}) {
        forget_events();
        nrx::tick_period = since_last;
        const std::string line = printed_event(hid_event{.ticks = 1, .type = 1});
        EXPECT_EQ(line.ends_with(" " + marker + "\n"), marked) << since_last;
        EXPECT_EQ(line.ends_with("00 \n") || line.ends_with("1 \n") || line.ends_with("9 \n"),
                  !marked)
            << since_last;
    }
}

// Only vendor-defined events are measured against each other on the wall clock.
TEST_F(hid_events, events_in_between_leave_the_beat_of_vendor_events_alone) {
    EXPECT_TRUE(printed_event(vendor_event_at(1, "a")).ends_with(marker + "\n"));
    printed_event(acceleration_at(1.2));
    printed_event(event_at(1.4, 3));
    EXPECT_TRUE(printed_event(vendor_event_at(1.5, "b")).ends_with(" 0.500000 \n"));
    EXPECT_EQ(nrx::last_wall_time, 1.5);
    EXPECT_EQ(nrx::first_event_time, 1);
}

TEST_F(hid_events, vendor_data_are_text_up_to_the_first_nul) {
    const auto text_of = [](const std::string& data) {
        const std::string line = printed_event(vendor_event_at(1, data));
        const std::size_t begin = line.find("\t '") + 3;
        return line.substr(begin, line.find("' \t wall") - begin);
    };
    EXPECT_EQ(text_of(std::string("ab\0cd\0", 6)), "ab");
    EXPECT_EQ(text_of("no end"), "no end");
    EXPECT_EQ(text_of(std::string(1, '\0')), "");
    EXPECT_EQ(text_of("µ∂ '"), "µ∂ '");
}

TEST_F(hid_events, vendor_events_switch_the_format_of_statistics_and_others_too) {
    const byte_list pushed{0, 6, 57, 0, 0x80, 1, 0};
    printed_event(vendor_event_at(1, "a"));
    EXPECT_EQ(capture([&] { nrx::stats_callback(pushed); }).out,
              "TALY_CALLBACK: push com.kelto.wqr.test 1.500000\n");
    EXPECT_EQ(printed_event(event_at(2, 3)), "type: 3latency: 0.000000 µs\n");
}

TEST_F(hid_events, a_reset_shows_client_context_and_services_as_pointers) {
    put_hid_events(host, {});
    const platform::hid_event_client client = platform::create_hid_event_client();
    const int context = 0;
    std::ostringstream address;
    address << &context;
    const auto result = capture([&] {
        nrx::reset_callback(client, nullptr);
        nrx::reset_callback(client, &context);
        nrx::reset_callback({}, nullptr);
    });
    EXPECT_EQ(result.out,
              "ResetCallback 0x1 0 services: 0x2\n"
              "ResetCallback 0x1 " +
                  address.str() +
                  " services: 0x3\n"
                  "ResetCallback 0 0 services: 0\n");
    EXPECT_EQ(result.err, "");
    EXPECT_EQ(logged("release").size(), 2U);
    EXPECT_EQ(host.open_handles(), 1U);
}

}  // namespace

}  // namespace tests
