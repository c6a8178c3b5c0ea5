// The values of one sample line by their keys.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>

namespace nrx {

// The keys that events read.
enum class sample_key : std::uint8_t { sampleid, temperature, x, y, z, p, timestamp, shake };

inline constexpr std::size_t sample_key_count = static_cast<std::size_t>(sample_key::shake) + 1;

// The key of that name; none if no event reads it.
std::optional<sample_key> find_sample_key(std::string_view name);

// A map of those keys to the texts of their values, which stay where they stand. It has a place for
// each key, so that it costs a line no allocation and no search.
class sample_values {
public:
    // Sets a key's value; a later one takes the place of an earlier one. A key that no event reads
    // is ignored.
    void set(std::string_view key, std::string_view value);

    void set(sample_key key, std::string_view value) {
        values_[static_cast<std::size_t>(key)] = value;
    }

    // The value of a key; empty if it has none.
    std::string_view operator[](sample_key key) const {
        return values_[static_cast<std::size_t>(key)];
    }

    void clear() { values_.fill({}); }

private:
    std::array<std::string_view, sample_key_count> values_{};
};

}  // namespace nrx
