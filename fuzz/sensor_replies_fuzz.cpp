// Inspects a sensor whose replies are any bytes. The first byte of the input selects the sensor.
// The rest is replies: a report id and a length, one byte each, then as many bytes, or fewer at the
// end of the input. Replies with the same id are joined. The id 0xff stands for the client table.
#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>

#include "fuzz/support/harness.h"
#include "nrxctl/inspection/client_table.h"
#include "nrxctl/inspection/sensor_info.h"
#include "platform/virtual/current_machine.h"
#include "platform/virtual/interface_driver.h"

namespace {

using platform::simulated::byte_list;
using platform::simulated::interface_driver;

constexpr std::uint8_t clients_id = 0xff;
constexpr std::array sensors{"accel", "gyro", "compass", "als"};

void append_reply(interface_driver& sensor, std::uint8_t id, platform::byte_view part) {
    const byte_list* previous = sensor.report(id);
    byte_list reply = previous == nullptr ? byte_list() : *previous;
    reply.insert(reply.end(), part.begin(), part.end());
    sensor.set_report(id, reply);
}

void set_replies(interface_driver& sensor, platform::byte_view input) {
    while (input.size() >= 2) {
        const std::uint8_t id = input[0];
        const std::size_t length = std::min<std::size_t>(input[1], input.size() - 2);
        append_reply(sensor, id, input.subspan(2, length));
        input = input.subspan(2 + length);
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) return 0;
    const std::string name = sensors[data[0] % sensors.size()];
    platform::simulated::machine host;
    const platform::simulated::installed_machine installed(host);
    const auto sensor = std::make_shared<interface_driver>();
    host.add({.name = name, .classes = {"KeltoNRXInterface"}, .driver = sensor});
    set_replies(*sensor, {data + 1, size - 1});
    // Without a sample interval nothing else is read.
    if (sensor->report(0) == nullptr) sensor->set_report(0, {0x10, 0x27, 0, 0});
    if (const byte_list* clients = sensor->report(clients_id)) {
        sensor->set_command(0x39, [clients](platform::byte_view, byte_list& reply) {
            reply = *clients;
            return platform::success;
        });
        // A copy in an allocation of its own size, so that a sanitizer finds a read beyond it.
        const byte_list entries(clients->begin(), clients->end());
        nrx::print_clients("", entries);
    }
    nrx::print_sensor_info(name, 2);
    fuzz::require(host.open_handles() == 0);
    return 0;
}
