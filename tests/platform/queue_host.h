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

// A queue whose driver adds an entry of one byte every 10 ms, and has nothing more to say after
// that many entries.
class ticking_queue final : public platform::simulated::shared_queue {
public:
    ticking_queue(const platform::simulated::machine_clock& clock, int entries)
        : clock_(clock), entries_left_(entries) {}

    void catch_up() override {
        while (entries_left_ > 0 && clock_.now() >= next_) {
            add({static_cast<std::uint8_t>(next_.count() / 10'000'000)});
            next_ += std::chrono::milliseconds(10);
            --entries_left_;
        }
    }
    [[nodiscard]] std::optional<platform::simulated::machine_clock::time> next_due()
        const override {
        return entries_left_ > 0 ? std::optional(next_) : std::nullopt;
    }

private:
    const platform::simulated::machine_clock& clock_;
    int entries_left_;
    platform::simulated::machine_clock::time next_ = std::chrono::milliseconds(10);
};

// A queue, mapped and with a port attached to it, on a host of its own.
class queue_test : public device_test {
protected:
    // Registers the driver of a queue as "streamer" and connects to it.
    void stream(std::shared_ptr<platform::simulated::shared_queue> shared) {
        host.add({.name = "streamer", .unit = std::make_shared<queue_driver>(std::move(shared))});
        const auto service = platform::first_match({{"IONameMatch", "streamer"}});
        ASSERT_EQ(platform::open(service, 0, connection), platform::success);
        ASSERT_EQ(platform::map_memory(connection, 3, queue), platform::success);
        port = platform::allocate_port();
        ASSERT_EQ(platform::attach_port(connection, 5, port, 0), platform::success);
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
