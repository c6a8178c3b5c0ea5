#include "nrxctl/base/payload.h"

#include <array>
#include <cstddef>
#include <limits>
#include <string>
#include <string_view>

#include "nrxctl/base/arguments.h"
#include "nrxctl/base/end_process.h"
#include "nrxctl/base/explanation.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

struct width_row {
    std::string_view keyword;
    std::size_t bytes;
};

constexpr std::array width_rows{width_row{"u8", 1}, width_row{"u16", 2}, width_row{"u32", 4}};

// A payload value: signed 32 bits, hexadecimal unless it has the decimal prefix.
std::int32_t parse_value(std::string_view argument) {
    std::string_view digits = argument;
    const bool decimal = digits.starts_with(decimal_prefix);
    if (decimal) digits.remove_prefix(decimal_prefix.size());
    const bool negative = digits.starts_with('-');
    if (negative || digits.starts_with('+')) digits.remove_prefix(1);
    if (!decimal && digits.starts_with(hex_prefix)) digits.remove_prefix(hex_prefix.size());
    const auto magnitude = read_digits(digits, decimal ? 10 : 16);
    if (magnitude) {
        const std::int64_t value = negative ? -*magnitude : *magnitude;
        using limits = std::numeric_limits<std::int32_t>;
        if (value >= limits::min() && value <= limits::max())
            return static_cast<std::int32_t>(value);
    }
    explain([&] {
        return explanation{quoted(argument) + " is not a value",
                           "expected hexadecimal digits up to 7fffffff, or 0d and decimal ones"};
    });
    reject_argument("payload value is invalid", argument);
}

// Rejects a value that is too large for the width. A negative one widens to a huge number.
void check_width(std::string_view argument, std::int64_t value, std::uint64_t max_value) {
    const auto widened = static_cast<std::uint64_t>(value);
    if (widened <= max_value) return;
    explain([&] {
        return explanation{quoted(argument) + " does not fit the width of the values",
                           "u8, u16 or u32 before the first one sets it"};
    });
    text_line line;
    line.text("Value ").number(value).text(" (0").hex(widened).text(") is bigger than allowed (");
    line.number(max_value).text(", 0x").hex(max_value).text(")");
    print_line(line.view());
    end_process();
}

}  // namespace

void parse_payload(std::span<char* const> arguments, int& position,
                   std::vector<std::uint8_t>& payload) {
    payload.clear();
    const auto count = static_cast<int>(arguments.size());
    if (position >= count) return;
    const auto argument_at = [&](int index) {
        return std::string_view(arguments[static_cast<std::size_t>(index)]);
    };
    const width_row* row = find_keyword(width_rows, argument_at(position));
    if (row != nullptr) ++position;
    const std::size_t width = row == nullptr ? 1 : row->bytes;
    const std::uint64_t max_value = (std::uint64_t{1} << (8 * width)) - 1;
    for (; position < count && !argument_at(position).starts_with('-'); ++position) {
        const std::int64_t value = parse_value(argument_at(position));
        check_width(argument_at(position), value, max_value);
        append_le(payload, static_cast<std::uint64_t>(value), width);
    }
}

}  // namespace nrx
