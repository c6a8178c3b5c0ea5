// Shared memory of drivers, its data queues and their ports, on the virtual host.

#include <algorithm>
#include <string>

#include "platform/data_queue.h"
#include "platform/virtual/current_machine.h"
#include "platform/virtual/interrupts.h"

namespace platform {

using simulated::current_machine;
using simulated::entry_ref;
using simulated::failure;
using simulated::lent_connection;
using simulated::lent_mapping;
using simulated::lent_port;
using simulated::machine;

namespace {

std::string name_of(machine& host, handle_id id) {
    const lent_mapping* mapping = host.lent<lent_mapping>(id);
    return name_of(mapping != nullptr ? mapping->provider : nullptr);
}

return_code check_mapping(const lent_mapping* mapping) {
    if (mapping == nullptr) return bad_argument;
    return mapping->provider->present ? success : not_found;
}

// Waits until the queue holds data, its driver is gone, or, which only the manual clock can tell,
// nothing can ever happen any more.
return_code wait_on(machine& host, const lent_mapping& mapping) {
    while (mapping.provider->present) {
        simulated::serve_interrupt();
        mapping.queue->catch_up();
        if (!mapping.queue->empty()) return success;
        if (!host.clock().pass(mapping.queue->next_due())) return simulated::endless_wait;
    }
    return not_found;
}

}  // namespace

void memory_kind::release(handle_id id) {
    machine& host = current_machine();
    host.note([&] { return "unmap " + name_of(host, id); });
    if (const lent_mapping* mapping = host.lent<lent_mapping>(id)) mapping->queue->unmapped();
    host.take_back(id);
}

void port_kind::release(handle_id id) {
    current_machine().take_back(id);
}

return_code map_memory(const connection& connected, std::uint32_t type, mapped_memory& mapped) {
    machine& host = current_machine();
    const entry_ref provider = host.provider<lent_connection>(connected.id());
    const auto how = host.begin_call(
        [&] { return "map " + name_of(provider) + " memory " + std::to_string(type); });
    if (how) return code_of(*how);
    if (!provider || !provider->present) return not_found;
    auto queue = provider->unit->memory(type);
    if (!queue) return unsupported;
    mapped = mapped_memory(host.lend(lent_mapping{provider, std::move(queue)}));
    return success;
}

return_code attach_port(const connection& connected, std::uint32_t type,
                        const notification_port& port, std::uint64_t reference) {
    machine& host = current_machine();
    const entry_ref provider = host.provider<lent_connection>(connected.id());
    const auto how = host.begin_call([&] {
        return "attach port to " + name_of(provider) + " notification " + std::to_string(type) +
               " reference " + std::to_string(reference);
    });
    if (how) return code_of(*how);
    if (!provider || !provider->present) return not_found;
    const auto queue = provider->unit->notification(type);
    if (!queue) return unsupported;
    auto* attached = host.lent<lent_port>(port.id());
    if (attached == nullptr) return bad_argument;
    attached->queue = queue;
    return success;
}

notification_port allocate_port() {
    machine& host = current_machine();
    const auto how = host.begin_call([] { return std::string("allocate port"); });
    return how ? notification_port() : notification_port(host.lend(lent_port{}));
}

bool data_available(const mapped_memory& queue) {
    machine& host = current_machine();
    const auto how = host.begin_call([&] { return "data available " + name_of(host, queue.id()); });
    const lent_mapping* mapping = host.lent<lent_mapping>(queue.id());
    if (how || check_mapping(mapping) != success) return false;
    mapping->queue->catch_up();
    return !mapping->queue->empty();
}

return_code dequeue(const mapped_memory& queue, byte_span& entry) {
    machine& host = current_machine();
    const auto how = host.begin_call([&] {
        return "dequeue " + name_of(host, queue.id()) + " room " + std::to_string(entry.size());
    });
    if (how) {
        if (*how == failure::nothing) entry = {};
        return code_of(*how);
    }
    const lent_mapping* mapping = host.lent<lent_mapping>(queue.id());
    const return_code usable = check_mapping(mapping);
    if (usable != success) return usable;
    if (mapping->queue->empty()) return simulated::nothing_queued;
    const byte_view first = mapping->queue->first();
    if (first.size() > entry.size()) return simulated::no_room;
    std::copy(first.begin(), first.end(), entry.begin());
    entry = entry.first(first.size());
    mapping->queue->drop_first();
    return success;
}

return_code wait_for_data(const mapped_memory& queue, const notification_port& port) {
    machine& host = current_machine();
    const auto how = host.begin_call([&] { return "wait " + name_of(host, queue.id()); });
    if (how) return code_of(*how);
    const lent_mapping* mapping = host.lent<lent_mapping>(queue.id());
    const return_code usable = check_mapping(mapping);
    if (usable != success) return usable;
    const auto* attached = host.lent<lent_port>(port.id());
    if (attached == nullptr || attached->queue != mapping->queue) return bad_argument;
    const lent_mapping kept = *mapping;  // an interrupt handler may change what is lent out
    return wait_on(host, kept);
}

}  // namespace platform
