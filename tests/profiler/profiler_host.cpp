#include "tests/profiler/profiler_host.h"

#include <algorithm>
#include <csignal>

#include "nrxctl/base/tick_period.h"
#include "nrxctl/profiler/profile_command.h"
#include "platform/clock.h"
#include "tests/support/word_vector.h"

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

std::string config_bytes(const std::string& profiler, const std::string& component,
                         const std::string& state, const std::string& mask) {
    std::string bytes;
    for (const std::string& byte : {profiler, component, state})
        bytes += byte + " 00 00 00 ";
    bytes += mask;
    for (int i = 0; i < 36; ++i)
        bytes += " 00";
    return bytes;
}

void profiler_test::SetUp() {
    device_test::SetUp();
    nrx::tick_period = platform::tick_period();
}

void profiler_test::TearDown() {
    EXPECT_TRUE(has_default_action());
    device_test::TearDown();
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
    for (const std::uint32_t command : {0x20U, 0x21U, 0x23U, 0x24U})
        answer(command, platform::success);
    return *service;
}

void profiler_test::answer(std::uint32_t command, platform::return_code code,
                           const byte_list& reply) {
    service->set_command(command, [=](platform::byte_view, byte_list& answered) {
        answered = reply;
        return code;
    });
}

std::ptrdiff_t profiler_test::times(std::string_view call) const {
    return std::count(host.log().begin(), host.log().end(), call);
}

bool has_default_action() {
    struct sigaction current {};
    ::sigaction(SIGINT, nullptr, &current);
    return current.sa_handler == SIG_DFL;
}

lines profiler_test::happened() {
    lines news(host.log().begin() + static_cast<std::ptrdiff_t>(seen_), host.log().end());
    seen_ = host.log().size();
    std::erase_if(news, [](const std::string& line) {
        return line.starts_with("first match") || line.starts_with("release ");
    });
    return news;
}

outcome profiler_test::profile(const std::string& words) {
    const word_vector all(split(words));
    int index = 1;
    outcome written = capture([&] { nrx::profile_command(all.all()[0], all.all(), index); });
    taken = index - 1;
    return written;
}

}  // namespace tests
