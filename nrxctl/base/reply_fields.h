// The numbers of a driver's reply, which may be shorter than its layout.
#pragma once

#include <cstddef>
#include <cstdint>

#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/source_place.h"
#include "platform/bytes.h"

namespace nrx {

// Reads little-endian fields by offset. A field that is not wholly inside the bytes reads as 0;
// nothing beyond them is read.
class reply_fields {
public:
    explicit reply_fields(platform::byte_view bytes) : bytes_(bytes) {}

    [[nodiscard]] std::uint8_t u8(std::size_t offset) const { return number<std::uint8_t>(offset); }
    [[nodiscard]] std::uint32_t u32(std::size_t offset) const {
        return number<std::uint32_t>(offset);
    }
    [[nodiscard]] std::int32_t s32(std::size_t offset) const {
        return number<std::int32_t>(offset);
    }
    [[nodiscard]] std::uint64_t u64(std::size_t offset) const {
        return number<std::uint64_t>(offset);
    }

    template <class Number>
    [[nodiscard]] Number number(std::size_t offset) const {
        return holds<Number>(offset) ? load_le<Number>(bytes_.data() + offset) : Number{0};
    }

    // Whether a number at that offset is wholly inside the bytes.
    template <class Number>
    [[nodiscard]] bool holds(std::size_t offset) const {
        return offset <= bytes_.size() && bytes_.size() - offset >= sizeof(Number);
    }

private:
    platform::byte_view bytes_;
};

// Checks that a reply is as long as its layout, and names the length that was needed if it is not:
// the condition of the failure report is "length >= <needed>".
bool check_length(platform::byte_view bytes, std::size_t needed,
                  source_place place = source_place::here());

}  // namespace nrx
