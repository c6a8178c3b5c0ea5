#include "nrxctl/base/payload.h"

#include <array>
#include <cstddef>
#include <limits>
#include <string_view>

#include "nrxctl/base/end_process.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/refuse_word.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/base/word_table.h"

namespace nrx {

namespace {

struct width_word {
    std::string_view word;
    std::size_t bytes;
};

constexpr std::array width_words{width_word{"u8", 1}, width_word{"u16", 2}, width_word{"u32", 4}};

// A payload value: signed 32 bits, hexadecimal unless it has the decimal prefix.
std::int32_t parse_value(std::string_view word) {
    std::string_view digits = word;
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
    refuse_word("payload value is invalid", word);
}

// Refuses a value that is wider than the payload's values. A negative one widens to a huge number.
void check_width(std::int64_t value, std::uint64_t largest) {
    const auto widened = static_cast<std::uint64_t>(value);
    if (widened <= largest) return;
    text_line line;
    line.text("Value ").number(value).text(" (0").hex(widened).text(") is bigger than allowed (");
    line.number(largest).text(", 0x").hex(largest).text(")");
    print_line(line.view());
    end_process();
}

}  // namespace

void parse_payload(std::span<char* const> words, int& position,
                   std::vector<std::uint8_t>& payload) {
    payload.clear();
    const auto count = static_cast<int>(words.size());
    if (position >= count) return;
    const auto word_at = [&](int index) {
        return std::string_view(words[static_cast<std::size_t>(index)]);
    };
    const width_word* named = find_word_row(width_words, word_at(position));
    if (named != nullptr) ++position;
    const std::size_t width = named == nullptr ? 1 : named->bytes;
    const std::uint64_t largest = (std::uint64_t{1} << (8 * width)) - 1;
    for (; position < count && !word_at(position).starts_with('-'); ++position) {
        const std::int64_t value = parse_value(word_at(position));
        check_width(value, largest);
        append_le(payload, static_cast<std::uint64_t>(value), width);
    }
}

}  // namespace nrx
