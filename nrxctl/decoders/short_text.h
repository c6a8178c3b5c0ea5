// A short text that is copied fast.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace nrx {

// Up to 24 characters in room of that size, whatever their number: copying them is one move of a
// size that is known when the tool is compiled.
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
        std::copy_n(text.begin(), size, room_.begin() + size_);
        size_ = static_cast<std::uint8_t>(size_ + size);
        return *this;
    }

    [[nodiscard]] constexpr std::size_t size() const { return size_; }

    // Valid as long as the object.
    [[nodiscard]] constexpr std::string_view view() const { return {room_.data(), size_}; }

    // The whole room.
    [[nodiscard]] constexpr const std::array<char, capacity>& room() const { return room_; }

private:
    std::array<char, capacity> room_{};
    std::uint8_t size_ = 0;
};

}  // namespace nrx
