#include "nrxctl/inspection/sensor_registry.h"

#include <cstdint>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "nrxctl/base/check.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/services.h"
#include "nrxctl/base/text_line.h"
#include "platform/registry.h"

namespace nrx {

namespace {

constexpr int event_count_level = 3;

constexpr std::string_view hid_interface_class = "KeltoNRXHIDInterface";
constexpr std::string_view list_failure = "Can't enumerate HID services";

// Replaces an entry by its first child.
bool descend(platform::service& entry) {
    platform::service child = platform::first_child(entry, platform::service_plane);
    if (!check(child, condition::child)) return false;
    entry = std::move(child);
    return true;
}

// The numbers in an entry's dictionary "DebugState".
class debug_state {
public:
    explicit debug_state(const platform::service& entry)
        : state_(platform::read_property(entry, "DebugState")) {}

    // Returns the low 32 bits of a count; -1 if it is missing.
    [[nodiscard]] std::int32_t count(std::string_view key) const {
        constexpr std::int64_t missing = -1;
        return static_cast<std::int32_t>(number(key).value_or(missing));
    }

    // Returns a time, which is stored in nanoseconds, in seconds; 0 if it is missing.
    [[nodiscard]] double seconds(std::string_view key) const {
        constexpr double nanoseconds_per_second = 1000000000;
        const auto nanoseconds = static_cast<std::uint64_t>(number(key).value_or(0));
        return static_cast<double>(nanoseconds) / nanoseconds_per_second;
    }

private:
    [[nodiscard]] std::optional<std::int64_t> number(std::string_view key) const {
        const platform::dictionary* entries = state_ ? state_->entries() : nullptr;
        const platform::property* value = entries != nullptr ? entries->find(key) : nullptr;
        return value != nullptr ? value->number() : std::nullopt;
    }

    std::optional<platform::property> state_;
};

void print_names() {
    std::vector<platform::service> services;
    const auto list_result =
        platform::all_matches(platform::matching_class(hid_interface_class), services);
    if (!check(list_result == platform::success, condition::kr_is_zero_without_space))
        return print_line(list_failure);
    text_line line;
    line.text("Available HID services: ");
    for (platform::service& service : services) {
        std::string name;
        const auto name_result = platform::entry_name(service, name);
        if (!check(name_result == platform::success, condition::kr_is_zero_without_space))
            return print_line(line.text(list_failure).view());
        line.text(name).text(" ");
        service.reset();
    }
    print_line(line.view());
}

void print_lookup(std::string_view name) {
    const platform::dictionary matching = match_service_name(name);
    const platform::service service = platform::first_match(matching);
    text_line line;
    line.text("Matching ").text(name);
    line.text(" [0x").hex(reinterpret_cast<std::uintptr_t>(&matching));
    print_line(line.text(", ").number(service.id()).text("]").view());
}

}  // namespace

void print_event_statistics(std::string_view service_name) {
    platform::service entry = find_service(service_name);
    if (!check(entry, condition::service)) return;
    for (int level = 0; level < event_count_level; ++level) {
        if (!descend(entry)) return;
    }
    const std::int32_t events = debug_state(entry).count("_num_events");
    if (!descend(entry)) return;
    const debug_state queue(entry);
    constexpr int digits = 6;
    text_line line;
    line.text("APEvents    : ").number(events);
    line.text(" [enqueued=").number(queue.count("EnqueueEventCount"));
    line.text(" dropped=").number(queue.count("DroppedEventCount"));
    line.text("; event_delta=").fixed(queue.seconds("LastEventTime"), digits);
    line.text(" dropped_delta=").fixed(queue.seconds("LastDroppedEventTime"), digits);
    print_line(line.text("]").view());
}

void print_hid_services(std::string_view service_name) {
    print_names();
    print_lookup(prefixed_name(service_name));
    print_lookup(service_name);
    print_line("\n\n");
}

}  // namespace nrx
