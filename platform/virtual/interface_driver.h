// The driver behind an interface service: reports, commands and named properties.
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

// Answers the command channel of an interface service from maps. What is written reads back: a
// written report, a set property.
class interface_driver : public driver {
public:
    // Carries out a command: the payload goes in, the reply comes out.
    using command = std::function<return_code(byte_view payload, byte_list& reply)>;

    // Makes a report when it is read: reply may become as long as room. Does what a report that is
    // written asks for.
    using report_source = std::function<return_code(std::size_t room, byte_list& reply)>;
    using report_sink = std::function<return_code(byte_view report)>;

    // Gives the service a report; only reports that it has can be read or written.
    void set_report(std::uint32_t id, byte_list bytes) { reports_[id] = std::move(bytes); }

    // Gives the service a report that is made anew whenever it is read.
    void set_report_source(std::uint32_t id, report_source source) {
        report_sources_[id] = std::move(source);
    }

    // Hands a report that the service has to sink before it is stored; it is stored on success.
    void set_report_sink(std::uint32_t id, report_sink sink) {
        report_sinks_[id] = std::move(sink);
    }

    // Takes a report away again.
    void drop_report(std::uint32_t id) { reports_.erase(id); }

    // The bytes of a report as they now stand; null if the service has no such report.
    [[nodiscard]] const byte_list* report(std::uint32_t id) const;

    // Gives the service a command; any other command is unsupported.
    void set_command(std::uint32_t code, command run) { commands_[code] = std::move(run); }

    // Carries out the service's scalar call, which takes any count of scalars.
    using scalar_method = std::function<return_code(std::span<const std::uint64_t> scalars)>;

    // Gives the service a scalar call; without one it is unsupported.
    void set_scalar_method(scalar_method run) { scalar_method_ = std::move(run); }

    // Lets the service take and give named properties, and sets one.
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
