// Files of sensor samples, recorded or generated.
#pragma once

#include <optional>
#include <string>

#include "nrxctl/replay/sample_groups.h"

namespace nrx {

// Reads the samples of a file, in the order in which they are uploaded and with their deltas. A
// line is a tag and fields KEY=VALUE, with a comma before each; empty lines, comments and tags with
// a blank in them are passed over, and an unknown tag as well, with a warning on standard output.
//
// None, with a failure report, if the file cannot be read or a field is no such pair. A number that
// is missing or none ends the process with status 1, as does a shake, after a message on standard
// output.
std::optional<sample_groups> read_sample_file(const std::string& path);

}  // namespace nrx
