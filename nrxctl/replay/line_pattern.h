// What the next sample lines will probably look like.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

#include "nrxctl/base/sixteen_bytes.h"
#include "nrxctl/replay/sample_values.h"

namespace nrx {

// The tag and the keys of a line, in their order. The lines of a file are alike as a rule: one that
// has the tag and keys of a line before it is split by looking for the ends of its values alone.
class line_pattern {
public:
    // Takes the pattern of a line that split_sample_line accepts. Matches nothing if the line has
    // no fields, or a tag or key of more than 15 bytes.
    void learn(std::string_view line);

    // If the line at the front of a text has that tag and those keys, and values, takes its values
    // and returns its length with its line feed. 0 if it is another one, no whole one, or so near
    // to the end of the text that 32 bytes cannot be read at once: nothing beyond is read. The
    // values are worth nothing then.
    std::size_t match(std::string_view text);

    // The values of the line that matched, as split_sample_line sets them.
    [[nodiscard]] const sample_values& values() const { return values_; }

private:
    // A tag or key and the character behind it, to be compared at once.
    class short_text {
    public:
        // False if there is no room for it.
        bool assign(std::string_view name, char behind);
        [[nodiscard]] bool begins(const char* place) const {
            return (sixteen_bytes(place).equal(sixteen_bytes(text_.data())) & mask_) == mask_;
        }
        [[nodiscard]] std::size_t size() const { return size_; }

    private:
        std::array<char, sixteen_bytes::size> text_{};
        std::uint32_t mask_ = 0;
        std::size_t size_ = 0;
    };

    // How long a value probably is: as long as it was last.
    class length_guess {
    public:
        void assign(std::size_t length);
        [[nodiscard]] std::size_t length() const { return length_; }
        // Whether the value at a place is so long. False before a length was assigned, and for one
        // that does not end within sixteen bytes.
        [[nodiscard]] bool holds(const char* value) const;

    private:
        std::size_t length_ = 0;
        std::uint32_t mask_ = 0;  // of the bytes of the value, and the one behind it
        std::uint32_t end_ = 1;   // the bit of the one behind it
    };

    struct field {
        short_text key;
        length_guess guess;
        std::optional<sample_key> known;
        char behind = ',';
    };

    static std::size_t match_value(field& expected, std::string_view text);

    short_text tag_;
    std::vector<field> fields_;
    sample_values values_;  // only keys of the fields are set, by each line anew
};

}  // namespace nrx
