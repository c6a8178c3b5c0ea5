// Calendar time and boot time in a record's line.
#include <cstdlib>
#include <ctime>

#include "nrxctl/decoders/boot_time.h"
#include "nrxctl/decoders/calendar_time.h"
#include "nrxctl/decoders/record_text.h"
#include "platform/virtual/time_sync.h"
#include "platform/virtual/wrist_device.h"
#include "tests/decoders/event_record.h"
#include "tests/support/device_test.h"
#include "tests/support/fault_sweep.h"

namespace {

using platform::dictionary;
using platform::property;
using platform::simulated::sync_point;

void set_zone(const char* zone) {
    ::setenv("TZ", zone, 1);
    ::tzset();
}

class record_times : public tests::device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        set_zone("UTC0");
    }
    void TearDown() override {
        set_zone("UTC0");
        device_test::TearDown();
    }

    // A time-sync service that publishes what the test sets.
    void publish(const property& published) {
        if (!service_) service_ = host.add({.name = "time-sync", .classes = {"KeltoNRXTimesync"}});
        service_->properties.set("timesync", published);
    }
    void publish(std::int64_t coprocessor, std::int64_t calendar) {
        publish(dictionary{{"nrx", coprocessor}, {"calendar", calendar}});
    }

    static std::string at(std::uint64_t timestamp) {
        const auto time = nrx::calendar_time(timestamp);
        return time ? std::string(time->view()) : "none";
    }

private:
    platform::simulated::entry_ref service_;
};

constexpr std::int64_t second = 1000000000;

TEST_F(record_times, calendar_time_counts_from_the_sync_point_asked_for_anew) {
    publish(0, 0);
    EXPECT_EQ(at(1000000), "Jan 01 00:00:01.000000");
    EXPECT_EQ(at(1500000), "Jan 01 00:00:01.500000");
    EXPECT_EQ(at(86399999999), "Jan 01 23:59:59.999999");
    EXPECT_EQ(at(7), "Jan 01 00:00:00.000007");
    publish(5 * second + 999, 1700155348 * second + 123456789);
    EXPECT_EQ(at(5000000), "Nov 16 17:22:28.123455");
    EXPECT_EQ(at(5000001), "Nov 16 17:22:28.123456");
    EXPECT_EQ(at(4000000), "Nov 16 17:22:27.123455");
    host.remove("time-sync");
    EXPECT_EQ(at(4000000), "none");
}

TEST_F(record_times, the_arithmetic_is_unsigned_and_wraps_around) {
    publish(1000, 0);
    EXPECT_EQ(at(0), "Jul 21 23:34:33.709550");
    publish(0, 0);
    EXPECT_EQ(at(std::uint64_t{1} << 61), "Jan 01 00:00:00.000000");
    EXPECT_EQ(at(18446744073709551615U), "Jul 21 23:34:33.709550");
    publish(INT64_MIN, INT64_MAX);
    EXPECT_EQ(at(1), "Jan 01 00:00:00.000000");
}

TEST_F(record_times, local_time_follows_the_zone_and_daylight_saving) {
    publish(0, 0);
    set_zone("CET-1CEST,M3.5.0,M10.5.0/3");
    EXPECT_EQ(at(1679792399999999), "Mar 26 01:59:59.999999");
    EXPECT_EQ(at(1679792400000000), "Mar 26 03:00:00.000000");
    EXPECT_EQ(at(1698541199000000), "Oct 29 02:59:59.000000");
    EXPECT_EQ(at(1698541200000000), "Oct 29 02:00:00.000000");
    set_zone("NST3:30");
    EXPECT_EQ(at(1700000000000000), "Nov 14 18:43:20.000000");
}

TEST_F(record_times, without_a_whole_sync_point_there_is_no_calendar_time) {
    EXPECT_EQ(at(1), "none");
    for (const property& published : std::initializer_list<property>{
             dictionary{}, dictionary{{"nrx", 0}}, dictionary{{"calendar", 0}},
             dictionary{{"nrx", "0"}, {"calendar", 0}}, dictionary{{"nrx", 0}, {"calendar", "0"}},
             platform::array{}, 7, "text"}) {
        publish(published);
        EXPECT_EQ(at(1), "none");
    }
    publish(dictionary{{"calendar", 0}, {"nrx", 0}});
    EXPECT_EQ(at(1), "Jan 01 00:00:00.000001");
}

TEST_F(record_times, stand_behind_the_bytes) {
    publish(0, 0);
    host.set_boot_time({1, 763});
    const auto record = tests::record_of({7, 0, 0, 0});
    EXPECT_TRUE(tests::decoded(record).ends_with(
        ",0,0,0,0], 'calendar-time':'Jan 01 00:00:00.008123', 'boot-timestamp':1000763}"));
}

TEST_F(record_times, a_platform_call_that_fails_leaves_its_field_out_and_is_not_reported) {
    const auto make_host = [] {
        auto device = std::make_unique<tests::machine>();
        add_time_sync(*device, [] { return sync_point{0, 0}; });
        device->set_boot_time({1, 0});
        return device;
    };
    const auto record = tests::record_of({7, 0, 0, 0});
    tests::sweep_faults(
        make_host, [&] { nrx::print_profile_record(record); },
        [](const tests::fault& one) {
            const bool has_calendar = one.result.out.find("'calendar-time'") != std::string::npos;
            const bool has_boot = one.result.out.find("'boot-timestamp'") != std::string::npos;
            return one.result.err.empty() && one.result.out.ends_with("}\n") &&
                   has_calendar == (one.call == 3) && has_boot == (one.call != 3);
        });
}

TEST_F(record_times, whoever_asks_gets_a_sync_point_of_the_current_second) {
    sync_point now{200'000'000, 5'000'000'000};
    add_time_sync(host, [&] { return now; });
    EXPECT_EQ(at(0), "Jan 01 00:00:04.800000");
    now = {900'000'000, 50'000'000'000};
    EXPECT_EQ(at(0), "Jan 01 00:00:04.800000");
    now = {1'000'000'000, 61'000'000'000};
    EXPECT_EQ(at(0), "Jan 01 00:01:00.000000");
}

TEST_F(record_times, the_wrist_device_keeps_the_time_of_its_host) {
    const auto device = platform::simulated::make_wrist_device();
    const platform::simulated::installed_machine installed(*device);
    timespec ticks{};
    ::clock_gettime(CLOCK_MONOTONIC, &ticks);
    const std::time_t now = std::time(nullptr);
    const auto shown = at(static_cast<std::uint64_t>(ticks.tv_sec) * 1000000);
    std::tm parts{};
    ASSERT_NE(::strptime(shown.substr(0, 15).c_str(), "%b %d %T", &parts), nullptr) << shown;
    parts.tm_year = ::gmtime(&now)->tm_year;
    EXPECT_NEAR(static_cast<double>(::timegm(&parts)), static_cast<double>(now), 2) << shown;
    const auto booted = nrx::boot_time_usec().value_or(0);
    EXPECT_TRUE(booted > 0 && booted / 1000000 < now) << booted;
}

}  // namespace
