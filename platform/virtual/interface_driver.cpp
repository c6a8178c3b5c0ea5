#include "platform/virtual/interface_driver.h"

#include <algorithm>
#include <array>
#include <limits>
#include <optional>
#include <utility>

namespace platform::simulated {

namespace {

constexpr std::uint32_t scalar_selector = 0;

// Converts a scalar to 32 bits; nullopt if it does not fit.
std::optional<std::uint32_t> narrow_scalar(std::uint64_t scalar) {
    if (scalar > std::numeric_limits<std::uint32_t>::max()) return std::nullopt;
    return static_cast<std::uint32_t>(scalar);
}

// Returns true if the bytes are text whose first NUL is their last byte.
bool is_nul_terminated(byte_view bytes) {
    return !bytes.empty() && std::find(bytes.begin(), bytes.end(), 0) == bytes.end() - 1;
}

}  // namespace

const byte_list* interface_driver::report(std::uint32_t id) const {
    const auto match = reports_.find(id);
    return match == reports_.end() ? nullptr : &match->second;
}

void interface_driver::set_named_property(std::string_view name, byte_list value) {
    has_named_properties_ = true;
    named_properties_.insert_or_assign(std::string(name), std::move(value));
}

return_code interface_driver::call(std::uint32_t selector, const call_inputs& inputs,
                                   call_outputs& outputs) {
    using method = simulated::method<interface_driver>;
    using enum argument_rule;
    static constexpr std::array methods{
        method{1, {1, required, 0, none}, &interface_driver::write_report},
        method{2, {1, none, 0, required}, &interface_driver::read_report},
        method{3, {1, optional, 0, optional}, &interface_driver::run_command},
        method{4, {1, required, 0, none}, &interface_driver::write_named_property},
        method{5, {0, required, 0, required}, &interface_driver::read_named_property},
    };
    // The scalar call takes any number of scalars, so it has no row.
    if (selector == scalar_selector) return run_scalar_method(inputs, outputs);
    return run_method(*this, methods, selector, inputs, outputs);
}

return_code interface_driver::run_scalar_method(const call_inputs& inputs,
                                                const call_outputs& outputs) {
    if (!scalar_method_) return unsupported;
    using enum argument_rule;
    const return_code result =
        check_arguments({inputs.scalars.size(), none, 0, none}, inputs, outputs);
    return result == success ? scalar_method_(inputs.scalars) : result;
}

return_code interface_driver::write_report(const call_inputs& inputs, call_outputs& /*outputs*/) {
    const auto id = narrow_scalar(inputs.scalars[0]);
    if (!id || report(*id) == nullptr) return unsupported;
    const auto sink = report_sinks_.find(*id);
    const return_code result =
        sink == report_sinks_.end() ? success : sink->second(inputs.structure);
    if (result != success) return result;
    reports_[*id].assign(inputs.structure.begin(), inputs.structure.end());
    return success;
}

return_code interface_driver::read_report(const call_inputs& inputs, call_outputs& outputs) {
    const auto id = narrow_scalar(inputs.scalars[0]);
    if (!id) return unsupported;
    const auto source = report_sources_.find(*id);
    if (source != report_sources_.end()) {
        byte_list reply;
        const return_code result = source->second(outputs.structure.size(), reply);
        return result == success ? copy_reply(reply, outputs) : result;
    }
    const byte_list* bytes = report(*id);
    return bytes == nullptr ? unsupported : copy_reply(*bytes, outputs);
}

return_code interface_driver::run_command(const call_inputs& inputs, call_outputs& outputs) {
    const auto code = narrow_scalar(inputs.scalars[0]);
    const auto match = code ? commands_.find(*code) : commands_.end();
    if (match == commands_.end()) return unsupported;
    byte_list reply;
    const return_code result = match->second(inputs.structure, reply);
    return result == success ? copy_reply(reply, outputs) : result;
}

return_code interface_driver::write_named_property(const call_inputs& inputs,
                                                   call_outputs& /*outputs*/) {
    if (!has_named_properties_) return unsupported;
    const auto name_size = narrow_scalar(inputs.scalars[0]);
    if (!name_size || *name_size > inputs.structure.size()) return bad_argument;
    const byte_view name = inputs.structure.first(*name_size);
    if (!is_nul_terminated(name)) return bad_argument;
    const byte_view value = inputs.structure.subspan(*name_size);
    set_named_property(std::string(name.begin(), name.end() - 1),
                       byte_list(value.begin(), value.end()));
    return success;
}

return_code interface_driver::read_named_property(const call_inputs& inputs,
                                                  call_outputs& outputs) {
    if (!has_named_properties_) return unsupported;
    const byte_view name = inputs.structure;
    if (!is_nul_terminated(name)) return bad_argument;
    const auto match = named_properties_.find(std::string(name.begin(), name.end() - 1));
    return match == named_properties_.end() ? not_found : copy_reply(match->second, outputs);
}

}  // namespace platform::simulated
