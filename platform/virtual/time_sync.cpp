#include "platform/virtual/time_sync.h"

#include <optional>
#include <utility>

namespace platform::simulated {

namespace {

constexpr std::int64_t nanoseconds_per_second = 1'000'000'000;

// Updates the property of the service.
class sync_publisher {
public:
    explicit sync_publisher(std::function<sync_point()> now) : now_(std::move(now)) {}

    void operator()(dictionary& properties) {
        const sync_point point = now_();
        const std::int64_t second = point.coprocessor / nanoseconds_per_second;
        if (second == published_second_) return;
        published_second_ = second;
        properties.set("timesync",
                       dictionary{{"nrx", point.coprocessor}, {"calendar", point.calendar}});
    }

private:
    std::function<sync_point()> now_;
    std::optional<std::int64_t> published_second_;  // second of the last published sync point
};

}  // namespace

void add_time_sync(machine& host, std::function<sync_point()> now) {
    host.add({.name = "time-sync",
              .classes = {"KeltoNRXTimesync"},
              .refresh = sync_publisher(std::move(now))});
}

}  // namespace platform::simulated
