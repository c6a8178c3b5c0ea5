// A number that parse_number accepts must keep its value in every notation, and the fast reader of
// sample files must agree on every text.
#include <array>
#include <charconv>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "fuzz/support/harness.h"
#include "nrxctl/base/end_process.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/replay/fast/fast_number.h"

namespace {

std::optional<std::int64_t> parse(std::string_view text) {
    std::optional<std::int64_t> value;
    std::optional<std::int64_t> fast_value;
    nrx::run_to_completion([&] { value = nrx::parse_number(text, "not a number"); });
    nrx::run_to_completion([&] { fast_value = nrx::parse_fast_number(text, "not a number"); });
    fuzz::require(value == fast_value);
    return value;
}

std::string format(std::int64_t value, int base) {
    std::array<char, 80> digits;
    const bool negative = value < 0;
    const auto end = std::to_chars(digits.data(), digits.data() + digits.size(),
                                   negative ? -value : value, base);
    std::string text = negative ? "-" : "";
    if (base == 16) text += "0x";
    return text.append(digits.data(), end.ptr);
}

bool is_sign_and_digits(std::string_view text) {
    const auto sign = text.find_first_not_of("+-");
    if (sign > 1) return false;
    text.remove_prefix(sign);
    const bool hexadecimal = text.starts_with("0x");
    if (hexadecimal) text.remove_prefix(2);
    const auto* digits = hexadecimal ? "0123456789abcdefABCDEF" : "0123456789";
    return !text.empty() && text.find_first_not_of(digits) == std::string_view::npos;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const auto text = fuzz::as_text(data, size);
    const auto value = parse(text);
    if (!value) return 0;
    fuzz::require(is_sign_and_digits(text));
    fuzz::require(parse(format(*value, 10)) == value);
    fuzz::require(parse(format(*value, 16)) == value);
    fuzz::require(!parse(std::string(text) + "g"));
    return 0;
}
