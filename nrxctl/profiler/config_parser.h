// Parses configuration arguments: <profiler>:<components>[:<reports>[:<services>]]. Components,
// reports and services are comma-separated lists.
#pragma once

#include <optional>
#include <string_view>
#include <vector>

#include "nrxctl/base/arguments.h"
#include "nrxctl/profiler/config_grammar.h"
#include "nrxctl/profiler/profiler_config.h"

namespace nrx {

// Reads all remaining arguments and appends their configurations. Stops at the first argument that
// is invalid and returns false with a failure report; the configurations parsed so far stay.
bool parse_profiler_configs(argument_cursor& arguments, std::vector<profiler_config>& configs);

// Appends one configuration per component of an argument. Returns false if the argument has fewer
// than two fields or more than four, and, with a failure report, if the profiler or a component is
// unknown or if there are too many components or services. The configurations of the components
// before the failure stay.
//
// A component or report that is not a keyword, where numbers are allowed, must be a number of 32
// bits. Otherwise the process ends with status 1 after a message on standard output.
bool parse_profiler_config(std::string_view argument, std::vector<profiler_config>& configs);

// Sets config to every report and no service of a component. The component "stop" stops the
// profiler; "stop" as the first report disables the component. Returns false with a failure report
// if the component is unknown and the profiler takes no numbers for components; if it does, a
// component that is not a number ends the process.
bool init_profiler_config(const profiler_grammar& profiler, std::string_view component,
                          std::optional<std::string_view> first_report, profiler_config& config);

// Returns the fields of a text between its delimiters. Fields may be empty, but a delimiter at the
// end of the text is not followed by one. An empty text has no fields.
std::vector<std::string_view> split(std::string_view text, char delimiter);

}  // namespace nrx
