// How the tool reaches the virtual profiler: the kernel's driver and the interface service
// "profile".

#include <array>
#include <memory>
#include <utility>

#include "platform/virtual/little_endian.h"
#include "platform/virtual/profiler/profiler.h"

namespace platform::simulated {

// --- the kernel's driver ---

namespace {

class profiler_driver final : public driver {
public:
    explicit profiler_driver(std::shared_ptr<profiler> shared) : shared_(std::move(shared)) {}

    return_code call(std::uint32_t selector, const call_inputs& inputs,
                     call_outputs& outputs) override {
        using method = simulated::method<profiler_driver>;
        using enum argument_rule;
        static constexpr std::array methods{
            method{0, {1, none, 0, none}, &profiler_driver::set_enabled},
            method{1, {0, none, 1, none}, &profiler_driver::read_status},
            method{2, {0, optional, 0, none}, &profiler_driver::configure},
            method{3, {0, none, 0, required}, &profiler_driver::read_configs},
            method{8, {0, none, 0, required}, &profiler_driver::read_error_dump},
            method{9, {0, none, 0, required}, &profiler_driver::read_log},
            method{10, {0, none, 0, none}, &profiler_driver::dump_errors},
            method{11, {0, none, 0, none}, &profiler_driver::stop_stream},
        };
        return run_method(*this, methods, selector, inputs, outputs);
    }

    std::shared_ptr<shared_queue> memory(std::uint32_t type) override {
        return type == 0 ? shared_->stream() : nullptr;
    }
    std::shared_ptr<shared_queue> notification(std::uint32_t type) override { return memory(type); }

private:
    return_code set_enabled(const call_inputs& inputs, call_outputs& /*outputs*/) {
        if (inputs.scalars[0] > 1) return bad_argument;
        shared_->set_enabled(inputs.scalars[0] == 1);
        return success;
    }

    // Reports a connected client as long as the profiler is enabled.
    return_code read_status(const call_inputs& /*inputs*/, call_outputs& outputs) {
        outputs.scalars[0] = shared_->stream()->enabled() ? 1 : 0;
        return success;
    }

    return_code configure(const call_inputs& inputs, call_outputs& /*outputs*/) {
        return shared_->configure_kernel(inputs.structure);
    }

    return_code read_configs(const call_inputs& /*inputs*/, call_outputs& outputs) {
        return copy_reply(shared_->kernel_configs(outputs.structure.size()), outputs);
    }

    return_code read_error_dump(const call_inputs& /*inputs*/, call_outputs& outputs) {
        return copy_reply(shared_->read_error_dump(outputs.structure.size()), outputs);
    }

    return_code read_log(const call_inputs& /*inputs*/, call_outputs& outputs) {
        return copy_reply(shared_->read_kernel_log(outputs.structure.size()), outputs);
    }

    return_code dump_errors(const call_inputs& /*inputs*/, call_outputs& /*outputs*/) {
        shared_->dump_errors();
        return success;
    }

    return_code stop_stream(const call_inputs& /*inputs*/, call_outputs& /*outputs*/) {
        shared_->stop_stream();
        return success;
    }

    std::shared_ptr<profiler> shared_;
};

}  // namespace

std::shared_ptr<profiler> add_profiler_driver(machine& host) {
    auto shared = std::make_shared<profiler>(host.clock());
    host.add({.name = "KeltoNRXProfileDriver",
              .classes = {"KeltoNRXProfileDriver"},
              .driver = std::make_shared<profiler_driver>(shared)});
    return shared;
}

// --- the coprocessor's service ---

namespace {

// Reports.
constexpr std::uint32_t configs_report = 0xd0;
constexpr std::uint32_t log_report = 0xd1;
constexpr std::uint32_t duration_report = 0xd2;
constexpr std::uint32_t error_action_report = 0xd5;

// Commands.
constexpr std::uint32_t statistics_command = 0x20;
constexpr std::uint32_t stop_command = 0x21;
constexpr std::uint32_t flush_command = 0x23;
constexpr std::uint32_t configure_command = 0x24;

// Payload of the statistics command: a kind of statistics and, for event sources, an action.
constexpr std::uint32_t event_sources = 0;
constexpr std::uint32_t wake_requests = 10;
constexpr std::uint32_t clear = 0;
constexpr std::uint32_t read = 1;

return_code run_statistics(profiler_statistics& statistics, byte_view payload, byte_list& reply) {
    if (payload.size() != 8) return bad_argument;
    const std::uint32_t kind = load_u32(payload, 0);
    const std::uint32_t action = load_u32(payload, 4);
    if (kind == event_sources && action == clear) {
        statistics.clear_event_sources();
    } else if (kind == event_sources && action == read) {
        reply = statistics.event_sources();
    } else if (kind == wake_requests) {
        reply = statistics.wake_requests();
    } else {
        return unsupported;
    }
    return success;
}

return_code set_duration(profiler& target, byte_view report) {
    if (report.size() != 4) return bad_argument;
    target.set_duration(std::chrono::microseconds(load_u32(report, 0)));
    return success;
}

return_code check_error_action(byte_view report) {
    return report.size() == 4 && load_u32(report, 0) <= 1 ? success : bad_argument;
}

void add_reports(interface_driver& service, const std::shared_ptr<profiler>& shared) {
    service.set_report_source(configs_report, [shared](std::size_t capacity, byte_list& reply) {
        reply = shared->coprocessor_configs(capacity);
        return success;
    });
    service.set_report_source(log_report, [shared](std::size_t capacity, byte_list& reply) {
        reply = shared->read_coprocessor_log(capacity);
        return success;
    });
    service.set_report(duration_report, {0, 0, 0, 0});
    service.set_report_sink(duration_report,
                            [shared](byte_view report) { return set_duration(*shared, report); });
    service.set_report(error_action_report, {0, 0, 0, 0});
    service.set_report_sink(error_action_report, check_error_action);
}

void add_commands(interface_driver& service, const std::shared_ptr<profiler>& shared) {
    service.set_command(statistics_command, [shared](byte_view payload, byte_list& reply) {
        return run_statistics(shared->statistics(), payload, reply);
    });
    service.set_command(stop_command, [shared](byte_view /*payload*/, byte_list& /*reply*/) {
        shared->stop_coprocessor();
        return success;
    });
    service.set_command(flush_command, [shared](byte_view /*payload*/, byte_list& /*reply*/) {
        shared->flush();
        return success;
    });
    service.set_command(configure_command, [shared](byte_view payload, byte_list& /*reply*/) {
        return shared->configure_coprocessor(payload);
    });
}

}  // namespace

void serve_profile(interface_driver& service, const std::shared_ptr<profiler>& shared) {
    add_reports(service, shared);
    add_commands(service, shared);
}

}  // namespace platform::simulated
