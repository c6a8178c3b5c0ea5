// The fields and records of a driver's reply, which may be shorter than its layout.
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/little_endian.h"
#include "platform/bytes.h"

namespace nrx {

// The value of 1.0 in the coprocessor's fixed-point formats: signed 32 bits, of which 16 or 12 are
// the fraction.
inline constexpr double q16_16_one = 65536.0;
inline constexpr double q20_12_one = 4096.0;

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
        return contains<Number>(offset) ? load_le<Number>(bytes_.data() + offset) : Number{0};
    }

    // Returns true if a number at that offset is wholly inside the bytes.
    template <class Number>
    [[nodiscard]] bool contains(std::size_t offset) const {
        return offset <= bytes_.size() && bytes_.size() - offset >= sizeof(Number);
    }

private:
    platform::byte_view bytes_;
};

// Checks that a reply is as long as its layout. The condition of the failure report is
// "length >= <required>".
bool check_length(platform::byte_view bytes, std::size_t required,
                  source_location location = source_location::current());

// Returns the text of a field of fixed size: its bytes before the first NUL, or all of them if
// there is none. The view refers to the field.
inline std::string_view text_before_nul(platform::byte_view field) {
    const auto end = std::find(field.begin(), field.end(), 0);
    return {reinterpret_cast<const char*>(field.data()),
            static_cast<std::string_view::size_type>(end - field.begin())};
}

// Calls visit with the bytes of each complete record of the given size, in order. Trailing bytes
// are ignored.
template <class Visit>
void for_each_record(platform::byte_view records, std::size_t size, const Visit& visit) {
    for (; records.size() >= size; records = records.subspan(size))
        visit(records.first(size));
}

}  // namespace nrx
