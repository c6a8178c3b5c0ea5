// The options of nrxctl as functions. The table in options.cpp names the arguments of each.
#pragma once

#include "nrxctl/options/option_arguments.h"

namespace nrx::nrxctl {

// Options that make one call of a driver.
option_result list(option_arguments& arguments);
option_result read_report(option_arguments& arguments);
option_result write_report(option_arguments& arguments);
option_result run_command(option_arguments& arguments);
option_result call_scalar(option_arguments& arguments);
option_result get_property(option_arguments& arguments);
option_result set_property(option_arguments& arguments);
option_result query_hid_driver(option_arguments& arguments);
option_result set_mca(option_arguments& arguments);

// Options that run a command family of the library.
option_result profile(option_arguments& arguments);
option_result scm(option_arguments& arguments);
option_result replay(option_arguments& arguments);
option_result show_sensor(option_arguments& arguments);

// Options that run the event loop until their time is over or an interrupt stops it.
option_result watch_events(option_arguments& arguments);
option_result watch_spi(option_arguments& arguments);

}  // namespace nrx::nrxctl
