#include "tests/profiler/profiler_host.h"

#include <csignal>
#include <regex>

#include "nrxctl/base/clock_references.h"
#include "nrxctl/decoders/record_text.h"
#include "nrxctl/profiler/profile_command.h"
#include "platform/clock.h"
#include "tests/support/argument_vector.h"

namespace tests {

platform::return_code scripted_driver::call(std::uint32_t method,
                                            const platform::call_inputs& /*inputs*/,
                                            platform::call_outputs& outputs) {
    if (const auto action = actions.find(method); action != actions.end()) action->second();
    auto& script = replies[method];
    const reply current = script.empty() ? reply{} : script.front();
    if (script.size() > 1) script.erase(script.begin());
    if (current.code != platform::success) return current.code;
    if (!outputs.scalars.empty()) outputs.scalars[0] = current.scalar;
    return platform::simulated::copy_reply(current.bytes, outputs);
}

byte_list record_bytes(std::uint8_t type, std::uint8_t fill) {
    byte_list bytes(48, fill);
    bytes[0] = type;
    return bytes;
}

std::string dumped(std::uint8_t type, std::uint8_t fill) {
    const byte_list bytes = record_bytes(type, fill);
    return capture([&] { nrx::print_complete_records(bytes, nrx::dump_profile_record); }).out;
}

byte_list joined(const std::vector<byte_list>& lists) {
    byte_list bytes;
    for (const byte_list& list : lists)
        bytes.insert(bytes.end(), list.begin(), list.end());
    return bytes;
}

bool has_default_interrupt_action() {
    struct sigaction current {};
    ::sigaction(SIGINT, nullptr, &current);
    return current.sa_handler == SIG_DFL;
}

result attempt(const std::function<bool()>& operation) {
    bool succeeded = false;
    const outcome written = capture([&] { succeeded = operation(); });
    return {succeeded, written.out + written.err};
}

profiler_test::profiler_test() {
    nrx::tick_period = platform::tick_period();
    auto scripted = std::make_shared<scripted_driver>();
    driver = scripted.get();
    host.add({.name = "KeltoNRXProfileDriver", .driver = scripted});
    service = &add_service(host, "profile", 0x50);
    for (const std::uint32_t report : {0xd0U, 0xd1U, 0xd2U, 0xd5U})
        service->set_report(report, {});
    for (const std::uint32_t command : {0x20U, 0x21U, 0x23U, 0x24U})
        set_reply(command, platform::success);
}

void profiler_test::set_reply(std::uint32_t command, platform::return_code code,
                              const byte_list& reply) {
    service->set_command(command, [=](platform::byte_view, byte_list& response) {
        response = reply;
        return code;
    });
}

void profiler_test::set_fw_log(const byte_list& record) {
    service->set_report_source(0xd1, [log = record](std::size_t, byte_list& reply) mutable {
        reply = std::exchange(log, {});
        return platform::success;
    });
}

std::string profiler_test::new_events() {
    std::string text;
    for (; seen_ < host.log().size(); ++seen_) {
        std::string line = host.log()[seen_];
        if (line.starts_with("first match") || line.starts_with("release ")) continue;
        line = std::regex_replace(line, std::regex("KeltoNRXProfileDriver"), "driver");
        line = std::regex_replace(line, std::regex("( 00){36}\\]"), " zeros]");
        const std::regex omitted(" scalars| in \\[\\]| results 0| capacity 0$");
        text += std::regex_replace(line, omitted, "") + "\n";
    }
    return text;
}

std::string profiler_test::new_calls() {
    std::string text;
    for (const std::string& line : split(new_events(), '\n')) {
        if (line.starts_with("call ")) text += line.substr(5) + "\n";
    }
    return text;
}

outcome profiler_test::profile(const std::string& command_line) {
    const argument_vector arguments(split(command_line));
    int index = 1;
    outcome written =
        capture([&] { nrx::profile_command(arguments.span()[0], arguments.span(), index); });
    arguments_read = index - 1;
    return written;
}

}  // namespace tests
