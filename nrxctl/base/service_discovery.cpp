#include "nrxctl/base/service_discovery.h"

#include <limits>
#include <optional>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/matching.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

bool is_service_id(std::string_view name) {
    return name.starts_with(hex_prefix) || all_digits(name);
}

std::optional<std::int32_t> narrow_id(std::optional<std::int64_t> number) {
    using limits = std::numeric_limits<std::int32_t>;
    if (!number || *number < limits::min() || *number > limits::max()) return std::nullopt;
    return static_cast<std::int32_t>(*number);
}

// The service id that a name of digits stands for.
std::optional<std::int32_t> read_service_id(std::string_view name) {
    const bool hexadecimal = name.starts_with(hex_prefix);
    if (hexadecimal) name.remove_prefix(hex_prefix.size());
    return narrow_id(read_digits(name, hexadecimal ? 16 : 10));
}

std::optional<std::int32_t> service_id_of(const platform::service& service) {
    const auto id = platform::read_property(service, service_id_key);
    return id ? narrow_id(id->number()) : std::nullopt;
}

}  // namespace

std::string prefixed_name(std::string_view name) {
    constexpr std::string_view prefix = "WQR_";
    constexpr std::size_t longest = 127;
    return std::string(prefix).append(name.substr(0, longest - prefix.size()));
}

platform::service find_service(std::string_view name) {
    if (is_service_id(name)) {
        const auto id = read_service_id(name);
        return id ? platform::first_match(match_service_id(*id)) : platform::service();
    }
    if (auto service = platform::first_match(match_service_name(prefixed_name(name)))) {
        return service;
    }
    return platform::first_match(match_service_name(name));
}

bool service_exists(std::string_view name) {
    if (find_service(name)) return true;
    print_line(text_line().text("Service ").text(name).text(" can't be found").view());
    return false;
}

platform::service find_hid_device(std::string_view name) {
    if (is_service_id(name)) {
        const auto location = read_service_id(name);
        return location ? platform::first_match(match_hid_device(*location)) : platform::service();
    }
    const platform::service nrx_interface = find_service(name);
    if (!check(nrx_interface, "nrx_interface")) return {};
    const auto location = platform::read_property(nrx_interface, service_id_key);
    return location ? platform::first_match(match_hid_device(*location)) : platform::service();
}

bool resolve_service_id(std::string_view name, std::int32_t& id) {
    std::optional<std::int32_t> found;
    if (is_service_id(name)) {
        found = read_service_id(name);
    } else {
        const platform::service service = find_service(name);
        if (!check(service, "service != ((io_object_t) 0)")) return false;
        found = service_id_of(service);
    }
    if (found) id = *found;
    return found.has_value();
}

bool service_name_for_id(std::int32_t id, std::string& name) {
    const platform::service service = platform::first_match(match_service_id(id));
    if (!check(service, "service != ((io_object_t) 0)")) return false;
    std::string entry_name;
    const platform::return_code kr = platform::entry_name(service, entry_name);
    if (!check_success(kr, "kr == 0 ")) return false;
    name = entry_name;
    return true;
}

}  // namespace nrx
