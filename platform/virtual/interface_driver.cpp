#include "platform/virtual/interface_driver.h"

#include <algorithm>
#include <array>
#include <limits>
#include <optional>
#include <utility>

namespace platform::simulated {

namespace {

// A scalar as the 32-bit number that it was widened from; none if it was not.
std::optional<std::uint32_t> narrow_scalar(std::uint64_t scalar) {
    if (scalar > std::numeric_limits<std::uint32_t>::max()) return std::nullopt;
    return static_cast<std::uint32_t>(scalar);
}

// The one method that takes any count of scalars.
constexpr std::uint32_t scalar_selector = 0;

}  // namespace

const byte_list* interface_driver::report(std::uint32_t id) const {
    const auto found = reports_.find(id);
    return found == reports_.end() ? nullptr : &found->second;
}

void interface_driver::set_named_property(std::string_view name, byte_list value) {
    has_named_properties_ = true;
    named_properties_.insert_or_assign(std::string(name), std::move(value));
}

return_code interface_driver::call(std::uint32_t selector, const call_inputs& inputs,
                                   call_outputs& outputs) {
    using method = simulated::method<interface_driver>;
    using enum presence;
    static constexpr std::array methods{
        method{1, {1, required, 0, none}, &interface_driver::write_report},
        method{2, {1, none, 0, required}, &interface_driver::read_report},
        method{3, {1, optional, 0, optional}, &interface_driver::run_command},
        method{4, {1, required, 0, none}, &interface_driver::write_named_property},
        method{5, {0, required, 0, required}, &interface_driver::read_named_property},
    };
    if (selector == scalar_selector) return run_scalar_method(inputs, outputs);
    return run_method(*this, methods, selector, inputs, outputs);
}

return_code interface_driver::run_scalar_method(const call_inputs& inputs,
                                                const call_outputs& outputs) {
    if (!scalar_method_) return unsupported;
    const method_shape shape{inputs.scalars.size(), presence::none, 0, presence::none};
    const return_code fitting = check_shape(shape, inputs, outputs);
    return fitting == success ? scalar_method_(inputs.scalars) : fitting;
}

return_code interface_driver::write_report(const call_inputs& inputs, call_outputs& /*outputs*/) {
    const auto id = narrow_scalar(inputs.scalars[0]);
    if (!id || report(*id) == nullptr) return unsupported;
    const auto sink = report_sinks_.find(*id);
    const return_code taken =
        sink == report_sinks_.end() ? success : sink->second(inputs.structure);
    if (taken != success) return taken;
    reports_[*id].assign(inputs.structure.begin(), inputs.structure.end());
    return success;
}

return_code interface_driver::read_report(const call_inputs& inputs, call_outputs& outputs) {
    const auto id = narrow_scalar(inputs.scalars[0]);
    const auto source = id ? report_sources_.find(*id) : report_sources_.end();
    if (source != report_sources_.end()) {
        byte_list reply;
        const return_code made = source->second(outputs.structure.size(), reply);
        return made == success ? answer(reply, outputs) : made;
    }
    const byte_list* bytes = id ? report(*id) : nullptr;
    return bytes == nullptr ? unsupported : answer(*bytes, outputs);
}

return_code interface_driver::run_command(const call_inputs& inputs, call_outputs& outputs) {
    const auto code = narrow_scalar(inputs.scalars[0]);
    const auto found = code ? commands_.find(*code) : commands_.end();
    if (found == commands_.end()) return unsupported;
    byte_list reply;
    const return_code result = found->second(inputs.structure, reply);
    return result == success ? answer(reply, outputs) : result;
}

return_code interface_driver::write_named_property(const call_inputs& inputs,
                                                   call_outputs& /*outputs*/) {
    if (!has_named_properties_) return unsupported;
    const auto name_size = narrow_scalar(inputs.scalars[0]);
    if (!name_size || *name_size == 0 || *name_size > inputs.structure.size()) return bad_argument;
    const byte_view name = inputs.structure.first(*name_size);
    if (std::find(name.begin(), name.end(), 0) != name.end() - 1) return bad_argument;
    const byte_view value = inputs.structure.subspan(*name_size);
    set_named_property(std::string(name.begin(), name.end() - 1),
                       byte_list(value.begin(), value.end()));
    return success;
}

return_code interface_driver::read_named_property(const call_inputs& inputs,
                                                  call_outputs& outputs) {
    if (!has_named_properties_) return unsupported;
    const byte_view name = inputs.structure;
    if (std::find(name.begin(), name.end(), 0) != name.end() - 1) return bad_argument;
    const auto found = named_properties_.find(std::string(name.begin(), name.end() - 1));
    return found == named_properties_.end() ? not_found : answer(found->second, outputs);
}

}  // namespace platform::simulated
