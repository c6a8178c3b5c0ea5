// A driver that shares a data queue and does nothing else.
#pragma once

#include <cstdint>
#include <memory>

#include "platform/data_queue.h"
#include "platform/virtual/return_codes.h"
#include "tests/support/device_test.h"

namespace tests {

class queue_driver final : public platform::simulated::driver {
public:
    explicit queue_driver(std::shared_ptr<platform::simulated::shared_queue> shared)
        : queue(std::move(shared)) {}

    platform::return_code call(std::uint32_t /*selector*/, const platform::call_inputs& /*inputs*/,
                               platform::call_outputs& /*outputs*/) override {
        return platform::unsupported;
    }
    std::shared_ptr<platform::simulated::shared_queue> memory(std::uint32_t type) override {
        return type == 3 ? queue : nullptr;
    }
    std::shared_ptr<platform::simulated::shared_queue> notification(std::uint32_t type) override {
        return type == 5 ? queue : nullptr;
    }

    std::shared_ptr<platform::simulated::shared_queue> queue;
};

// A queue, mapped and with a port attached to it, on a host of its own.
class queue_test : public device_test {
protected:
    // A plain queue, streamed.
    platform::simulated::shared_queue& stream() {
        const auto shared = std::make_shared<platform::simulated::shared_queue>();
        stream(shared);
        return *shared;
    }

    // Registers the driver of a queue as "streamer", which keeps it, and connects to it.
    void stream(std::shared_ptr<platform::simulated::shared_queue> shared) {
        host.add({.name = "streamer", .unit = std::make_shared<queue_driver>(std::move(shared))});
        connect("streamer", 3, 5);
    }

    // Connects to a driver and its queue.
    void connect(std::string_view name, std::uint32_t memory, std::uint32_t notification) {
        const auto service = platform::first_match({{"IONameMatch", name}});
        ASSERT_EQ(platform::open(service, 0, connection), platform::success);
        ASSERT_EQ(platform::map_memory(connection, memory, queue), platform::success);
        port = platform::allocate_port();
        ASSERT_EQ(platform::attach_port(connection, notification, port, 0), platform::success);
    }

    void TearDown() override {
        queue.reset();
        port.reset();
        connection.reset();
        device_test::TearDown();
    }

    // The next entry; what the room held before, if there is none.
    std::vector<std::uint8_t> take(std::size_t room, platform::return_code expected) {
        std::vector<std::uint8_t> bytes(room, 0xee);
        platform::byte_span entry = bytes;
        EXPECT_EQ(platform::dequeue(queue, entry), expected);
        return {entry.begin(), entry.end()};
    }

    platform::connection connection;
    platform::mapped_memory queue;
    platform::notification_port port;
};

}  // namespace tests
