#include "nrxctl/decoders/event_text.h"

#include <algorithm>
#include <charconv>
#include <cstring>

namespace nrx {

namespace {

constexpr std::size_t longest_number = 24;

struct byte_text {
    std::array<char, 4> text;  // the number in decimal and a comma
    std::uint32_t size;
};

constexpr auto byte_texts = [] {
    std::array<byte_text, 256> table{};
    for (std::uint32_t value = 0; value < table.size(); ++value) {
        byte_text& entry = table[value];
        for (std::uint32_t power = 100; power > 0; power /= 10) {
            if (value < power && power > 1) continue;
            entry.text[entry.size++] = static_cast<char>('0' + value / power % 10);
        }
        entry.text[entry.size++] = ',';
    }
    return table;
}();

std::size_t missing(std::size_t size, std::size_t width) {
    return size < width ? width - size : 0;
}

}  // namespace

void event_text::append(std::string_view text) {
    if (!has_room(text.size())) return;
    std::copy(text.begin(), text.end(), end());
    size_ += text.size();
}

void event_text::pad(std::size_t size, std::size_t width) {
    const std::size_t blanks = missing(size, width);
    if (!has_room(blanks)) return;
    std::fill_n(end(), blanks, ' ');
    size_ += blanks;
}

void event_text::key(const field_key& key) {
    static_assert(field_key::room <= slack);
    if (!has_room(key.size)) return;
    std::memcpy(end(), key.text.data(), key.text.size());
    size_ += key.size;
}

void event_text::number(std::uint64_t value, std::size_t width) {
    std::array<char, longest_number> digits;
    const auto last = std::to_chars(digits.begin(), digits.end(), value);
    const auto size = static_cast<std::size_t>(last.ptr - digits.begin());
    pad(size, width);
    append({digits.data(), size});
}

void event_text::quoted_hex(std::uint32_t value, std::size_t width) {
    std::array<char, longest_number> digits;
    const auto last = std::to_chars(digits.begin(), digits.end(), value, 16);
    pad(1, width);
    append('\'');
    append({digits.data(), static_cast<std::size_t>(last.ptr - digits.begin())});
    append('\'');
}

void event_text::fraction(double value, std::size_t width) {
    constexpr int significant_digits = 6;
    std::array<char, longest_number> digits;
    const auto last = std::to_chars(digits.begin(), digits.end(), value, std::chars_format::general,
                                    significant_digits);
    const auto size = static_cast<std::size_t>(last.ptr - digits.begin());
    pad(size, width);
    append({digits.data(), size});
}

void event_text::quoted(std::string_view text, std::size_t width) {
    pad(text.size() + 2, width);
    append('\'');
    append(text);
    append('\'');
}

void event_text::byte_list(platform::byte_view bytes, std::size_t width) {
    if (!has_room(longest_list(bytes.size()))) return;
    char* const begin = end();
    char* next = begin;
    *next++ = '[';
    for (const std::uint8_t byte : bytes) {
        const byte_text& entry = byte_texts[byte];
        std::memcpy(next, entry.text.data(), entry.text.size());
        next += entry.size;
    }
    if (!bytes.empty()) --next;
    *next++ = ']';
    size_ += static_cast<std::size_t>(next - begin);
    align_right(static_cast<std::size_t>(next - begin), width);
}

// Shifts the last item to the right end of its field.
void event_text::align_right(std::size_t size, std::size_t width) {
    const std::size_t blanks = missing(size, width);
    if (blanks == 0 || !has_room(blanks)) return;
    char* const item = end() - size;
    std::copy_backward(item, end(), end() + blanks);
    std::fill_n(item, blanks, ' ');
    size_ += blanks;
}

}  // namespace nrx
