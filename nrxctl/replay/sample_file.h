// Files of sensor samples, recorded or generated.
#pragma once

#include <functional>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "nrxctl/replay/virtual_event.h"

namespace nrx {

using event_list = std::vector<event_ptr>;

// The samples of a file by service name, in byte-wise order. No list is empty.
using sample_groups = std::map<std::string, event_list, std::less<>>;

// Reads the samples of a file in the order of their upload: each service's by timestamp, compared
// as unsigned numbers; samples with the same timestamp keep their order. Sets the deltas: the time
// since the sample before it, and for the first of a service the time since the earliest of all.
//
// A line is a tag and fields KEY=VALUE, separated by commas. Empty lines, comments and tags with a
// space in them are skipped, and so is an unknown tag, with a warning on standard output.
//
// Returns nullopt with a failure report if the file cannot be read or a field is not such a pair,
// and without one if the file is compressed or binary. A number that is missing or malformed ends
// the process with status 1, as does a shake, after a message on standard output. A file without a
// sample gives no groups. What is wrong is explained with the file and the line.
std::optional<sample_groups> read_sample_file(const std::string& path);

}  // namespace nrx
