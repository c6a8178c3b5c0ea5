// Builds the text of one event record by appending.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "nrxctl/decoders/field_key.h"
#include "nrxctl/decoders/line_bound.h"
#include "platform/bytes.h"

namespace nrx {

// Holds its room in itself, enough for the longest text of a record and a line feed, so that
// nothing is allocated. What would not fit is left out. Widths pad with blanks on the left; an item
// longer than its width is not cut.
class event_text {
public:
    // Removes everything.
    void clear() { size_ = 0; }

    // The text so far; valid until the next change.
    [[nodiscard]] std::string_view view() const { return {room_.data(), size_}; }

    void append(std::string_view text);
    void append(char character) { append(std::string_view(&character, 1)); }

    void key(const field_key& key);

    // A number in decimal.
    void number(std::uint64_t value, std::size_t width);

    // A number in lower-case hexadecimal and in single quotes; the width is that of the opening
    // quote alone.
    void quoted_hex(std::uint32_t value, std::size_t width);

    // A fraction as printf's %g writes it, with six significant digits.
    void fraction(double value, std::size_t width);

    // A text in single quotes; the width is that of the quoted text.
    void quoted(std::string_view text, std::size_t width);

    // Bytes in decimal, in brackets and with commas between them; the width is that of the list.
    void byte_list(platform::byte_view bytes, std::size_t width);

private:
    // Some items are copied by a fixed size, beyond their end; the rest is overwritten.
    static constexpr std::size_t slack = 32;

    [[nodiscard]] bool has_room(std::size_t size) const { return size <= capacity - size_; }
    [[nodiscard]] char* end() { return room_.data() + size_; }
    void pad(std::size_t size, std::size_t width);
    void align_right(std::size_t size, std::size_t width);

    static constexpr std::size_t capacity = longest_record_text + 1;
    std::size_t size_ = 0;
    std::array<char, capacity + slack> room_;  // only what was written is ever read
};

}  // namespace nrx
