// Connections of the virtual host, the memory mapped through them, and its data queues.

#include <algorithm>
#include <string>

#include "platform/connection.h"
#include "platform/data_queue.h"
#include "platform/virtual/current_machine.h"
#include "platform/virtual/interrupts.h"

namespace platform {

using simulated::connection_object;
using simulated::current_machine;
using simulated::entry_ref;
using simulated::machine;
using simulated::mapping_object;
using simulated::port_object;
using simulated::service_object;

// --- connections ---

namespace {

std::string hexadecimal(std::uint64_t value, std::size_t min_digits) {
    constexpr std::string_view digits = "0123456789abcdef";
    std::string text;
    for (; value != 0 || text.size() < min_digits; value /= 16) {
        text.insert(text.begin(), digits[value % 16]);
    }
    return text;
}

// The log entry of a method call: "call NAME SELECTOR scalars [..] in [..] results N capacity N".
std::string describe_call(const entry_ref& provider, std::uint32_t selector,
                          const call_inputs& inputs, const call_outputs& outputs) {
    std::string text = "call " + log_name(provider) + " " + std::to_string(selector) + " scalars [";
    for (const std::uint64_t scalar : inputs.scalars) {
        if (text.back() != '[') text += ' ';
        text += "0x" + hexadecimal(scalar, 1);
    }
    text += "] in [";
    for (const std::uint8_t byte : inputs.structure) {
        if (text.back() != '[') text += ' ';
        text += hexadecimal(byte, 2);
    }
    return text + "] results " + std::to_string(outputs.scalars.size()) + " capacity " +
           std::to_string(outputs.structure.size());
}

}  // namespace

void connection_kind::release(handle_id id) {
    machine& host = current_machine();
    host.log_event([&] { return "close " + log_name(host.provider<connection_object>(id)); });
    host.release_object(id);
}

return_code open(const service& provider, std::uint32_t type, connection& conn) {
    machine& host = current_machine();
    const entry_ref entry = host.provider<service_object>(provider.id());
    const auto scope = host.begin_call(
        [&] { return "open " + log_name(entry) + " type " + std::to_string(type); });
    if (scope.fails()) return scope.code();
    if (!entry || !entry->present) return not_found;
    if (!entry->driver) return unsupported;
    const return_code result = entry->driver->open(type);
    if (result == success) conn = connection(host.open_object(connection_object{entry}));
    return result;
}

return_code call(const connection& conn, std::uint32_t selector, const call_inputs& inputs,
                 call_outputs& outputs) {
    machine& host = current_machine();
    const entry_ref provider = host.provider<connection_object>(conn.id());
    const auto scope =
        host.begin_call([&] { return describe_call(provider, selector, inputs, outputs); });
    if (scope.has_empty_result()) outputs = {};
    if (scope.fails()) return scope.code();
    if (!provider || !provider->present) return not_found;
    return provider->driver->call(selector, inputs, outputs);
}

// --- shared memory and ports ---

namespace {

std::string mapping_name(machine& host, handle_id id) {
    return log_name(host.provider<mapping_object>(id));
}

return_code check_mapping(const mapping_object* mapping) {
    if (mapping == nullptr) return bad_argument;
    return mapping->provider->present ? success : not_found;
}

}  // namespace

void memory_kind::release(handle_id id) {
    machine& host = current_machine();
    host.log_event([&] { return "unmap " + mapping_name(host, id); });
    if (const auto* mapping = host.find_object<mapping_object>(id)) mapping->queue->on_unmapped();
    host.release_object(id);
}

void port_kind::release(handle_id id) {
    current_machine().release_object(id);
}

return_code map_memory(const connection& conn, std::uint32_t type, mapped_memory& memory) {
    machine& host = current_machine();
    const entry_ref provider = host.provider<connection_object>(conn.id());
    const auto scope = host.begin_call(
        [&] { return "map " + log_name(provider) + " memory " + std::to_string(type); });
    if (scope.fails()) return scope.code();
    if (!provider || !provider->present) return not_found;
    auto queue = provider->driver->memory(type);
    if (!queue) return unsupported;
    memory = mapped_memory(host.open_object(mapping_object{provider, std::move(queue)}));
    return success;
}

return_code attach_port(const connection& conn, std::uint32_t type, const notification_port& port,
                        std::uint64_t reference) {
    machine& host = current_machine();
    const entry_ref provider = host.provider<connection_object>(conn.id());
    const auto scope = host.begin_call([&] {
        return "attach port to " + log_name(provider) + " notification " + std::to_string(type) +
               " reference " + std::to_string(reference);
    });
    if (scope.fails()) return scope.code();
    if (!provider || !provider->present) return not_found;
    const auto queue = provider->driver->notification(type);
    if (!queue) return unsupported;
    auto* object = host.find_object<port_object>(port.id());
    if (object == nullptr) return bad_argument;
    object->queue = queue;
    return success;
}

// --- data queues ---

notification_port allocate_port() {
    machine& host = current_machine();
    const auto scope = host.begin_call([] { return std::string("allocate port"); });
    if (scope.fails()) return {};
    return notification_port(host.open_object(port_object{}));
}

bool data_available(const mapped_memory& queue) {
    machine& host = current_machine();
    const auto scope =
        host.begin_call([&] { return "data available " + mapping_name(host, queue.id()); });
    const auto* mapping = host.find_object<mapping_object>(queue.id());
    if (scope.fails() || check_mapping(mapping) != success) return false;
    mapping->queue->catch_up();
    return !mapping->queue->empty();
}

return_code dequeue(const mapped_memory& queue, byte_span& entry) {
    machine& host = current_machine();
    const auto scope = host.begin_call([&] {
        return "dequeue " + mapping_name(host, queue.id()) + " capacity " +
               std::to_string(entry.size());
    });
    if (scope.has_empty_result()) entry = {};
    if (scope.fails()) return scope.code();
    const auto* mapping = host.find_object<mapping_object>(queue.id());
    const return_code result = check_mapping(mapping);
    if (result != success) return result;
    if (mapping->queue->empty()) return simulated::queue_empty;
    const byte_view front = mapping->queue->front();
    if (front.size() > entry.size()) return simulated::buffer_too_small;
    std::copy(front.begin(), front.end(), entry.begin());
    entry = entry.first(front.size());
    mapping->queue->pop_front();
    return success;
}

namespace {

// Waits until the queue holds data or its driver is gone. Only the manual clock can detect that
// neither will ever happen.
return_code wait_on(machine& host, const mapping_object& mapping) {
    while (mapping.provider->present) {
        simulated::serve_interrupt();
        mapping.queue->catch_up();
        if (!mapping.queue->empty()) return success;
        if (!host.clock().advance(mapping.queue->next_due())) return simulated::deadlock;
    }
    return not_found;
}

}  // namespace

return_code wait_for_data(const mapped_memory& queue, const notification_port& port) {
    machine& host = current_machine();
    const auto scope = host.begin_call([&] { return "wait " + mapping_name(host, queue.id()); });
    if (scope.fails()) return scope.code();
    const auto* mapping = host.find_object<mapping_object>(queue.id());
    const return_code result = check_mapping(mapping);
    if (result != success) return result;
    const auto* object = host.find_object<port_object>(port.id());
    if (object == nullptr || object->queue != mapping->queue) return bad_argument;
    const mapping_object copy = *mapping;  // an interrupt handler may release the mapping
    return wait_on(host, copy);
}

}  // namespace platform
