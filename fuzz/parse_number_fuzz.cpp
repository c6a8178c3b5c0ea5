// A number that parse_number accepts is the same number however it is written.
#include <array>
#include <charconv>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "fuzz/support/harness.h"
#include "nrxctl/base/numbers.h"

namespace {

std::optional<std::int64_t> parse(std::string_view word) {
    std::optional<std::int64_t> value;
    fuzz::completes([&] { value = nrx::parse_number(word, "not a number"); });
    return value;
}

std::string written(std::int64_t value, int base) {
    std::array<char, 80> digits;
    const bool negative = value < 0;
    const auto end = std::to_chars(digits.data(), digits.data() + digits.size(),
                                   negative ? -value : value, base);
    std::string word = negative ? "-" : "";
    if (base == 16) word += "0x";
    return word.append(digits.data(), end.ptr);
}

bool has_digits_alone(std::string_view word) {
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
    fuzz::require(has_digits_alone(word));
    fuzz::require(parse(written(*value, 10)) == value);
    fuzz::require(parse(written(*value, 16)) == value);
    fuzz::require(!parse(std::string(word) + "g"));
    return 0;
}
