#include "platform/virtual/time_sync.h"

#include <optional>
#include <utility>

namespace platform::simulated {

namespace {

constexpr std::int64_t publishing_interval = 1000000000;

// Keeps the property of the service up to date.
class sync_publisher {
public:
    explicit sync_publisher(std::function<sync_point()> now) : now_(std::move(now)) {}

    void operator()(dictionary& properties) {
        const sync_point point = now_();
        const std::int64_t interval = point.coprocessor / publishing_interval;
        if (interval == published_) return;
        published_ = interval;
        properties.set("timesync",
                       dictionary{{"nrx", point.coprocessor}, {"calendar", point.calendar}});
    }

private:
    std::function<sync_point()> now_;
    std::optional<std::int64_t> published_;  // the interval of the last sync point
};

}  // namespace

void add_time_sync(machine& host, std::function<sync_point()> now) {
    host.add({.name = "time-sync",
              .classes = {"KeltoNRXTimesync"},
              .refresh = sync_publisher(std::move(now))});
}

}  // namespace platform::simulated
