// The fields of a sample line.
#pragma once

#include <string_view>

#include "nrxctl/replay/sample_values.h"

namespace nrx {

// TAG,KEY=VALUE,... Its texts stay where the line stands.
struct sample_line {
    std::string_view tag;
    sample_values values;
};

// Splits a line at its commas into the tag and the values. False if a field behind the tag is not a
// key, one equals sign and a value. The key may be empty, the value may not; an empty field is
// refused, but for one behind a comma at the very end, which counts for nothing.
bool split_sample_line(std::string_view line, sample_line& split);

// Whether a line with that tag says nothing: a comment, or a tag that is empty or has a blank in
// it.
bool is_passed_over(std::string_view tag);

}  // namespace nrx
