#include "tests/profiler/profiler_host.h"

#include <algorithm>
#include <csignal>

#include "nrxctl/profiler/profile_command.h"

namespace tests {

platform::return_code scripted_driver::call(std::uint32_t selector,
                                            const platform::call_inputs& /*inputs*/,
                                            platform::call_outputs& outputs) {
    if (const auto action = actions.find(selector); action != actions.end()) action->second();
    auto& script = answers[selector];
    const answer current = script.empty() ? answer{} : script.front();
    if (script.size() > 1) script.erase(script.begin());
    if (current.code != platform::success) return current.code;
    if (!outputs.scalars.empty()) outputs.scalars[0] = current.scalar;
    return platform::simulated::answer(current.bytes, outputs);
}

byte_list record_bytes(std::uint8_t type, std::uint8_t mark) {
    byte_list bytes(48, mark);
    bytes[0] = type;
    return bytes;
}

std::string dumped(std::uint8_t type, std::uint8_t mark) {
    constexpr std::string_view digits = "0123456789abcdef";
    std::string line = "prof-event ";
    for (const std::uint8_t byte : record_bytes(type, mark)) {
        line += digits[byte / 16];
        line += digits[byte % 16];
    }
    return line + "\n";
}

byte_list joined(const std::vector<byte_list>& lists) {
    byte_list all;
    for (const byte_list& one : lists)
        all.insert(all.end(), one.begin(), one.end());
    return all;
}

byte_list words_of(const std::vector<std::uint32_t>& words) {
    byte_list bytes;
    for (const std::uint32_t word : words) {
        for (unsigned shift = 0; shift < 32; shift += 8)
            bytes.push_back(static_cast<std::uint8_t>(word >> shift));
    }
    return bytes;
}

void profiler_test::put_both_halves() {
    put_driver();
    put_profile_service();
}

scripted_driver& profiler_test::put_driver() {
    auto scripted = std::make_shared<scripted_driver>();
    driver = scripted.get();
    host.add({.name = driver_name, .unit = scripted});
    return *driver;
}

interface_driver& profiler_test::put_profile_service() {
    service = &put_service(host, "profile", 0x50);
    for (const std::uint32_t report : {0xd0U, 0xd1U, 0xd2U, 0xd5U})
        service->set_report(report, {});
    for (const std::uint32_t code : {0x20U, 0x21U, 0x23U, 0x24U}) {
        service->set_command(code,
                             [](platform::byte_view, byte_list&) { return platform::success; });
    }
    return *service;
}

bool has_default_action() {
    struct sigaction current {};
    ::sigaction(SIGINT, nullptr, &current);
    return current.sa_handler == SIG_DFL;
}

std::vector<std::string> profiler_test::happened() {
    std::vector<std::string> lines(host.log().begin() + static_cast<std::ptrdiff_t>(seen_),
                                   host.log().end());
    seen_ = host.log().size();
    std::erase_if(lines, [](const std::string& line) {
        return line.starts_with("first match") || line.starts_with("release ");
    });
    return lines;
}

outcome profiler_test::profile(std::vector<std::string> words) {
    std::vector<char*> argv;
    argv.reserve(words.size());
    for (std::string& word : words)
        argv.push_back(word.data());
    int index = 1;
    outcome written = capture([&] { nrx::profile_command(words[0], argv, index); });
    taken = index - 1;
    return written;
}

std::string failed(std::string_view file, std::string_view condition, std::string_view code) {
    return failure_line("nrxtoollib", condition, "nrxctl/" + std::string(file), code);
}

}  // namespace tests
