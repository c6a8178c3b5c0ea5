// Configurations as users write them: <profiler>:<components>[:<reports>[:<services>]], each but
// the first a list with commas.
#pragma once

#include <optional>
#include <string_view>
#include <vector>

#include "nrxctl/base/argument_words.h"
#include "nrxctl/profiler/config_words.h"
#include "nrxctl/profiler/profiler_config.h"

namespace nrx {

// Appends the configurations of all words that are left, taking them. False, with a failure report,
// at the first word that fails; what came before it stays in configs.
bool parse_profiler_configs(argument_words& words, std::vector<profiler_config>& configs);

// Appends a configuration per component of one word. False if the word has too few or too many
// fields, and, with a failure report, if its profiler or a component is unknown, has too many
// components or too many services; what came before the failure stays in configs.
//
// A component or report word that is no word of the profiler's, where numbers are allowed, must be
// a number of 32 bits: otherwise the process ends with status 1 after a message on standard output.
bool parse_profiler_config(std::string_view word, std::vector<profiler_config>& configs);

// Fills a configuration that has every report and no services. The component word "stop" stops the
// profiler; the first report word "stop" disables the component. False, with a failure report, for
// a component that is not among those of the profiler and may not be a number.
bool init_profiler_config(const profiler_grammar& profiler, std::string_view component,
                          std::optional<std::string_view> first_report, profiler_config& config);

}  // namespace nrx
