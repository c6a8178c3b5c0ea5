#include "platform/virtual/profiler/profiler.h"

#include <algorithm>

namespace platform::simulated {

profiler::profiler(const machine_clock& clock)
    : clock_(clock), stream_(std::make_shared<event_stream>(clock)), statistics_(clock) {
    log_event(kernel_log_, control_event::started);
    log_event(coprocessor_log_, control_event::started);
}

void profiler::set_enabled(bool enabled) {
    stream_->set_enabled(enabled);
    log_event(kernel_log_, enabled ? control_event::enabled : control_event::disabled);
}

return_code profiler::configure_kernel(byte_view records) {
    return configure(kernel_, kernel_log_, records);
}

byte_list profiler::kernel_configs(std::size_t capacity) const {
    return write_configs(kernel_.enabled(), capacity);
}

void profiler::dump_errors() {
    stream_->catch_up();
    for (const event_record& record : stream_->recent()) {
        error_dump_.add(record);
    }
    log_event(error_dump_, control_event::dumped,
              static_cast<std::uint32_t>(stream_->recent().size()));
}

return_code profiler::configure_coprocessor(byte_view records) {
    return configure(coprocessor_, coprocessor_log_, records);
}

byte_list profiler::coprocessor_configs(std::size_t capacity) const {
    return write_configs(coprocessor_.enabled(), capacity);
}

void profiler::stop_coprocessor() {
    coprocessor_.stop();
    update_sources();
    log_event(coprocessor_log_, control_event::stopped);
}

void profiler::flush() {
    stream_->flush();
    log_event(coprocessor_log_, control_event::flushed);
}

void profiler::set_duration(std::chrono::microseconds duration) {
    stream_->end_after(duration);
    log_event(coprocessor_log_, control_event::duration_set,
              static_cast<std::uint32_t>(duration.count()));
}

void profiler::log_event(record_log& log, control_event event, std::uint32_t argument) {
    log.add(make_control_record(event, argument, clock_.now(), stream_->sequence_num()));
}

return_code profiler::configure(profiler_half& half, record_log& log, byte_view records) {
    const auto configs = read_configs(records);
    const return_code result = half.configure(configs);
    update_sources();
    log_event(log, control_event::configured, static_cast<std::uint32_t>(configs.size()));
    return result;
}

// A component that both halves have enabled produces the reports of both.
void profiler::update_sources() {
    std::vector<component_config> sources = coprocessor_.enabled();
    for (const component_config& config : kernel_.enabled()) {
        const auto match =
            std::find_if(sources.begin(), sources.end(), [&](const component_config& other) {
                return other.profiler == config.profiler && other.component == config.component;
            });
        if (match == sources.end()) {
            sources.push_back(config);
        } else {
            match->reports |= config.reports;
        }
    }
    stream_->set_sources(sources);
}

}  // namespace platform::simulated
