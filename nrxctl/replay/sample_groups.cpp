#include "nrxctl/replay/sample_groups.h"

#include <algorithm>
#include <limits>

namespace nrx {

namespace {

// An event with its time stamp at hand: sorting these leaves the events where they are.
struct dated_event {
    std::uint64_t timestamp;
    event_ptr event;
};

void sort_by_time(event_list& events) {
    const auto is_earlier = [](const event_ptr& one, const event_ptr& other) {
        return one->timestamp() < other->timestamp();
    };
    // Recordings are in order as a rule.
    if (std::is_sorted(events.begin(), events.end(), is_earlier)) return;
    std::vector<dated_event> dated;
    dated.reserve(events.size());
    for (event_ptr& event : events) {
        const std::uint64_t timestamp = event->timestamp();
        dated.push_back({timestamp, std::move(event)});
    }
    std::stable_sort(dated.begin(), dated.end(),
                     [](const dated_event& one, const dated_event& other) {
                         return one.timestamp < other.timestamp;
                     });
    std::transform(dated.begin(), dated.end(), events.begin(),
                   [](dated_event& sorted) { return std::move(sorted.event); });
}

}  // namespace

void order_samples(sample_groups& groups) {
    std::uint64_t base = std::numeric_limits<std::uint64_t>::max();
    for (auto& [name, events] : groups) {
        sort_by_time(events);
        base = std::min(base, events.front()->timestamp());
    }
    for (auto& [name, events] : groups) {
        std::uint64_t previous = base;
        for (const event_ptr& event : events) {
            const std::uint64_t timestamp = event->timestamp();
            event->set_delta(static_cast<std::uint32_t>(timestamp - previous));
            previous = timestamp;
        }
    }
}

}  // namespace nrx
