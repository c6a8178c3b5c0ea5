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

void set_delta(VirtualEvent& event, std::uint64_t previous) {
    event.set_delta(static_cast<std::uint32_t>(event.timestamp() - previous));
}

}  // namespace

// Room that stays empty is not backed by memory, room that grows is, twice. The bound is for files
// whose size says nothing.
group_filler::group_filler(event_list& events, std::size_t expected) : events_(&events) {
    constexpr std::size_t most = std::size_t{1} << 22;
    events.reserve(std::min(expected, most));
    event_memory::prefer_huge_pages(events.data(), events.capacity() * sizeof(event_ptr));
}

// Recordings are in order as a rule.
void group_filler::add(event_ptr event) {
    const std::uint64_t timestamp = event->timestamp();
    if (!events_->empty()) {
        event->set_delta(static_cast<std::uint32_t>(timestamp - last_timestamp_));
        if (timestamp < last_timestamp_) is_in_order_ = false;
    }
    last_timestamp_ = timestamp;
    events_->push_back(std::move(event));
}

void group_filler::finish() {
    if (is_in_order_) return;
    sort_by_time(*events_);
    std::uint64_t previous = events_->front()->timestamp();
    for (const event_ptr& event : *events_) {
        set_delta(*event, previous);
        previous = event->timestamp();
    }
}

void set_first_deltas(sample_groups& groups) {
    std::uint64_t base = std::numeric_limits<std::uint64_t>::max();
    for (const auto& [name, events] : groups)
        base = std::min(base, events.front()->timestamp());
    for (const auto& [name, events] : groups)
        set_delta(*events.front(), base);
}

}  // namespace nrx
