// The source files that failure reports name, as paths from the root of the repository.
#pragma once

namespace tests::source_file {

inline constexpr const char* channel = "nrxctl/base/channel.cpp";
inline constexpr const char* command_channel = "nrxctl/base/command_channel.cpp";
inline constexpr const char* mca = "nrxctl/base/mca.cpp";
inline constexpr const char* profile_record = "nrxctl/base/profile_record.cpp";
inline constexpr const char* service_conn = "nrxctl/base/service_conn.cpp";
inline constexpr const char* services = "nrxctl/base/services.cpp";

inline constexpr const char* apply_configs = "nrxctl/profiler/apply_configs.cpp";
inline constexpr const char* config_parser = "nrxctl/profiler/config_parser.cpp";
inline constexpr const char* control_subcommands = "nrxctl/profiler/control_subcommands.cpp";
inline constexpr const char* kernel_profiler = "nrxctl/profiler/kernel_profiler.cpp";
inline constexpr const char* log_subcommands = "nrxctl/profiler/log_subcommands.cpp";
inline constexpr const char* monitor = "nrxctl/profiler/monitor.cpp";
inline constexpr const char* scm_monitor = "nrxctl/profiler/scm_monitor.cpp";
inline constexpr const char* statistics_subcommands = "nrxctl/profiler/statistics_subcommands.cpp";

inline constexpr const char* collection = "keyprobe/collection.cpp";

inline constexpr const char* generate_samples = "nrxctl/replay/generate_samples.cpp";
inline constexpr const char* load_samples = "nrxctl/replay/load_samples.cpp";
inline constexpr const char* replay_state = "nrxctl/replay/replay_state.cpp";
inline constexpr const char* sample_file = "nrxctl/replay/sample_file.cpp";

inline constexpr const char* event_text = "nrxctl/decoders/event_text.h";
inline constexpr const char* record_text = "nrxctl/decoders/record_text.cpp";

inline constexpr const char* button_reports = "nrxctl/printers/button_reports.cpp";
inline constexpr const char* diag_report = "nrxctl/printers/diag_report.cpp";
inline constexpr const char* error_reports = "nrxctl/printers/error_reports.cpp";
inline constexpr const char* sample_ranges = "nrxctl/printers/sample_ranges.cpp";
inline constexpr const char* spi_status = "nrxctl/printers/spi_status.cpp";

inline constexpr const char* hid_event_watch = "nrxctl/inspection/hid_event_watch.cpp";
inline constexpr const char* sensor_details = "nrxctl/inspection/sensor_details.cpp";
inline constexpr const char* sensor_registry = "nrxctl/inspection/sensor_registry.cpp";
inline constexpr const char* sensor_reports = "nrxctl/inspection/sensor_reports.cpp";
inline constexpr const char* spi_watch = "nrxctl/inspection/spi_watch.cpp";

}  // namespace tests::source_file
