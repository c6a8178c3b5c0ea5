#include <cstddef>
#include <cstdint>
#include <limits>
#include <string_view>
#include <vector>

#include "nrxctl/nrxtoollib.h"
#include "nrxctl/options/option_functions.h"

namespace nrx::nrxctl {

namespace {

constexpr std::size_t default_capacity = 65'536;
constexpr std::uint32_t max_report_capacity = 1 << 20;

report_id parse_report_id(std::string_view argument) {
    return parse_number_up_to(std::numeric_limits<std::uint8_t>::max(), argument,
                              "report id is invalid");
}

// Makes a call that stores a reply in a buffer, and dumps the reply.
template <class Call>
option_result dump_reply(const Call& call) {
    std::vector<std::uint8_t> buffer(default_capacity);
    platform::byte_span reply = buffer;
    const platform::return_code result = call(reply);
    if (result == platform::success) hex_dump(reply);
    return result_of(result);
}

}  // namespace

option_result list(option_arguments& /*arguments*/) {
    return result_of(list_services());
}

option_result read_report(option_arguments& arguments) {
    const auto id_argument = arguments.next();
    if (!id_argument) return option_result::usage_error;
    const report_id id = parse_report_id(*id_argument);
    std::size_t capacity = default_capacity;
    if (const auto argument = arguments.next()) {
        capacity = parse_number_up_to(max_report_capacity, *argument, "capacity is invalid");
    }
    std::vector<std::uint8_t> buffer(capacity);
    platform::byte_span report = buffer;
    const platform::return_code result = get_report(arguments.required(), id, report);
    if (result == platform::success) print_report(arguments.required(), id, report);
    return result_of(result);
}

option_result write_report(option_arguments& arguments) {
    const auto id_argument = arguments.next();
    if (!id_argument) return option_result::usage_error;
    const report_id id = parse_report_id(*id_argument);
    const auto report = arguments.payload();
    if (report.empty()) return option_result::usage_error;
    return result_of(set_report(arguments.required(), id, report));
}

option_result run_command(option_arguments& arguments) {
    const auto code_argument = arguments.next();
    if (!code_argument) return option_result::usage_error;
    const std::uint32_t code = parse_number_up_to(std::numeric_limits<std::uint32_t>::max(),
                                                  *code_argument, "command code is invalid");
    const auto payload = arguments.payload();
    return dump_reply([&](platform::byte_span& reply) {
        return send_command(arguments.required(), code, payload, reply);
    });
}

option_result call_scalar(option_arguments& arguments) {
    std::vector<std::uint64_t> scalars;
    while (const auto argument = arguments.next()) {
        const std::int64_t scalar = parse_number(*argument, "scalar is invalid");
        scalars.push_back(static_cast<std::uint64_t>(scalar));  // no argument has a minus sign
    }
    return result_of(call_scalar_method(arguments.required(), scalars));
}

option_result get_property(option_arguments& arguments) {
    const auto name = arguments.next();
    if (!name) return option_result::usage_error;
    return dump_reply([&](platform::byte_span& value) {
        return get_named_property(arguments.required(), *name, value);
    });
}

option_result set_property(option_arguments& arguments) {
    const auto name = arguments.next();
    if (!name) return option_result::usage_error;
    const auto value = arguments.payload();
    if (value.empty()) return option_result::usage_error;
    return result_of(set_named_property(arguments.required(), *name, value));
}

option_result query_hid_driver(option_arguments& arguments) {
    const auto input = arguments.payload();
    if (input.empty()) return option_result::usage_error;
    return dump_reply([&](platform::byte_span& output) { return call_hid_driver(input, output); });
}

option_result set_mca(option_arguments& arguments) {
    const std::string_view state = arguments.required();
    const bool on = state == "on";
    if (!on && state != "off") reject_argument("mca is neither on nor off", state);
    return result_of(switch_mca(on));
}

}  // namespace nrx::nrxctl
