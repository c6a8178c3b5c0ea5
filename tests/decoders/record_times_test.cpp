#include "nrxctl/decoders/record_times.h"

#include <cstdlib>
#include <ctime>
#include <thread>

#include "platform/virtual/time_sync.h"
#include "platform/virtual/wrist_device.h"
#include "tests/decoders/event_record.h"
#include "tests/support/device_test.h"
#include "tests/support/fault_sweep.h"

namespace {

using namespace tests;
using platform::dictionary;
using platform::property;
using platform::simulated::sync_point;

constexpr std::int64_t second = 1000000000;

class record_times : public device_test {
protected:
    record_times() { set_zone("UTC0"); }

    static void set_zone(const char* zone) {
        ::setenv("TZ", zone, 1);
        ::tzset();
    }

    // Sets what the time-sync service publishes.
    void publish(const property& published) {
        if (!service_) service_ = host.add({.name = "time-sync", .classes = {"KeltoNRXTimesync"}});
        service_->properties.set("timesync", published);
    }

    static std::string time_of(std::uint64_t timestamp) {
        const auto time = nrx::calendar_time(timestamp);
        return time ? std::string(time->view()) : "none";
    }

private:
    platform::simulated::entry_ref service_;
};

TEST_F(record_times, calendar_time_counts_from_the_latest_sync_point) {
    const rows<std::int64_t, std::int64_t, std::uint64_t, std::string> cases{
        {0, 0, 1000000, "Jan 01 00:00:01.000000"},
        {0, 0, 1500000, "Jan 01 00:00:01.500000"},
        {0, 0, 86399999999, "Jan 01 23:59:59.999999"},
        {5 * second + 999, 1700155348 * second + 123456789, 5000000, "Nov 16 17:22:28.123455"},
        {5 * second + 999, 1700155348 * second + 123456789, 5000001, "Nov 16 17:22:28.123456"},
        {5 * second + 999, 1700155348 * second + 123456789, 4000000, "Nov 16 17:22:27.123455"},
        // The arithmetic is unsigned and wraps around.
        {1000, 0, 0, "Jul 21 23:34:33.709550"},
        {0, 0, std::uint64_t{1} << 61, "Jan 01 00:00:00.000000"},
        {0, 0, 18446744073709551615U, "Jul 21 23:34:33.709550"},
        {INT64_MIN, INT64_MAX, 1, "Jan 01 00:00:00.000000"},
    };
    for (const auto& [coprocessor, calendar, timestamp, text] : cases) {
        publish(dictionary{{"nrx", coprocessor}, {"calendar", calendar}});
        EXPECT_EQ(time_of(timestamp), text);
    }
    host.remove("time-sync");
    EXPECT_EQ(time_of(4000000), "none");
}

TEST_F(record_times, calendar_time_is_that_of_the_zone_set_last) {
    publish(dictionary{{"nrx", 0}, {"calendar", 0}});
    const char* const central = "CET-1CEST,M3.5.0,M10.5.0/3";
    const rows<const char*, std::uint64_t, std::string> cases{
        {central, 1679792399999999, "Mar 26 01:59:59.999999"},
        {central, 1679792400000000, "Mar 26 03:00:00.000000"},
        {central, 1698541199000000, "Oct 29 02:59:59.000000"},
        {central, 1698541200000000, "Oct 29 02:00:00.000000"},
        // Within a second.
        {"UTC0", 1690000000000000, "Jul 22 04:26:40.000000"},
        {"NST3:30", 1690000000000001, "Jul 22 00:56:40.000001"},
        {"CET-1", 1690000000000002, "Jul 22 05:26:40.000002"},
        {central, 1690000000000003, "Jul 22 06:26:40.000003"},
    };
    for (const auto& [zone, timestamp, text] : cases) {
        set_zone(zone);
        EXPECT_EQ(time_of(timestamp), text);
    }
}

TEST_F(record_times, first_second_of_1970_is_converted_without_a_cached_text) {
    publish(dictionary{{"nrx", 0}, {"calendar", 0}});
    std::string shown;
    std::thread([&] { shown = time_of(7); }).join();
    EXPECT_EQ(shown, "Jan 01 00:00:00.000007");
}

TEST_F(record_times, without_a_complete_sync_point_there_is_no_calendar_time) {
    EXPECT_EQ(time_of(1), "none");
    for (const property& published : std::initializer_list<property>{
             dictionary{}, dictionary{{"nrx", 0}}, dictionary{{"calendar", 0}},
             dictionary{{"nrx", "0"}, {"calendar", 0}}, dictionary{{"nrx", 0}, {"calendar", "0"}},
             platform::array{}, 7, "text"}) {
        publish(published);
        EXPECT_EQ(time_of(1), "none");
    }
    publish(dictionary{{"calendar", 0}, {"nrx", 0}});
    EXPECT_EQ(time_of(1), "Jan 01 00:00:00.000001");
}

TEST_F(record_times, come_last_and_are_omitted_if_a_call_fails) {
    const auto make_host = [] {
        auto device = std::make_unique<machine>();
        add_time_sync(*device, [] { return sync_point{0, 0}; });
        device->set_boot_time({1, 763});
        return device;
    };
    const auto record = make_record({7, 0, 0, 0});
    const std::string end = ",0,0,0,0]";
    const std::string calendar = ", 'calendar-time':'Jan 01 00:00:00.008123'";
    const std::string boot = ", 'boot-timestamp':1000763";
    const auto device = make_host();
    {
        const platform::simulated::installed_machine installed(*device);
        EXPECT_TRUE(decoded(record).ends_with(end + calendar + boot + "}"));
    }
    sweep_faults(
        make_host, [&] { nrx::print_profile_record(record); },
        [&](const fault& fault) {
            return fault.result.err.empty() &&
                   fault.result.out.ends_with(end + (fault.call == 3 ? calendar : boot) + "}\n");
        });
}

TEST_F(record_times, a_sync_point_is_renewed_once_a_second) {
    sync_point now{200'000'000, 5 * second};
    add_time_sync(host, [&] { return now; });
    EXPECT_EQ(time_of(0), "Jan 01 00:00:04.800000");
    now = {900'000'000, 50 * second};
    EXPECT_EQ(time_of(0), "Jan 01 00:00:04.800000");
    now = {second, 61 * second};
    EXPECT_EQ(time_of(0), "Jan 01 00:01:00.000000");
}

TEST_F(record_times, the_wrist_device_has_the_times_of_its_host) {
    const auto device = platform::simulated::make_wrist_device();
    const platform::simulated::installed_machine installed(*device);
    timespec ticks{};
    ::clock_gettime(CLOCK_MONOTONIC, &ticks);
    const std::time_t now = std::time(nullptr);
    const auto shown = time_of(static_cast<std::uint64_t>(ticks.tv_sec) * 1000000);
    std::tm parts{};
    ASSERT_NE(::strptime(shown.substr(0, 15).c_str(), "%b %d %T", &parts), nullptr) << shown;
    parts.tm_year = ::gmtime(&now)->tm_year;
    EXPECT_NEAR(static_cast<double>(::timegm(&parts)), static_cast<double>(now), 2) << shown;
    const auto boot = nrx::boot_time_usec().value_or(0);
    EXPECT_TRUE(boot > 0 && boot / 1000000 < now) << boot;
}

}  // namespace
