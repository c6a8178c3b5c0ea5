// The front end's own checks: those of the library under the front end's label.
#pragma once

#include "nrxctl/nrxtoollib.h"

namespace nrx::keyprobe {

inline constexpr const char* front_end_label = "keyprobe";

template <class Condition>
bool check(const Condition& condition, const char* text,
           source_place place = source_place::here()) {
    return check_as(front_end_label, static_cast<bool>(condition), text, platform::success, place);
}
inline bool check_success(platform::return_code code, const char* text,
                          source_place place = source_place::here()) {
    return check_as(front_end_label, code == platform::success, text, code, place);
}

}  // namespace nrx::keyprobe
