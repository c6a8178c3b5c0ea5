// Failure reports: one line on standard error for each check that does not hold.
//
// A check reports and returns false; the caller returns, and its handles release what they own.
#pragma once

#include <cstdint>
#include <string_view>

#include "platform/return_code.h"

namespace nrx {

// A position in the source. Stands in for std::source_location, which clang 14 lacks.
struct source_location {
    const char* file;  // path from the root of the repository
    int line;

    // As a default argument: the position of the call.
    static constexpr source_location current(const char* file = __builtin_FILE(),
                                             int line = __builtin_LINE()) {
        return {file, line};
    }
};

// Writes one failure report, a line, on standard error:
//   Assertion failed: <label>: Check failed: <condition> <exit label> <message> <file>:<line> <text
//   of the code> (0x<code>)
// A null text, a line of 0 and a code of 0 are omitted.
void report_failure(const char* label, const char* condition, const char* exit_label,
                    const char* message, const char* file, int line, platform::return_code code);

// Prints a line of fixed text on standard output that says that something failed. Counts as a
// failure although it is no report.
void print_failure(std::string_view line);

// Counts a failure that has no text of its own.
void count_failure();

// The number of failures of this process so far: reports, and what the functions above counted.
std::uint64_t failure_count();

// Reports a failed check of the subsystem with the given label unless the condition holds. Returns
// the condition's value. The text of the condition is what a reader of the report expects, not C++.
bool check_as(const char* label, bool holds, const char* condition, platform::return_code code,
              source_location location);

// Condition texts that recur. Readers of failure reports search for them, so the ones that differ
// in a name or a trailing space are kept apart.
namespace condition {

inline constexpr const char* kr_is_zero = "kr == 0 ";
inline constexpr const char* kr_is_zero_without_space = "kr == 0";
inline constexpr const char* result_is_zero = "result == 0 ";
inline constexpr const char* success = "success";
inline constexpr const char* service = "service";
inline constexpr const char* child = "child";
inline constexpr const char* property_name = "propertyName";
inline constexpr const char* property = "property";
inline constexpr const char* result = "result";
inline constexpr const char* never = "false";
inline constexpr const char* arguments_remain = "argc > optind";

}  // namespace condition

// What an operation does about a failure that its caller expects, such as a missing service.
enum class on_failure { report, ignore };

}  // namespace nrx
