#include "nrxctl/base/services.h"

#include <limits>
#include <optional>
#include <utility>
#include <vector>

#include "nrxctl/base/check.h"
#include "nrxctl/base/explanation.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

constexpr std::string_view name_prefix = "WQR_";

// The condition of a lookup, in failure reports.
constexpr const char* service_is_not_null = "service != ((io_object_t) 0)";

std::optional<service_id> narrow_id(std::optional<std::int64_t> number) {
    using limits = std::numeric_limits<service_id>;
    if (!number || *number < limits::min() || *number > limits::max()) return std::nullopt;
    return static_cast<service_id>(*number);
}

// The service id that a numeric service name stands for.
std::optional<service_id> parse_service_id(std::string_view name) {
    const bool hexadecimal = name.starts_with(hex_prefix);
    if (hexadecimal) name.remove_prefix(hex_prefix.size());
    return narrow_id(read_digits(name, hexadecimal ? 16 : 10));
}

std::optional<service_id> read_service_id(const platform::service& service) {
    const auto id = platform::read_property(service, service_id_key);
    return id ? narrow_id(id->number()) : std::nullopt;
}

// The names of all interface services, as a user may give them.
std::vector<std::string> service_names() {
    std::vector<platform::service> services;
    std::vector<std::string> names;
    if (platform::all_matches(platform::matching_class(interface_class), services) !=
        platform::success)
        return names;
    for (const platform::service& service : services) {
        std::string name;
        if (platform::entry_name(service, name) == platform::success)
            names.emplace_back(without_prefix(name));
    }
    return names;
}

platform::return_code list_service(const platform::service& service) {
    constexpr std::size_t name_width = 24;
    std::string name;
    const platform::return_code kr = platform::entry_name(service, name);
    if (!check_success(kr, condition::kr_is_zero)) return kr;
    const auto id = platform::read_property(service, service_id_key);
    text_line line;
    line.pad_right(name, name_width).text(" ");
    if (id && id->number()) {
        line.text("0x").hex(static_cast<std::uint32_t>(*id->number()));
    } else {
        line.text("no id");
    }
    print_line(line.view());
    return platform::success;
}

}  // namespace

platform::dictionary match_service_id(service_id id) {
    platform::dictionary matching = platform::matching_class(interface_class);
    matching.set(platform::property_match_key,
                 platform::dictionary{{std::string(service_id_key), id}});
    return matching;
}

platform::dictionary match_service_name(std::string_view name) {
    platform::dictionary matching = platform::matching_class(interface_class);
    matching.set(platform::name_match_key, name);
    return matching;
}

platform::dictionary match_name(std::string_view name) {
    return {{std::string(platform::name_match_key), name}};
}

platform::dictionary match_hid_device(const platform::property& location) {
    platform::dictionary matching = platform::matching_class(hid_device_class);
    matching.set(platform::location_id_key, location);
    return matching;
}

platform::dictionary usage_pair(std::int32_t page, std::int32_t usage) {
    return {{std::string(platform::usage_page_key), page},
            {std::string(platform::usage_key), usage}};
}

platform::dictionary match_usage_pairs(platform::array pairs) {
    return {{std::string(platform::usage_pairs_key), std::move(pairs)}};
}

std::string prefixed_name(std::string_view name) {
    constexpr std::size_t max_length = 127;
    return std::string(name_prefix).append(name.substr(0, max_length - name_prefix.size()));
}

std::string_view without_prefix(std::string_view registry_name) {
    if (registry_name.starts_with(name_prefix)) registry_name.remove_prefix(name_prefix.size());
    return registry_name;
}

bool is_service_id(std::string_view name) {
    return name.starts_with(hex_prefix) || all_digits(name);
}

void explain_missing_service(std::string_view name) {
    explain([&] {
        const std::vector<std::string> names = service_names();
        const std::vector<std::string_view> candidates(names.begin(), names.end());
        return explanation{"no service " + quoted(name),
                           "--list shows all" + suggestion(name, candidates)};
    });
}

platform::service find_service(std::string_view name) {
    if (is_service_id(name)) {
        const auto id = parse_service_id(name);
        return id ? platform::first_match(match_service_id(*id)) : platform::service();
    }
    if (auto service = platform::first_match(match_service_name(prefixed_name(name)))) {
        return service;
    }
    return platform::first_match(match_service_name(name));
}

bool service_exists(std::string_view name) {
    if (find_service(name)) return true;
    explain_missing_service(name);
    print_failure(text_line().text("Service ").text(name).text(" can't be found").view());
    return false;
}

platform::service find_hid_device(std::string_view name) {
    if (is_service_id(name)) {
        const auto location = parse_service_id(name);
        return location ? platform::first_match(match_hid_device(*location)) : platform::service();
    }
    const platform::service nrx_interface = find_service(name);
    if (!nrx_interface) explain_missing_service(name);
    if (!check(nrx_interface, "nrx_interface")) return {};
    const auto location = platform::read_property(nrx_interface, service_id_key);
    return location ? platform::first_match(match_hid_device(*location)) : platform::service();
}

bool resolve_service_id(std::string_view name, service_id& id) {
    std::optional<service_id> resolved;
    if (is_service_id(name)) {
        resolved = parse_service_id(name);
        if (!resolved) explain_missing_service(name);
    } else {
        const platform::service service = find_service(name);
        if (!service) explain_missing_service(name);
        if (!check(service, service_is_not_null)) return false;
        resolved = read_service_id(service);
    }
    if (resolved) id = *resolved;
    return resolved.has_value();
}

bool service_name_for_id(service_id id, std::string& name) {
    const platform::service service = platform::first_match(match_service_id(id));
    if (!check(service, service_is_not_null)) return false;
    std::string entry_name;
    const platform::return_code kr = platform::entry_name(service, entry_name);
    if (!check_success(kr, condition::kr_is_zero)) return false;
    name = entry_name;
    return true;
}

platform::return_code list_services() {
    std::vector<platform::service> services;
    const platform::return_code kr =
        platform::all_matches(platform::matching_class(interface_class), services);
    if (!check_success(kr, condition::kr_is_zero)) return kr;
    platform::return_code result = platform::success;
    for (const platform::service& service : services) {
        const platform::return_code listed = list_service(service);
        if (listed != platform::success) result = listed;
    }
    return result;
}

platform::return_code set_service_property(const platform::service& service, const char* name,
                                           const platform::property* value) {
    if (!check(name, condition::property_name)) return platform::bad_argument;
    if (!check(value, condition::property)) return platform::bad_argument;
    const platform::return_code kr = platform::set_property(service, name, *value);
    check_success(kr, condition::kr_is_zero);
    return kr;
}

platform::return_code show_service_property(const platform::service& service, const char* name) {
    if (!check(name, condition::property_name)) return platform::success;
    const auto property = platform::read_property(service, name);
    if (!check(property, condition::property)) return platform::success;
    write_error(platform::describe(*property) + "\n");
    return platform::success;
}

}  // namespace nrx
