// Reports as readable tables, which the compiler packs into bytes.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <string_view>

namespace platform::simulated {

template <std::size_t Length>
using report_bytes = std::array<std::uint8_t, Length>;

// One number of a report: little-endian, width bytes at offset.
struct report_field {
    std::size_t offset;
    std::size_t width;
    std::int64_t value;
    std::string_view meaning;  // documents the table
};

// Never defined. A table that calls one of these functions does not compile.
void field_exceeds_report();
void field_overlaps_another();
void value_does_not_fit_field();

// Converts a number to fixed point with 16 fraction bits.
consteval std::int64_t q16_16(double value) {
    return static_cast<std::int64_t>(value * 65536 + (value < 0 ? -0.5 : 0.5));
}

// Stores a signed or unsigned number in a report.
template <std::size_t Length>
constexpr void store_number(report_bytes<Length>& bytes, std::size_t offset, std::size_t width,
                            std::int64_t value) {
    if (offset + width > Length) field_exceeds_report();
    const std::int64_t high_bits = width < 8 ? value >> (8 * width) : 0;
    const bool negative = high_bits == -1 && (value >> (8 * width - 1)) == -1;
    if (high_bits != 0 && !negative) value_does_not_fit_field();
    for (std::size_t i = 0; i < width; ++i) {
        bytes[offset + i] = static_cast<std::uint8_t>(value >> (8 * i));
    }
}

// Stores NUL-terminated text in a field of width bytes, which must be 0 before.
template <std::size_t Length>
constexpr void store_text(report_bytes<Length>& bytes, std::size_t offset, std::size_t width,
                          std::string_view text) {
    if (offset + width > Length) field_exceeds_report();
    if (text.size() >= width) value_does_not_fit_field();
    for (std::size_t i = 0; i < text.size(); ++i) {
        store_number(bytes, offset + i, 1, text[i]);
    }
}

// Makes a report of the given length. Bytes outside of the fields are 0.
template <std::size_t Length>
consteval report_bytes<Length> make_report(std::initializer_list<report_field> fields) {
    report_bytes<Length> bytes{};
    std::array<bool, Length> used{};
    for (const report_field& field : fields) {
        store_number(bytes, field.offset, field.width, field.value);
        for (std::size_t i = field.offset; i < field.offset + field.width; ++i) {
            if (used[i]) field_overlaps_another();
            used[i] = true;
        }
    }
    return bytes;
}

}  // namespace platform::simulated
