// Calls of driver methods, and a host with a driver that shares a data queue.
#pragma once

#include <memory>

#include "platform/data_queue.h"
#include "platform/virtual/driver.h"
#include "tests/support/device_test.h"

namespace tests {

using platform::simulated::shared_queue;

// A method call: its arguments, reply capacity and expected return code.
struct method_call {
    platform::return_code code;
    std::uint32_t selector;
    std::vector<std::uint64_t> scalars;
    byte_list structure = {};
    std::size_t capacity = 0;
};

// Calls a method of a connection or a driver and returns the reply. A call that fails must leave
// the buffer alone; the reply is then empty.
template <class Target>
byte_list reply(Target&& target, const method_call& row) {
    byte_list buffer(row.capacity);
    const platform::call_inputs inputs{row.scalars, row.structure};
    platform::call_outputs outputs{{}, buffer};
    platform::return_code code = platform::success;
    if constexpr (requires { target.id(); }) {
        code = platform::call(target, row.selector, inputs, outputs);
    } else {
        code = target.call(row.selector, inputs, outputs);
    }
    EXPECT_EQ(code, row.code) << "selector " << row.selector << ", " << row.scalars.size()
                              << " scalars, " << row.structure.size() << " bytes, capacity "
                              << row.capacity;
    if (code == platform::success) return {outputs.structure.begin(), outputs.structure.end()};
    EXPECT_EQ(outputs.structure.size(), row.capacity);
    EXPECT_EQ(buffer, byte_list(row.capacity));
    return {};
}

// Opens types 0 and 3, shares its queue as memory 3, signals it by notification 5, and has one
// method, which increments a scalar and returns three bytes.
class queue_driver final : public platform::simulated::driver {
public:
    platform::return_code open(std::uint32_t type) override {
        return type == 3 ? platform::success : driver::open(type);
    }
    platform::return_code call(std::uint32_t selector, const platform::call_inputs& inputs,
                               platform::call_outputs& outputs) override {
        if (selector != 0) return platform::bad_argument;
        outputs.scalars[0] = inputs.scalars[0] + 1;
        outputs.scalars = outputs.scalars.first(1);
        return platform::simulated::copy_reply(byte_list{1, 2, 3}, outputs);
    }
    std::shared_ptr<shared_queue> memory(std::uint32_t type) override {
        return type == 3 ? queue : nullptr;
    }
    std::shared_ptr<shared_queue> notification(std::uint32_t type) override {
        return type == 5 ? queue : nullptr;
    }

    std::shared_ptr<shared_queue> queue = std::make_shared<shared_queue>();
};

class queue_test : public device_test {
protected:
    // Connects to a driver, maps its queue and attaches a port to it.
    void connect(std::string_view name, std::uint32_t memory, std::uint32_t notification) {
        ASSERT_EQ(platform::open(service_named(name), 0, conn), platform::success);
        ASSERT_EQ(platform::map_memory(conn, memory, queue), platform::success);
        port = platform::allocate_port();
        ASSERT_EQ(platform::attach_port(conn, notification, port, 0), platform::success);
    }

    // Registers a queue driver as "streamer", connects to it, and returns its queue.
    shared_queue& connect_streamer() {
        const auto streamer = std::make_shared<queue_driver>();
        host.add({.name = "streamer", .driver = streamer});
        connect("streamer", 3, 5);
        return *streamer->queue;
    }

    // Dequeues an entry; returns the untouched buffer if that fails.
    byte_list dequeue(std::size_t capacity, platform::return_code expected) {
        byte_list bytes(capacity, 0xee);
        platform::byte_span entry = bytes;
        EXPECT_EQ(platform::dequeue(queue, entry), expected);
        return {entry.begin(), entry.end()};
    }

    platform::connection conn;
    platform::mapped_memory queue;
    platform::notification_port port;
};

}  // namespace tests
