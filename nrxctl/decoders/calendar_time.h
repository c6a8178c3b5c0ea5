// From the coprocessor's time to the local calendar.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>

namespace nrx {

inline constexpr std::size_t longest_calendar_time = 29;

// A local time with microseconds, "Nov 16 17:22:28.123456".
class calendar_text {
public:
    // The local time in whole seconds, and the microseconds below a second.
    calendar_text(std::string_view seconds, std::uint32_t microseconds);

    // Valid as long as the object.
    [[nodiscard]] std::string_view view() const { return {text_.data(), size_}; }

private:
    std::array<char, longest_calendar_time> text_;
    std::size_t size_;
};

// The local calendar time of a time stamp in microseconds of the coprocessor's time, by the sync
// point that the driver's time-sync service has published last. The registry is asked anew at every
// call. None, and nothing is reported, if there is no such service or it publishes no sync point;
// one without both numbers is none.
std::optional<calendar_text> calendar_time(std::uint64_t timestamp);

}  // namespace nrx
