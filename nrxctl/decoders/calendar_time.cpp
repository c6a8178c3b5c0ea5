#include "nrxctl/decoders/calendar_time.h"

#include <array>
#include <ctime>
#include <string_view>

#include "nrxctl/decoders/put_text.h"
#include "platform/registry.h"

namespace nrx {

namespace {

// The service that knows both times, and its property: a dictionary with the coprocessor's time and
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

// What has to be added to the coprocessor's time to make it calendar time, in nanoseconds; it wraps
// around.
std::optional<std::uint64_t> time_offset() {
    static const platform::dictionary matching = platform::matching_class(time_sync_class);
    // Kept from call to call for its room alone.
    thread_local platform::property sync_point(0);
    const platform::service time_sync = platform::first_match(matching);
    if (!time_sync || !platform::read_property(time_sync, sync_key, sync_point)) return {};
    const auto coprocessor = number_in(sync_point, coprocessor_key);
    const auto calendar = number_in(sync_point, calendar_key);
    if (!coprocessor || !calendar) return {};
    return static_cast<std::uint64_t>(*calendar) - static_cast<std::uint64_t>(*coprocessor);
}

// A second of the calendar in local time, "Nov 16 17:22:28". The last one is kept: records come by
// the thousand in a second, and a second has one text while the time zone stays the same.
class local_second {
public:
    const short_text& text(std::time_t second) {
        if (second != second_) {
            std::tm local{};
            ::localtime_r(&second, &local);
            std::array<char, 30> text;
            text_ = short_text().append(
                {text.data(), std::strftime(text.data(), text.size(), "%b %d %T", &local)});
            second_ = second;
        }
        return text_;
    }

private:
    std::time_t second_ = -1;  // calendar time is unsigned here: no second has this number
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
    std::array<char, 7 + put_slack> fraction{'.'};
    const char* end = put_digits(fraction.data() + 1, microseconds % microseconds_per_second, 6);
    return short_text(last.text(second)).append({fraction.data(), end});
}

}  // namespace nrx
