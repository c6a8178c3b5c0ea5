// Names of the numbers that the device sends.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

namespace nrx {

// A number and its name. Text is std::string_view, or a type that is faster to copy.
template <class Text>
struct basic_name_row {
    std::uint32_t number;
    Text name;
};
using name_row = basic_name_row<std::string_view>;

// Names for numbers, with a fallback for a number that has none. Refers to its rows, which are
// usually constants.
template <class Text>
class basic_name_table {
public:
    constexpr basic_name_table() = default;
    constexpr basic_name_table(std::span<const basic_name_row<Text>> rows, Text fallback = {})
        : rows_(rows), fallback_(fallback) {}
    template <std::size_t Count>
    constexpr basic_name_table(const std::array<basic_name_row<Text>, Count>& rows,
                               Text fallback = {})
        : rows_(rows), fallback_(fallback) {}

    // Returns the name of a number, or null if it has none. The row at index number is tried first,
    // then the rows in order.
    [[nodiscard]] constexpr const Text* find(std::uint32_t number) const {
        if (number < rows_.size() && rows_[number].number == number) return &rows_[number].name;
        const auto match = std::find_if(rows_.begin(), rows_.end(),
                                        [&](const auto& row) { return row.number == number; });
        return match == rows_.end() ? nullptr : &match->name;
    }

    // Returns the name of a number, or the fallback.
    [[nodiscard]] constexpr const Text& name(std::uint32_t number) const {
        const Text* match = find(number);
        return match == nullptr ? fallback_ : *match;
    }

    [[nodiscard]] constexpr std::span<const basic_name_row<Text>> rows() const { return rows_; }

private:
    std::span<const basic_name_row<Text>> rows_;
    Text fallback_{};
};
using name_table = basic_name_table<std::string_view>;

}  // namespace nrx
