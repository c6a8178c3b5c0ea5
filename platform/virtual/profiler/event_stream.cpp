#include "platform/virtual/profiler/event_stream.h"

#include <algorithm>

namespace platform::simulated {

namespace {

using time = machine_clock::time;

constexpr std::size_t recent_records = 32;

// The first end of a batch, counted from start, that is not before a time.
time end_of_batch(time start, time at) {
    const time batch = event_stream::batch_interval;
    return start + (at - start + batch - time(1)) / batch * batch;
}

}  // namespace

void event_stream::set_rate(std::uint32_t events_per_second) {
    flush();
    period_ = time(std::chrono::seconds(1)) / events_per_second;
    restart();
}

void event_stream::set_sources(const std::vector<component_config>& components) {
    flush();
    sources_.clear();
    for (const component_config& config : components) {
        source added{.component = config.component, .kinds = {}};
        for (const event_kind& kind : event_kinds) {
            const bool produced =
                kind.category == config.profiler && (kind.reports & config.reports) != 0 &&
                (kind.component == config.component || kind.component == event_kind::any_component);
            if (produced) added.kinds.push_back(&kind);
        }
        if (!added.kinds.empty()) sources_.push_back(std::move(added));
    }
    restart();
}

void event_stream::set_enabled(bool enabled) {
    flush();
    enabled_ = enabled;
    restart();
}

void event_stream::flush() {
    catch_up();
    if (running()) happen_until(clock_.now());
}

void event_stream::end() {
    flush();
    if (!ended_) mark_end();
}

void event_stream::end_after(std::chrono::microseconds duration) {
    catch_up();
    end_at_.reset();
    if (!ended_ && duration.count() > 0) end_at_ = clock_.now() + duration;
}

void event_stream::mark_end() {
    add(event_record{});
    ended_ = true;
    end_at_.reset();
}

time event_stream::time_of(std::uint64_t event) const {
    return start_ + static_cast<time::rep>(event + 1) * period_;
}

void event_stream::restart() {
    start_ = clock_.now();
    events_ = 0;
}

// Whoever looks long after the queue has filled up does not wait for all that was lost since.
void event_stream::skip_what_would_be_lost(time horizon) {
    const auto happened = static_cast<std::uint64_t>((horizon - start_) / period_);
    if (happened <= events_ + capacity) return;
    const std::uint64_t skipped = happened - events_ - capacity;
    sequence_num_ += static_cast<std::uint32_t>(skipped);
    events_ += skipped;
}

void event_stream::happen_until(time horizon) {
    skip_what_would_be_lost(horizon);
    while (time_of(events_) <= horizon)
        happen(events_++);
}

void event_stream::happen(std::uint64_t event) {
    const source& from = sources_[event % sources_.size()];
    const std::uint64_t turn = event / sources_.size();
    const event_kind& kind = *from.kinds[turn % from.kinds.size()];
    for (const event_record& record :
         make_event(kind, from.component, event, time_of(event), sequence_num_)) {
        if (size() < capacity) add(record);
        recent_.push_back(record);
        if (recent_.size() > recent_records) recent_.pop_front();
    }
}

void event_stream::catch_up() {
    const time now = clock_.now();
    const bool over = end_at_ && *end_at_ <= now;
    if (running()) {
        const time batch = batch_interval;
        happen_until(over ? *end_at_ : start_ + (now - start_) / batch * batch);
    }
    if (over) mark_end();
}

std::optional<time> event_stream::next_due() const {
    std::optional<time> due = end_at_;
    if (running()) {
        const time batch = end_of_batch(start_, time_of(events_));
        due = due ? std::min(*due, batch) : batch;
    }
    return due;
}

void event_stream::unmapped() {
    catch_up();
    clear();
    ended_ = false;
    end_at_.reset();
    restart();
}

}  // namespace platform::simulated
