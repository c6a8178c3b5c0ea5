// The fields of a sample line: TAG,KEY=VALUE,...
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>

namespace nrx {

// The keys that events read.
enum class sample_key : std::uint8_t { sampleid, temperature, x, y, z, p, timestamp, shake, count };

inline constexpr auto sample_key_count = static_cast<std::size_t>(sample_key::count);

// Returns the key with that name, or nullopt if no event reads it.
std::optional<sample_key> find_sample_key(std::string_view name);

// Returns the name of a key.
std::string_view sample_key_name(sample_key key);

// Maps those keys to the texts of their values, which remain in the line. Every key has a slot, so
// a line costs no allocation and no search.
class sample_values {
public:
    // Sets a key's value and replaces an earlier one. A key that no event reads is ignored.
    void set(std::string_view key, std::string_view value);

    void set(sample_key key, std::string_view value) {
        values_[static_cast<std::size_t>(key)] = value;
    }

    // The value of a key, empty if it has none.
    std::string_view operator[](sample_key key) const {
        return values_[static_cast<std::size_t>(key)];
    }

    void clear() { values_.fill({}); }

private:
    std::array<std::string_view, sample_key_count> values_{};
};

// A line taken apart. Its texts remain in the line.
struct sample_line {
    std::string_view tag;
    sample_values values;
};

// Splits a line at its commas into the tag and the values. Returns false if a field after the tag
// is not a key, one equals sign and a value. The key may be empty, the value may not. An empty
// field is an error too, except that a comma at the very end is ignored.
bool split_sample_line(std::string_view line, sample_line& split);

// Returns true if a line with that tag is skipped: a comment, or a tag that is empty or contains a
// space.
bool is_skipped(std::string_view tag);

}  // namespace nrx
