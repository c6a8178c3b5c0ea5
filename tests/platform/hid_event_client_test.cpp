#include "platform/hid_event_client.h"

#include "platform/run_loop.h"
#include "tests/support/hid_host.h"

namespace tests {

namespace {

using namespace std::chrono_literals;
using platform::create_hid_event_client;
using platform::hid_event;
using lines = std::vector<std::string>;

class hid_event_client : public device_test {
protected:
    hid_event_client() {
        put_hid_events(host, {{1ms, hid_event{.ticks = 5, .type = 13}},
                              {2ms, platform::simulated::hid_reset{}},
                              {3ms, platform::simulated::statistics_update{1, 2, 3}}});
    }

    // Lets a client note what it is told; the codes of the calls must be the one expected.
    void note_all(const platform::hid_event_client& client, platform::return_code expected) {
        const auto on_event = [&](const hid_event& event) {
            told.push_back("event " + std::to_string(event.type));
        };
        const auto on_statistics = [&](platform::byte_view records) {
            told.push_back("update " + std::to_string(records.size()));
        };
        EXPECT_EQ(set_event_callback(client, on_event), expected);
        EXPECT_EQ(set_reset_callback(client, [&] { told.emplace_back("reset"); }), expected);
        EXPECT_EQ(set_statistics_callback(client, on_statistics), expected);
    }

    lines told;
};

TEST_F(hid_event_client, is_told_of_events_resets_and_updates_once_it_has_callbacks) {
    const platform::hid_event_client early = create_hid_event_client();
    const platform::hid_event_client late = create_hid_event_client();
    note_all(early, platform::success);
    EXPECT_EQ(schedule_on_loop(early), platform::success);
    EXPECT_EQ(schedule_on_loop(late), platform::success);
    EXPECT_EQ(platform::run_loop_for(2ms), platform::success);
    EXPECT_EQ(told, (lines{"event 13", "reset"}));
    note_all(late, platform::success);
    EXPECT_EQ(platform::run_loop_for(8ms), platform::success);
    EXPECT_EQ(told, (lines{"event 13", "reset", "update 3", "update 3"}));
}

TEST_F(hid_event_client, lists_the_hid_services_that_are_there) {
    const platform::hid_event_client client = create_hid_event_client();
    put_hid_device(host, "a", 1);
    put_hid_device(host, "b", 2);
    host.add({.name = "no-hid"});
    host.remove("a");
    EXPECT_TRUE(services_of(client));
    EXPECT_EQ(host.log().back(), "release list of 1 hid services");
}

TEST_F(hid_event_client, needs_an_event_system_and_a_handle) {
    note_all({}, platform::not_found);
    EXPECT_EQ(schedule_on_loop(platform::hid_event_client()), platform::not_found);
    EXPECT_FALSE(platform::services_of({}));
    host.set_hid_events({});
    EXPECT_FALSE(create_hid_event_client());
}

TEST(hid_event_value, tells_its_latency_in_any_unit_and_has_0_for_what_it_lacks) {
    const hid_event event{.latency_nanoseconds = 1'234'567,
                          .integers = {{0xd0003, -4}},
                          .fractions = {{0xd0000, 0.5}, {0xd0001, -2}}};
    EXPECT_EQ(event.latency(1), 1'234'567);
    EXPECT_EQ(event.latency(1'000), 1'234);
    EXPECT_EQ(event.integer(0xd0003), -4);
    EXPECT_EQ(event.integer(0xd0000), 0);
    EXPECT_EQ(event.fraction(0xd0001), -2);
    EXPECT_EQ(event.fraction(0xd0003), 0);
}

}  // namespace

}  // namespace tests
