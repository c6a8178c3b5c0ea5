#include "nrxctl/decoders/record_times.h"

#include <array>
#include <ctime>
#include <string_view>

#include "nrxctl/decoders/write_text.h"
#include "platform/clock.h"
#include "platform/registry.h"

namespace nrx {

namespace {

// The service that knows both clocks. Its property is a dictionary with the coprocessor's time and
// the calendar time (since 1970, UTC) of one instant, both in nanoseconds.
constexpr std::string_view time_sync_class = "KeltoNRXTimesync";
constexpr std::string_view sync_key = "timesync";
constexpr std::string_view coprocessor_key = "nrx";
constexpr std::string_view calendar_key = "calendar";

constexpr std::uint64_t nanoseconds_per_microsecond = 1000;
constexpr std::uint64_t microseconds_per_second = 1000000;

std::optional<std::int64_t> number_in(const platform::property& values, std::string_view key) {
    const platform::dictionary* entries = values.entries();
    const platform::property* value = entries == nullptr ? nullptr : entries->find(key);
    return value == nullptr ? std::nullopt : value->number();
}

// Returns calendar time minus coprocessor time in nanoseconds; it wraps around.
std::optional<std::uint64_t> time_offset() {
    static const platform::dictionary matching = platform::matching_class(time_sync_class);
    // Kept between calls for its storage.
    thread_local platform::property sync_point(0);
    const platform::service time_sync = platform::first_match(matching);
    if (!time_sync || !platform::read_property(time_sync, sync_key, sync_point)) return {};
    const auto coprocessor = number_in(sync_point, coprocessor_key);
    const auto calendar = number_in(sync_point, calendar_key);
    if (!coprocessor || !calendar) return {};
    return static_cast<std::uint64_t>(*calendar) - static_cast<std::uint64_t>(*coprocessor);
}

// A second in local time, "Nov 16 17:22:28". The last one is kept, because thousands of records
// fall into one second.
class local_second {
public:
    const short_text& text(std::time_t second) {
        if (second != second_ || ::timezone != standard_offset_ || ::daylight != has_daylight_) {
            std::tm local{};
            ::localtime_r(&second, &local);
            std::array<char, 30> text;
            text_ = short_text().append(
                {text.data(), std::strftime(text.data(), text.size(), "%b %d %T", &local)});
            second_ = second;
            // Read after localtime_r, which may change them.
            standard_offset_ = ::timezone;
            has_daylight_ = ::daylight;
        }
        return text_;
    }

private:
    std::time_t second_ = -1;  // no second has this number: calendar time is unsigned here
    long standard_offset_ = 0;
    int has_daylight_ = 0;
    short_text text_;
};

}  // namespace

std::optional<short_text> calendar_time(std::uint64_t timestamp) {
    thread_local local_second last;
    const auto offset = time_offset();
    if (!offset) return std::nullopt;
    const std::uint64_t microseconds =
        (timestamp * nanoseconds_per_microsecond + *offset) / nanoseconds_per_microsecond;
    const auto second = static_cast<std::time_t>(microseconds / microseconds_per_second);
    std::array<char, 7 + write_slack> fraction{'.'};
    const char* end = write_digits(fraction.data() + 1, microseconds % microseconds_per_second, 6);
    return short_text(last.text(second)).append({fraction.data(), end});
}

std::optional<std::int64_t> boot_time_usec() {
    const auto boot = platform::boot_time();
    if (!boot) return std::nullopt;
    return boot->seconds * static_cast<std::int64_t>(microseconds_per_second) + boot->microseconds;
}

}  // namespace nrx
