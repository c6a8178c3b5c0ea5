// Reports as tables that a person can read and edit, packed into bytes by the compiler.
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
    std::string_view meaning;  // for the reader of the table
};

// Never defined: a table that needs one of these does not compile.
void field_reaches_beyond_its_report();
void field_overlaps_another();
void field_is_too_narrow_for_its_value();

// A number with 16 fraction bits.
consteval std::int64_t fixed_point(double value) {
    return static_cast<std::int64_t>(value * 65536 + (value < 0 ? -0.5 : 0.5));
}

// Writes a number, signed or unsigned, into a report.
template <std::size_t Length>
constexpr void put_number(report_bytes<Length>& bytes, std::size_t offset, std::size_t width,
                          std::int64_t value) {
    if (offset + width > Length) field_reaches_beyond_its_report();
    const std::int64_t rest = width < 8 ? value >> (8 * width) : 0;
    const bool negative = rest == -1 && (value >> (8 * width - 1)) == -1;
    if (rest != 0 && !negative) field_is_too_narrow_for_its_value();
    for (std::size_t i = 0; i < width; ++i) {
        bytes[offset + i] = static_cast<std::uint8_t>(value >> (8 * i));
    }
}

// Writes a text, and the NUL that ends it, into a field of width bytes that are still 0.
template <std::size_t Length>
constexpr void put_text(report_bytes<Length>& bytes, std::size_t offset, std::size_t width,
                        std::string_view text) {
    if (offset + width > Length) field_reaches_beyond_its_report();
    if (text.size() >= width) field_is_too_narrow_for_its_value();
    for (std::size_t i = 0; i < text.size(); ++i) {
        put_number(bytes, offset + i, 1, text[i]);
    }
}

// A report of the given length; what no field covers is 0.
template <std::size_t Length>
consteval report_bytes<Length> make_report(std::initializer_list<report_field> fields) {
    report_bytes<Length> bytes{};
    std::array<bool, Length> taken{};
    for (const report_field& field : fields) {
        put_number(bytes, field.offset, field.width, field.value);
        for (std::size_t i = field.offset; i < field.offset + field.width; ++i) {
            if (taken[i]) field_overlaps_another();
            taken[i] = true;
        }
    }
    return bytes;
}

}  // namespace platform::simulated
