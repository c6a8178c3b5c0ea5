// A driver that shares a data queue and does nothing else.
#pragma once

#include <cstdint>
#include <memory>

#include "platform/data_queue.h"
#include "tests/support/device_test.h"

namespace tests {

class queue_driver final : public platform::simulated::driver {
public:
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

    std::shared_ptr<platform::simulated::shared_queue> queue =
        std::make_shared<platform::simulated::shared_queue>();
};

// A queue, mapped and with a port attached to it, on a host of its own.
class queue_test : public device_test {
protected:
    // Registers the driver of a plain queue as "streamer" and connects to it.
    platform::simulated::shared_queue& stream() {
        const auto driver = std::make_shared<queue_driver>();
        host.add({.name = "streamer", .unit = driver});
        connect("streamer", 3, 5);
        return *driver->queue;
    }

    // Connects to a driver and its queue.
    void connect(std::string_view name, std::uint32_t memory, std::uint32_t notification) {
        ASSERT_EQ(platform::open(service_named(name), 0, connection), platform::success);
        ASSERT_EQ(platform::map_memory(connection, memory, queue), platform::success);
        port = platform::allocate_port();
        ASSERT_EQ(platform::attach_port(connection, notification, port, 0), platform::success);
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
