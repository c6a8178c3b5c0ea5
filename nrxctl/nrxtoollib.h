// The umbrella header of the tool library: everything that a front end may call, and nothing else.
#pragma once

// Services and the calls of their drivers
#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/mca.h"
#include "nrxctl/base/service_conn.h"
#include "nrxctl/base/services.h"

// Reports as text
#include "nrxctl/base/hex_dump.h"
#include "nrxctl/printers/button_reports.h"
#include "nrxctl/printers/report_printers.h"
#include "nrxctl/printers/spi_status.h"
#include "nrxctl/printers/value_printers.h"

// Event records as text
#include "nrxctl/base/profile_record.h"
#include "nrxctl/decoders/record_text.h"
#include "nrxctl/decoders/scm_packets.h"

// The profiler
#include "nrxctl/profiler/profile_command.h"
#include "nrxctl/profiler/scm_monitor.h"

// Replay of sensor samples
#include "nrxctl/replay/replay_command.h"

// Sensors
#include "nrxctl/inspection/sensor_info.h"

// HID events and SPI status records as they arrive
#include "nrxctl/inspection/hid_event_watch.h"
#include "nrxctl/inspection/hid_events.h"
#include "nrxctl/inspection/hid_statistics.h"
#include "nrxctl/inspection/spi_watch.h"

// Arguments, output and failure reports
#include "nrxctl/base/arguments.h"
#include "nrxctl/base/clock_references.h"
#include "nrxctl/base/end_process.h"
#include "nrxctl/base/explanation.h"
#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/payload.h"
#include "nrxctl/base/print_limit.h"
#include "nrxctl/base/text_line.h"
