// Runs a piece of the tool and keeps what it wrote.
#pragma once

#include <functional>
#include <optional>
#include <string>

namespace tests {

// Thrown in place of the end of the process.
struct process_ended {
    int status;
};

struct outcome {
    std::string out;             // standard output
    std::string err;             // standard error; line numbers of source files are left out
    std::string err_as_written;  // standard error with them
    std::optional<int> status;   // how the process would have ended, if it would have
};

// Runs action with standard output and standard error redirected.
outcome capture(const std::function<void()>& action);

// "nrxctl/base/channel.cpp:17" without its line number, wherever it stands in the text.
std::string without_line_numbers(const std::string& text);

}  // namespace tests
