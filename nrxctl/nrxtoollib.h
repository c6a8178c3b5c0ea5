// The tool library as a front end sees it: everything that it may call, and nothing else. Besides
// the entry points these are the words that front ends speak in: numbers, lines, checks.
#pragma once

// Services and their command channel
#include "nrxctl/base/command_channel.h"
#include "nrxctl/base/hid_driver.h"
#include "nrxctl/base/matching.h"
#include "nrxctl/base/mca.h"
#include "nrxctl/base/named_property.h"
#include "nrxctl/base/profile_records.h"
#include "nrxctl/base/scalar_method.h"
#include "nrxctl/base/service_conn.h"
#include "nrxctl/base/service_discovery.h"
#include "nrxctl/base/service_list.h"
#include "nrxctl/base/service_property.h"

// Reports as text
#include "nrxctl/base/hex_dump.h"
#include "nrxctl/printers/button_stats.h"
#include "nrxctl/printers/haptic_assets.h"
#include "nrxctl/printers/printer_registry.h"
#include "nrxctl/printers/spi_status.h"
#include "nrxctl/printers/value_printers.h"

// Event records as text
#include "nrxctl/decoders/profile_hexdump.h"
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
#include "nrxctl/inspection/clock_references.h"
#include "nrxctl/inspection/hid_event_watch.h"
#include "nrxctl/inspection/hid_events.h"
#include "nrxctl/inspection/hid_statistics.h"
#include "nrxctl/inspection/spi_watch.h"

// Words in, lines out
#include "nrxctl/base/end_process.h"
#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/payload.h"
#include "nrxctl/base/refuse_word.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/base/tick_period.h"
