#include <cstddef>
#include <cstdint>
#include <limits>
#include <string>
#include <string_view>
#include <vector>

#include "nrxctl/nrxtoollib.h"
#include "nrxctl/options/messages.h"
#include "nrxctl/options/option_functions.h"

namespace nrx::nrxctl {

namespace {

constexpr std::size_t default_capacity = 65'536;
constexpr std::uint32_t max_report_capacity = 1'048'576;

report_id next_report_id(option_arguments& arguments) {
    return arguments.next_number({0, std::numeric_limits<std::uint8_t>::max()}, "a report id");
}

// Prints a reply as a dump, or writes its bytes.
void dump_reply(platform::byte_view reply, reply_format format) {
    if (format != reply_format::bytes) return hex_dump(reply);
    write_output({reinterpret_cast<const char*>(reply.data()), reply.size()});
}

// Writes to standard error.
class error_stream_sink final : public line_sink {
public:
    bool write(std::string_view text) override {
        write_error(text);
        return true;
    }
};

// Makes a call. Its messages on standard output must not get between the bytes of replies.
template <class Call>
platform::return_code call_apart(const Call& call, platform::byte_span& reply) {
    error_stream_sink sink;
    const scoped_sink installed(standard_stream::output, sink);
    return call(reply);
}

// Returns an action that makes a call, which stores a reply in a buffer, and dumps the reply.
template <class Call>
option_action dump_action(option_arguments& arguments, Call call) {
    return [call, format = arguments.settings().use_format()] {
        std::vector<std::uint8_t> buffer(default_capacity);
        platform::byte_span reply = buffer;
        const platform::return_code result =
            format == reply_format::bytes ? call_apart(call, reply) : call(reply);
        if (result == platform::success) dump_reply(reply, format);
    };
}

// The name by which the printers of reports know a service, which may be given as an id. An id
// without a service is returned as it is.
std::string printed_name(std::string_view service) {
    std::string name(service);
    service_id id{};
    if (is_service_id(service) && resolve_service_id(service, id)) service_name_for_id(id, name);
    return std::string(without_prefix(name));
}

void print_reply(std::string_view service, report_id id, platform::byte_view report,
                 reply_format format) {
    if (format != reply_format::text) return dump_reply(report, format);
    print_service_report(printed_name(service), id, report);
}

std::string report_name(std::string_view service, report_id id) {
    text_line name;
    name.text("report 0x").zero_padded_hex(id, 2).text(" of ").text(service);
    return std::string(name.view());
}

std::string property_name(std::string_view service, std::string_view name) {
    return std::string("property ").append(name).append(" of ").append(service);
}

}  // namespace

option_action list(option_arguments& /*arguments*/) {
    return [] { list_services(); };
}

option_action read_report(option_arguments& arguments) {
    const std::string_view service = arguments.next();
    const report_id id = next_report_id(arguments);
    const std::size_t capacity =
        arguments.at_end() ? default_capacity
                           : arguments.next_number({1, max_report_capacity}, "a capacity");
    return [=, format = arguments.settings().use_format()] {
        std::vector<std::uint8_t> buffer(capacity);
        platform::byte_span report = buffer;
        if (get_report(service, id, report) == platform::success)
            print_reply(service, id, report, format);
    };
}

option_action write_report(option_arguments& arguments) {
    const std::string_view service = arguments.next();
    const report_id id = next_report_id(arguments);
    return [=, report = arguments.payload()] {
        echo_payload(report_name(service, id), report);
        set_report(service, id, report);
    };
}

option_action run_command(option_arguments& arguments) {
    const std::string_view service = arguments.next();
    const std::uint32_t code =
        arguments.next_number({0, std::numeric_limits<std::uint32_t>::max()}, "a command code");
    return dump_action(arguments, [=, payload = arguments.payload()](platform::byte_span& reply) {
        echo_payload(service, payload);
        return send_command(service, code, payload, reply);
    });
}

option_action call_scalar(option_arguments& arguments) {
    const std::string_view service = arguments.next();
    std::vector<std::uint64_t> scalars;
    while (!arguments.at_end()) {
        const std::string_view argument = arguments.next();
        const auto scalar = read_number(argument);
        if (!scalar || *scalar < 0)
            throw usage_error{quoted(argument).append(
                " is not a scalar; expected a number from 0 to 9223372036854775807")};
        scalars.push_back(static_cast<std::uint64_t>(*scalar));
    }
    return [=] { call_scalar_method(service, scalars); };
}

option_action get_property(option_arguments& arguments) {
    const std::string_view service = arguments.next();
    const std::string_view name = arguments.next();
    return dump_action(arguments, [=](platform::byte_span& value) {
        return get_named_property(service, name, value);
    });
}

option_action set_property(option_arguments& arguments) {
    const std::string_view service = arguments.next();
    const std::string_view name = arguments.next();
    return [=, value = arguments.payload()] {
        echo_payload(property_name(service, name), value);
        set_named_property(service, name, value);
    };
}

option_action query_hid_driver(option_arguments& arguments) {
    return dump_action(arguments, [input = arguments.payload()](platform::byte_span& output) {
        echo_payload("the HID driver", input);
        return call_hid_driver(input, output);
    });
}

option_action set_mca(option_arguments& arguments) {
    const std::string_view state = arguments.next();
    const bool on = state == "on";
    if (!on && state != "off")
        throw usage_error{quoted(state).append(" is not a state; expected on or off")};
    return [=] { switch_mca(on); };
}

}  // namespace nrx::nrxctl
