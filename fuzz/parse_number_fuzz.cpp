// A number that parse_number accepts must keep its value in every notation, and the fast reader of
// sample files must agree on every text.
#include <array>
#include <charconv>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "fuzz/support/harness.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/replay/fast/fast_number.h"

namespace {

std::optional<std::int64_t> parse(std::string_view word) {
    std::optional<std::int64_t> value;
    std::optional<std::int64_t> fast_value;
    fuzz::completes([&] { value = nrx::parse_number(word, "not a number"); });
    fuzz::completes([&] { fast_value = nrx::parse_fast_number(word, "not a number"); });
    fuzz::require(value == fast_value);
    return value;
}

std::string format(std::int64_t value, int base) {
    std::array<char, 80> digits;
    const bool negative = value < 0;
    const auto end = std::to_chars(digits.data(), digits.data() + digits.size(),
                                   negative ? -value : value, base);
    std::string word = negative ? "-" : "";
    if (base == 16) word += "0x";
    return word.append(digits.data(), end.ptr);
}

bool is_sign_and_digits(std::string_view word) {
    const auto sign = word.find_first_not_of("+-");
    if (sign > 1) return false;
    word.remove_prefix(sign);
    const bool hexadecimal = word.starts_with("0x");
    if (hexadecimal) word.remove_prefix(2);
    const auto* digits = hexadecimal ? "0123456789abcdefABCDEF" : "0123456789";
    return !word.empty() && word.find_first_not_of(digits) == std::string_view::npos;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const auto word = fuzz::as_text(data, size);
    const auto value = parse(word);
    if (!value) return 0;
    fuzz::require(is_sign_and_digits(word));
    fuzz::require(parse(format(*value, 10)) == value);
    fuzz::require(parse(format(*value, 16)) == value);
    fuzz::require(!parse(std::string(word) + "g"));
    return 0;
}
