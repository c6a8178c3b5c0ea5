// The record of a sample, as it is uploaded.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

#include "nrxctl/base/little_endian.h"
#include "nrxctl/replay/sample_numbers.h"
#include "nrxctl/replay/sample_values.h"

namespace nrx {

// A record with as many sample values behind its head of four words: size, delta, sample id and
// temperature.
template <std::size_t Values>
class sample_record {
public:
    static constexpr std::uint32_t size = 4 * (4 + Values);

    // Fills the head but for the delta. Numbers end the process as parse_sample does.
    void parse_head(const sample_values& values) {
        put(0, size);
        put(2, parse_sample(values[sample_key::sampleid]));
        put(3, fixed_point_degrees(parse_sample(values[sample_key::temperature])));
    }

    // Fills a sample value, numbered from 0, likewise.
    void parse_value(std::size_t index, std::string_view text) {
        put(4 + index, parse_sample(text));
    }

    void set_delta(std::uint32_t delta) { put(1, delta); }

    [[nodiscard]] const std::uint8_t* data() const { return bytes_.data(); }

private:
    void put(std::size_t word, std::uint32_t value) { store_le(bytes_.data() + 4 * word, value); }

    std::array<std::uint8_t, size> bytes_{};
};

}  // namespace nrx
