// Report bytes, put together by hand.
#pragma once

#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <string_view>
#include <vector>

#include "nrxctl/printers/report_printer.h"
#include "tests/support/capture.h"

namespace tests {

// One number, or several.
class number_list : public std::vector<std::uint64_t> {
public:
    number_list(std::uint64_t one) : vector(1, one) {}
    number_list(std::initializer_list<std::uint64_t> all) : vector(all) {}
};

// Little-endian numbers of a report that follow each other.
struct number_at {
    std::size_t offset;
    std::size_t width;
    number_list values;
};

// A report of a size with numbers in it, and filler everywhere else: what is not listed must not
// show.
std::vector<std::uint8_t> report_with(std::size_t size, std::initializer_list<number_at> numbers,
                                      std::uint8_t filler = 0xa5);

// Little-endian 32-bit words.
std::vector<std::uint8_t> words_of(std::initializer_list<std::uint64_t> words);

// What a report printer prints.
outcome printed(nrx::report_printer print, std::string_view service_name, std::int32_t report_id,
                const std::vector<std::uint8_t>& report);

// Prints every prefix of a report, but the empty one, from its own allocation, so that a byte read
// beyond the reply is a sanitizer's find: as many lines as the whole report, and a failure report
// if it is shorter than needed. A longer report prints like the whole one.
void print_every_prefix(nrx::report_printer print, std::string_view service_name,
                        std::int32_t report_id, const std::vector<std::uint8_t>& report,
                        std::size_t needed, std::string_view file);

}  // namespace tests
