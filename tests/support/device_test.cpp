#include "tests/support/device_test.h"

#include <algorithm>
#include <iterator>
#include <memory>

namespace tests {

interface_driver& add_service(machine& host, std::string_view name, std::int32_t id) {
    auto driver = std::make_shared<interface_driver>();
    host.add({.name = std::string(name),
              .classes = {"KeltoNRXInterface"},
              .properties = {{"service_id", id}},
              .driver = driver});
    return *driver;
}

std::string failure_line(std::string_view label, std::string_view condition, std::string_view file,
                         std::string_view code) {
    std::string line = "Assertion failed: ";
    line.append(label).append(": Check failed: ").append(condition).append(" bail ").append(file);
    if (!code.empty()) line.append(" ").append(code);
    return line + "\n";
}

std::string library_report(std::string_view file, std::string_view condition,
                           std::string_view code) {
    return failure_line("nrxtoollib", condition, file, code);
}

std::string report_of(platform::return_code expected,
                      const std::function<platform::return_code()>& operation) {
    const outcome result = capture([&] { EXPECT_EQ(operation(), expected); });
    EXPECT_EQ(result.out, "");
    return result.err;
}

platform::service service_named(std::string_view name) {
    return platform::first_match({{"IONameMatch", name}});
}

std::vector<std::string> device_test::logged_calls(std::string_view kind) const {
    std::vector<std::string> lines;
    std::copy_if(
        host.log().begin(), host.log().end(), std::back_inserter(lines),
        [&](const std::string& line) { return line.starts_with(std::string(kind) + " "); });
    return lines;
}

}  // namespace tests
