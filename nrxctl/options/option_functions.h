// The options of nrxctl as functions: each reads and checks its arguments, and returns what it will
// do. The table in options.cpp names the arguments of each and checks how many there are.
#pragma once

#include "nrxctl/options/option_arguments.h"

namespace nrx::nrxctl {

// Options that call drivers.
option_action list(option_arguments& arguments);
option_action read_report(option_arguments& arguments);
option_action write_report(option_arguments& arguments);
option_action run_command(option_arguments& arguments);
option_action call_scalar(option_arguments& arguments);
option_action get_property(option_arguments& arguments);
option_action set_property(option_arguments& arguments);
option_action query_hid_driver(option_arguments& arguments);
option_action set_mca(option_arguments& arguments);

// Options that run a larger part of the library.
option_action profile(option_arguments& arguments);
option_action scm(option_arguments& arguments);
option_action replay(option_arguments& arguments);
option_action show_sensor(option_arguments& arguments);

// Options that run the event loop until their time is over or an interrupt stops it.
option_action watch_events(option_arguments& arguments);
option_action watch_spi(option_arguments& arguments);

// Options about those that follow.
option_action set_count(option_arguments& arguments);
option_action set_raw(option_arguments& arguments);
option_action set_hex(option_arguments& arguments);

}  // namespace nrx::nrxctl
