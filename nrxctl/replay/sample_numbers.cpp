#include "nrxctl/replay/sample_numbers.h"

#include "nrxctl/base/numbers.h"

namespace nrx {

std::uint32_t parse_sample(std::string_view text) {
    return static_cast<std::uint32_t>(parse_number(text, "error converting samples"));
}

std::uint64_t parse_timestamp(std::string_view text) {
    const auto low = static_cast<std::int32_t>(parse_number(text, "error converting timestamp"));
    return static_cast<std::uint64_t>(std::int64_t{low});
}

std::uint32_t fixed_point_degrees(std::uint32_t hundredths) {
    return static_cast<std::uint32_t>(static_cast<std::int32_t>(hundredths << 16) / 100);
}

}  // namespace nrx
