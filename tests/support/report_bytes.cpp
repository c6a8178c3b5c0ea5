#include "tests/support/report_bytes.h"

#include <algorithm>

#include <gtest/gtest.h>

#include "tests/support/device_test.h"

namespace tests {

std::vector<std::uint8_t> report_with(std::size_t size, std::initializer_list<field_value> fields,
                                      std::uint8_t filler) {
    std::vector<std::uint8_t> report(size, filler);
    for (const field_value& field : fields) {
        for (std::size_t i = 0; i < field.width * field.values.size(); ++i) {
            const std::uint64_t value = field.values[i / field.width];
            report.at(field.offset + i) =
                static_cast<std::uint8_t>(value >> (8 * (i % field.width)));
        }
    }
    return report;
}

std::vector<std::uint8_t> u32_report(std::initializer_list<std::uint64_t> numbers) {
    return report_with(4 * numbers.size(), {{0, 4, numbers}});
}

outcome printed(nrx::report_printer print, std::string_view service_name, nrx::report_id id,
                const std::vector<std::uint8_t>& report) {
    return capture([&] { print(service_name, id, report); });
}

void print_every_prefix(nrx::report_printer print, std::string_view service_name, nrx::report_id id,
                        const std::vector<std::uint8_t>& report, std::size_t required,
                        std::string_view file) {
    const std::string reported =
        failure_line("nrxtoollib", "length >= " + std::to_string(required), file);
    const auto lines = [](const std::string& text) {
        return std::count(text.begin(), text.end(), '\n');
    };
    const std::string whole = printed(print, service_name, id, report).out;
    auto longer = report;
    longer.resize(longer.size() + 100, 0x5a);
    EXPECT_EQ(printed(print, service_name, id, longer).out, whole);
    EXPECT_EQ(printed(print, service_name, id, longer).err, "");
    for (std::size_t size = 1; size <= report.size(); ++size) {
        const std::vector<std::uint8_t> prefix(report.begin(),
                                               report.begin() + static_cast<std::ptrdiff_t>(size));
        const outcome result = printed(print, service_name, id, prefix);
        EXPECT_EQ(result.err, size < required ? reported : "") << size;
        EXPECT_EQ(lines(result.out), lines(whole)) << size;
    }
}

}  // namespace tests
