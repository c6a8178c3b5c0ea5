// Failure reports, and the checks that write them.
//
// An operation checks what it depends on; a check that does not hold writes one report, and the
// caller returns. Handles release themselves on the way out.
#pragma once

#include "nrxctl/base/source_place.h"
#include "platform/return_code.h"

namespace nrx {

// The label of reports that the tool library writes.
inline constexpr const char* library_label = "nrxtoollib";

// Writes one failure report, a line, on standard error:
//   Assertion failed: <label>: Check failed: <condition> <exit label> <message> <file>:<line> <text
//   of the code> (0x<code>)
// Texts that are null, a line of 0 and a code of 0 leave their part out.
void report_failure(const char* label, const char* condition, const char* exit_label,
                    const char* message, const char* file, int line, platform::return_code code);

// A check as a subsystem with the given label makes it: answers whether the condition holds, and
// reports it if not. Conditions are named as a reader of the report expects them.
bool check_as(const char* label, bool holds, const char* condition, platform::return_code code,
              source_place place);

// Checks of the library. The first is for a handle, an object or any other condition; the second
// for a return code, whose condition is the variable's name and " == 0 ".
template <class Condition>
bool check(const Condition& condition, const char* text,
           source_place place = source_place::here()) {
    return check_as(library_label, static_cast<bool>(condition), text, platform::success, place);
}
inline bool check_success(platform::return_code code, const char* text,
                          source_place place = source_place::here()) {
    return check_as(library_label, code == platform::success, text, code, place);
}

// What an operation does about the one failure that its caller may foresee, such as a service that
// is not there.
enum class expected_failure { is_reported, is_silent };

}  // namespace nrx
