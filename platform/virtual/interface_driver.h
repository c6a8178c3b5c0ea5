// The driver of an interface service: reports, commands and named properties.
#pragma once

#include <cstdint>
#include <functional>
#include <map>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/virtual/driver.h"

namespace platform::simulated {

using byte_list = std::vector<std::uint8_t>;

// Serves the command channel of an interface service from maps. Reports and properties that were
// written read back.
class interface_driver : public driver {
public:
    // Runs a command with a payload and fills in the reply.
    using command = std::function<return_code(byte_view payload, byte_list& reply)>;

    // Generates a report of at most capacity bytes when it is read.
    using report_source = std::function<return_code(std::size_t capacity, byte_list& reply)>;

    // Acts on a report when it is written.
    using report_sink = std::function<return_code(byte_view report)>;

    // Acts on the scalar call, which takes any number of scalars.
    using scalar_method = std::function<return_code(std::span<const std::uint64_t> scalars)>;

    // Adds or replaces a report. A write to a report that does not exist is unsupported.
    void set_report(std::uint32_t id, byte_list bytes) { reports_[id] = std::move(bytes); }

    // Adds a report that is generated on each read.
    void set_report_source(std::uint32_t id, report_source source) {
        report_sources_[id] = std::move(source);
    }

    // Passes each write of an existing report to the sink. The report is stored if that succeeds.
    void set_report_sink(std::uint32_t id, report_sink sink) {
        report_sinks_[id] = std::move(sink);
    }

    void drop_report(std::uint32_t id) { reports_.erase(id); }

    // The current bytes of a report; null if there is no such report.
    [[nodiscard]] const byte_list* report(std::uint32_t id) const;

    // Adds a command. Other commands are unsupported.
    void set_command(std::uint32_t code, command run) { commands_[code] = std::move(run); }

    // Adds the scalar call, which is unsupported otherwise.
    void set_scalar_method(scalar_method run) { scalar_method_ = std::move(run); }

    // Sets a named property. A service without any does not support named properties.
    void set_named_property(std::string_view name, byte_list value);

    return_code call(std::uint32_t selector, const call_inputs& inputs,
                     call_outputs& outputs) override;

private:
    return_code run_scalar_method(const call_inputs& inputs, const call_outputs& outputs);
    return_code write_report(const call_inputs& inputs, call_outputs& outputs);
    return_code read_report(const call_inputs& inputs, call_outputs& outputs);
    return_code run_command(const call_inputs& inputs, call_outputs& outputs);
    return_code write_named_property(const call_inputs& inputs, call_outputs& outputs);
    return_code read_named_property(const call_inputs& inputs, call_outputs& outputs);

    std::map<std::uint32_t, byte_list> reports_;
    std::map<std::uint32_t, report_source> report_sources_;
    std::map<std::uint32_t, report_sink> report_sinks_;
    std::map<std::uint32_t, command> commands_;
    scalar_method scalar_method_;
    std::map<std::string, byte_list, std::less<>> named_properties_;
    bool has_named_properties_ = false;
};

}  // namespace platform::simulated
