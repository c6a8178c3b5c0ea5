// The fast path of reading sample files.
//
// A file has millions of lines, and nearly every line has the tag and the keys of a line before it;
// only the values differ. So the reader learns the pattern of a line and matches the next lines
// against it, and the general splitter sees only what does not match. Why this is fast:
//
// - Each byte of a line is looked at once. A tag or key of up to 15 bytes is compared together with
//   its terminator in one 16-byte comparison (simd16.h), and the end of a value is searched 16
//   bytes at a time.
// - A value is probably as long as the last one of its field. If it is, the start of the next field
//   depends on no search, and the processor works ahead.
// - A number is decoded eight digits at a time, within one register (swar.h, fast_number.h).
// - An event is the only thing allocated for a line. Events lie side by side in huge pages
//   (event_memory.h); the values are views of the text.
//
// The fast path changes no result: a line that matches has the values that split_sample_line gives,
// and numbers that it does not take go to parse_number.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

#include "nrxctl/replay/fast/simd16.h"
#include "nrxctl/replay/sample_line.h"

namespace nrx {

// Predicts that a value is as long as the one before it.
class length_hint {
public:
    void assign(std::size_t length);
    [[nodiscard]] std::size_t length() const { return length_; }

    // Returns true if the first delimiter in the sixteen bytes at value is at the predicted length.
    // Returns false before a length of up to 15 was assigned.
    [[nodiscard]] bool matches(const char* value) const;

private:
    std::size_t length_ = 0;
    std::uint32_t mask_ = 0;       // the positions up to the delimiter
    std::uint32_t delimiter_ = 1;  // the position of the delimiter
};

// The tag and the keys of a line, in their order.
class line_pattern {
public:
    // Learns the pattern of a line that split_sample_line accepts. Nothing matches if the line has
    // no fields, or a tag or key of more than 15 bytes.
    void learn(std::string_view line);

    // If the text begins with a line that has that tag, those keys, and values, stores its values
    // and returns its length including the line feed. Returns 0 for any other line, an incomplete
    // one, and one so close to the end of the text that 32 bytes cannot be loaded; nothing after
    // the text is read. The values are then unspecified.
    std::size_t match(std::string_view text);

    // The values of the line that matched.
    [[nodiscard]] const sample_values& values() const { return values_; }

private:
    // A tag or key and its terminator, compared at once.
    class token {
    public:
        // Returns false if the name is too long.
        bool assign(std::string_view name, char terminator);
        [[nodiscard]] bool matches(const char* text) const {
            return (simd16(text).equal(simd16(text_.data())) & mask_) == mask_;
        }
        [[nodiscard]] std::size_t size() const { return size_; }

    private:
        std::array<char, simd16::size> text_{};
        std::uint32_t mask_ = 0;
        std::size_t size_ = 0;
    };

    struct field {
        token key;
        length_hint hint;
        std::optional<sample_key> known_key;
        char terminator = ',';
    };

    static std::size_t match_value(field& expected, std::string_view text);

    token tag_;
    std::vector<field> fields_;
    sample_values values_;  // only the keys of the fields are set, again by each line
};

}  // namespace nrx
