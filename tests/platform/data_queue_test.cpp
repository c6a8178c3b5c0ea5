// What a backend promises about shared data queues.

#include "platform/virtual/return_codes.h"
#include "tests/platform/queue_host.h"

namespace tests {

using namespace std::chrono_literals;
using bytes = std::vector<std::uint8_t>;

using data_queue = queue_test;

TEST_F(data_queue, hands_out_its_entries_in_order_each_whole_or_not_at_all) {
    auto& shared = stream();
    EXPECT_FALSE(platform::data_available(queue));
    shared.add({1, 2, 3});
    shared.add({});
    shared.add({4});
    EXPECT_TRUE(platform::data_available(queue));
    EXPECT_EQ(take(2, platform::simulated::no_room), (bytes{0xee, 0xee}));
    EXPECT_EQ(take(3, platform::success), (bytes{1, 2, 3}));
    EXPECT_EQ(take(4, platform::success), bytes{});
    EXPECT_EQ(take(1, platform::success), bytes{4});
    EXPECT_FALSE(platform::data_available(queue));
    EXPECT_EQ(take(2, platform::simulated::nothing_queued), (bytes{0xee, 0xee}));
}

TEST_F(data_queue, answers_for_memory_and_notifications_of_the_types_that_the_driver_has) {
    stream();
    platform::mapped_memory other;
    EXPECT_EQ(platform::map_memory(connection, 0, other), platform::unsupported);
    EXPECT_FALSE(other);
    EXPECT_EQ(platform::attach_port(connection, 0, port, 0), platform::unsupported);
    EXPECT_EQ(platform::attach_port(connection, 5, {}, 0), platform::bad_argument);
    EXPECT_EQ(platform::map_memory({}, 3, other), platform::not_found);
    EXPECT_EQ(platform::attach_port({}, 5, port, 0), platform::not_found);
    EXPECT_EQ(host.open_handles(), 3U);
    queue.reset();
    port.reset();
    EXPECT_EQ(host.open_handles(), 1U);
}

TEST_F(data_queue, wait_lasts_until_the_driver_has_added_data) {
    auto& shared = stream();
    host.clock().plan(10ms, [&] { shared.add({1}); });
    EXPECT_EQ(platform::wait_for_data(queue, port), platform::success);
    EXPECT_EQ(platform::wait_for_data(queue, port), platform::success);
    EXPECT_EQ(host.clock().now(), 10ms);
    EXPECT_EQ(take(1, platform::success), bytes{1});
    EXPECT_EQ(platform::wait_for_data(queue, port), platform::simulated::endless_wait);
}

TEST_F(data_queue, wait_needs_the_queue_and_the_port_that_is_signalled_for_it) {
    stream().add({1});
    EXPECT_EQ(platform::wait_for_data(queue, platform::allocate_port()), platform::bad_argument);
    EXPECT_EQ(platform::wait_for_data(queue, {}), platform::bad_argument);
    queue.reset();
    EXPECT_EQ(platform::wait_for_data(queue, port), platform::bad_argument);
    EXPECT_FALSE(platform::data_available(queue));
    EXPECT_EQ(take(1, platform::bad_argument), bytes{0xee});
}

TEST_F(data_queue, wait_ends_when_the_driver_goes) {
    stream();
    host.clock().plan(30ms, [&] { host.remove("streamer"); });
    EXPECT_EQ(platform::wait_for_data(queue, port), platform::not_found);
    EXPECT_EQ(host.clock().now(), 30ms);
    EXPECT_FALSE(platform::data_available(queue));
    EXPECT_EQ(take(1, platform::not_found), bytes{0xee});
    platform::mapped_memory other;
    EXPECT_EQ(platform::map_memory(connection, 3, other), platform::not_found);
    EXPECT_EQ(platform::attach_port(connection, 5, port, 0), platform::not_found);
}

}  // namespace tests
