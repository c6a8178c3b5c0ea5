// Short texts that are copied fast, and the names of identifiers as such texts.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "nrxctl/base/name_table.h"

namespace nrx {

// Up to 24 characters in storage of that size. The whole storage is copied, whatever the length, so
// that a copy is one move of a constant size.
class short_text {
public:
    static constexpr std::size_t capacity = 24;

    constexpr short_text() = default;

    // A literal that is too long does not compile.
    consteval short_text(const char* literal) {
        append(literal);
        if (view() != literal) throw "the text is too long";
    }

    // Text beyond the capacity is cut.
    constexpr short_text& append(std::string_view text) {
        const std::size_t size = std::min(text.size(), capacity - size_);
        std::copy_n(text.begin(), size, storage_.begin() + size_);
        size_ = static_cast<std::uint8_t>(size_ + size);
        return *this;
    }

    [[nodiscard]] constexpr std::size_t size() const { return size_; }

    // The text; valid as long as this object.
    [[nodiscard]] constexpr std::string_view view() const { return {storage_.data(), size_}; }

    [[nodiscard]] constexpr const std::array<char, capacity>& storage() const { return storage_; }

private:
    std::array<char, capacity> storage_{};
    std::uint8_t size_ = 0;
};

using id_name = basic_name_row<short_text>;
using id_name_table = basic_name_table<short_text>;

// Returns an identifier in decimal.
short_text id_number(std::uint32_t id);

// Returns the name of an identifier, or the identifier in decimal if it has no name.
short_text name_for_id(const id_name_table& names, std::uint32_t id);

}  // namespace nrx
