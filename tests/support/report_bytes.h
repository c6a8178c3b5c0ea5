// Report bytes built from their fields.
#pragma once

#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <string_view>
#include <vector>

#include "nrxctl/printers/report_printers.h"
#include "tests/support/capture.h"

namespace tests {

// One number, or several.
class number_list : public std::vector<std::uint64_t> {
public:
    number_list(std::uint64_t number) : vector(1, number) {}
    number_list(std::initializer_list<std::uint64_t> all) : vector(all) {}
};

// Consecutive little-endian numbers of a report.
struct field_value {
    std::size_t offset;
    std::size_t width;
    number_list values;
};

// A report of the given size with the given values, and filler everywhere else: bytes that are not
// listed must not show.
std::vector<std::uint8_t> report_with(std::size_t size, std::initializer_list<field_value> fields,
                                      std::uint8_t filler = 0xa5);

// A report of little-endian 32-bit numbers.
std::vector<std::uint8_t> u32_report(std::initializer_list<std::uint64_t> numbers);

// What a report printer prints.
outcome printed(nrx::report_printer print, std::string_view service_name, nrx::report_id id,
                const std::vector<std::uint8_t>& report);

// Prints every prefix of a report but the empty one, each from an allocation of its own size, so
// that a sanitizer finds a read beyond the reply. Expects as many lines as for the whole report,
// and a failure report if the prefix is shorter than required. A longer report prints like the
// whole one.
void print_every_prefix(nrx::report_printer print, std::string_view service_name, nrx::report_id id,
                        const std::vector<std::uint8_t>& report, std::size_t required,
                        std::string_view file);

}  // namespace tests
