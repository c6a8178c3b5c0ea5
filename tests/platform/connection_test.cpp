// The contract of handles, connections, shared memory and data queues.

#include "platform/connection.h"

#include "tests/platform/platform_test.h"

namespace tests {

using namespace platform;
using namespace std::chrono_literals;

namespace {

using id_list = std::vector<handle_id>;
id_list released;

struct counted_kind {
    static void release(handle_id id) { released.push_back(id); }
};

using counted = handle<counted_kind>;

TEST(handles, release_their_object_exactly_once) {
    {
        counted source(1);
        counted target(std::move(source));
        EXPECT_FALSE(source);  // NOLINT(bugprone-use-after-move): a moved-from handle is empty
        EXPECT_TRUE(target);
        target = counted(2);
        EXPECT_EQ(released, id_list{1});
        counted& same = target;
        target = std::move(same);
        EXPECT_EQ(target.id(), 2U);
        target.reset();
        target.reset();
        EXPECT_EQ(released, (id_list{1, 2}));
        const counted kept(3);
    }
    EXPECT_EQ(released, (id_list{1, 2, 3}));
}

}  // namespace

class connections : public queue_test {
protected:
    return_code open(std::string_view name, std::uint32_t type) {
        return platform::open(service_named(name), type, conn);
    }
    // Calls a method with one scalar and buffers for two scalars and eight bytes.
    void call(std::uint32_t selector, return_code expected, std::size_t scalar_count = 2,
              std::size_t byte_count = 8) {
        const std::vector<std::uint64_t> scalar{41};
        std::vector<std::uint64_t> scalars(2);
        byte_list buffer(8);
        call_outputs outputs{scalars, buffer};
        EXPECT_EQ(platform::call(conn, selector, {scalar, {}}, outputs), expected);
        EXPECT_EQ(outputs.scalars.size(), scalar_count);
        EXPECT_EQ(outputs.structure.size(), byte_count);
        EXPECT_EQ(scalars[0], scalar_count == 1 ? 42U : 0U);
        EXPECT_EQ(buffer[2], byte_count == 3 ? 3 : 0);
    }
};

TEST_F(connections, open_for_types_that_the_driver_accepts) {
    host.add({.name = "streamer", .driver = std::make_shared<queue_driver>()});
    host.add({.name = "bare"});
    EXPECT_EQ(open("streamer", 0), success);
    EXPECT_EQ(open("streamer", 3), success);
    EXPECT_EQ(logged_calls("close"), std::vector<std::string>{"close streamer"});
    EXPECT_EQ(host.open_handles(), 1U) << "a connection does not need the service reference";
    conn.reset();
    EXPECT_EQ(open("streamer", 1), unsupported);
    EXPECT_EQ(open("bare", 0), unsupported);
    EXPECT_EQ(open("absent", 0), not_found);
    const service removed = service_named("streamer");
    host.remove("streamer");
    EXPECT_EQ(platform::open(removed, 0, conn), not_found);
    EXPECT_FALSE(conn);
}

TEST_F(connections, shrink_outputs_only_if_the_call_succeeds) {
    call(0, not_found);
    connect_streamer();
    call(0, success, 1, 3);
    call(1, bad_argument);
    host.fail_call(1, failure::io);
    call(0, simulated::io_failure);
    host.fail_call(1, failure::empty_result);
    call(0, success, 0, 0);
    host.remove("streamer");
    call(0, not_found);
}

TEST_F(connections, map_memory_and_attach_ports_of_known_types) {
    connect_streamer();
    mapped_memory other;
    EXPECT_EQ(map_memory(conn, 0, other), unsupported);
    EXPECT_EQ(map_memory({}, 3, other), not_found);
    EXPECT_EQ(attach_port(conn, 0, port, 0), unsupported);
    EXPECT_EQ(attach_port(conn, 5, {}, 0), bad_argument);
    EXPECT_EQ(attach_port({}, 5, port, 0), not_found);
    EXPECT_EQ(host.open_handles(), 3U);
    host.remove("streamer");
    EXPECT_EQ(map_memory(conn, 3, other), not_found);
    EXPECT_EQ(attach_port(conn, 5, port, 0), not_found);
    EXPECT_FALSE(other);
}

using data_queues = queue_test;

TEST_F(data_queues, return_whole_entries_in_order) {
    shared_queue& shared = connect_streamer();
    EXPECT_FALSE(data_available(queue));
    shared.add({1, 2, 3});
    shared.add({});
    shared.add({4});
    EXPECT_TRUE(data_available(queue));
    EXPECT_EQ(dequeue(2, simulated::buffer_too_small), (byte_list{0xee, 0xee}));
    EXPECT_EQ(dequeue(3, success), (byte_list{1, 2, 3}));
    EXPECT_EQ(dequeue(4, success), byte_list{});
    EXPECT_EQ(dequeue(1, success), byte_list{4});
    EXPECT_FALSE(data_available(queue));
    EXPECT_EQ(dequeue(1, simulated::queue_empty), byte_list{0xee});
}

TEST_F(data_queues, wait_for_data_or_the_end_of_the_driver) {
    shared_queue& shared = connect_streamer();
    EXPECT_EQ(wait_for_data(queue, port), simulated::deadlock);
    host.clock().run_at(10ms, [&] { shared.add({1}); });
    host.clock().run_at(30ms, [&] { host.remove("streamer"); });
    EXPECT_EQ(wait_for_data(queue, port), success);
    EXPECT_EQ(wait_for_data(queue, port), success);
    EXPECT_EQ(host.clock().now(), 10ms);
    EXPECT_EQ(dequeue(1, success), byte_list{1});
    EXPECT_EQ(wait_for_data(queue, port), not_found);
    EXPECT_EQ(host.clock().now(), 30ms);
    EXPECT_FALSE(data_available(queue));
    EXPECT_EQ(dequeue(1, not_found), byte_list{0xee});
}

TEST_F(data_queues, need_a_mapping_and_a_wait_needs_the_attached_port) {
    connect_streamer().add({1});
    EXPECT_EQ(wait_for_data(queue, allocate_port()), bad_argument);
    EXPECT_EQ(wait_for_data(queue, {}), bad_argument);
    queue.reset();
    EXPECT_EQ(wait_for_data(queue, port), bad_argument);
    EXPECT_FALSE(data_available(queue));
    EXPECT_EQ(dequeue(1, bad_argument), byte_list{0xee});
}

}  // namespace tests
