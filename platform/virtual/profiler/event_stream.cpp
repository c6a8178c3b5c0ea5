#include "platform/virtual/profiler/event_stream.h"

#include <algorithm>

namespace platform::simulated {

namespace {

using time = machine_clock::time;

constexpr std::size_t max_recent_records = 32;

// The end of the batch that contains the given time; batches are counted from start.
time end_of_batch(time start, time instant) {
    const time batch = event_stream::batch_interval;
    return start + (instant - start + batch - time(1)) / batch * batch;
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
    if (running()) emit_until(clock_.now());
}

void event_stream::end() {
    flush();
    if (!ended_) add_end_marker();
}

void event_stream::end_after(std::chrono::microseconds duration) {
    catch_up();
    end_time_.reset();
    if (!ended_ && duration.count() > 0) end_time_ = clock_.now() + duration;
}

void event_stream::add_end_marker() {
    add(event_record{});
    ended_ = true;
    end_time_.reset();
}

time event_stream::time_of(std::uint64_t event) const {
    return start_ + static_cast<time::rep>(event + 1) * period_;
}

void event_stream::restart() {
    start_ = clock_.now();
    event_count_ = 0;
}

// Skips events that a full queue would have dropped, so that a reader who looks long afterwards
// does not have to wait until all of them have been generated.
void event_stream::skip_dropped_events(time limit) {
    const auto occurred = static_cast<std::uint64_t>((limit - start_) / period_);
    if (occurred <= event_count_ + capacity) return;
    const std::uint64_t skipped = occurred - event_count_ - capacity;
    sequence_num_ += static_cast<std::uint32_t>(skipped);
    event_count_ += skipped;
}

void event_stream::emit_until(time limit) {
    skip_dropped_events(limit);
    while (time_of(event_count_) <= limit)
        emit(event_count_++);
}

void event_stream::emit(std::uint64_t event) {
    const source& origin = sources_[event % sources_.size()];
    const event_kind& kind = *origin.kinds[event / sources_.size() % origin.kinds.size()];
    for (const event_record& record :
         make_event(kind, origin.component, event, time_of(event), sequence_num_)) {
        if (size() < capacity) add(record);
        recent_.push_back(record);
        if (recent_.size() > max_recent_records) recent_.pop_front();
    }
}

void event_stream::catch_up() {
    const time now = clock_.now();
    const bool ends = end_time_ && *end_time_ <= now;
    if (running()) {
        const time batch = batch_interval;
        emit_until(ends ? *end_time_ : start_ + (now - start_) / batch * batch);
    }
    if (ends) add_end_marker();
}

std::optional<time> event_stream::next_due() const {
    std::optional<time> due = end_time_;
    if (running()) {
        const time batch = end_of_batch(start_, time_of(event_count_));
        due = due ? std::min(*due, batch) : batch;
    }
    return due;
}

void event_stream::on_unmapped() {
    catch_up();
    clear();
    ended_ = false;
    end_time_.reset();
    restart();
}

}  // namespace platform::simulated
