// The checks of the library itself, under its own label. A front end has checks of its own; the
// umbrella header does not include this file.
#pragma once

#include "nrxctl/base/explanation.h"
#include "nrxctl/base/failure_report.h"

namespace nrx {

inline constexpr const char* library_label = "nrxtoollib";

// Checks a handle, a pointer or any other condition. Returns true if it holds.
template <class Condition>
bool check(const Condition& condition, const char* text,
           source_location location = source_location::current()) {
    return check_as(library_label, static_cast<bool>(condition), text, platform::success, location);
}

// Checks a condition on an argument. If it does not hold, gives the explanation that describe()
// returns.
template <class Condition, class Describe>
bool check_explained(const Condition& condition, const char* text, const Describe& describe,
                     source_location location = source_location::current()) {
    const bool holds = static_cast<bool>(condition);
    if (!holds) explain(describe);
    return check_as(library_label, holds, text, platform::success, location);
}

// Checks a return code, which the failure report names. Returns true on success.
inline bool check_success(platform::return_code code, const char* text,
                          source_location location = source_location::current()) {
    return check_as(library_label, code == platform::success, text, code, location);
}

}  // namespace nrx
