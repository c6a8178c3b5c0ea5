#include "tests/support/device_test.h"

#include <algorithm>
#include <iterator>

namespace tests {

interface_driver& put_service(machine& host, std::string_view name, std::int32_t id) {
    auto driver = std::make_shared<interface_driver>();
    host.add({.name = std::string(name),
              .classes = {"KeltoNRXInterface"},
              .properties = {{"service_id", id}},
              .unit = driver});
    return *driver;
}

std::string failure_line(std::string_view label, std::string_view condition, std::string_view file,
                         std::string_view code) {
    std::string line = "Assertion failed: ";
    line.append(label).append(": Check failed: ").append(condition).append(" bail ").append(file);
    if (!code.empty()) line.append(" ").append(code);
    return line + "\n";
}

std::vector<std::string> device_test::logged(std::string_view word) const {
    std::vector<std::string> lines;
    std::copy_if(
        host.log().begin(), host.log().end(), std::back_inserter(lines),
        [&](const std::string& line) { return line.starts_with(std::string(word) + " "); });
    return lines;
}

}  // namespace tests
