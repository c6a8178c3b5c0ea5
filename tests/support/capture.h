// Runs a piece of the tool and keeps what it wrote.
#pragma once

#include <functional>
#include <optional>
#include <string>

namespace tests {

struct outcome {
    std::string out;            // standard output
    std::string err;            // standard error without line numbers of source files
    std::string raw_err;        // standard error as written
    std::optional<int> status;  // the exit status, if the process would have ended
};

// Runs action with memory sinks for standard output and standard error.
outcome capture(const std::function<void()>& action);

// The same with both descriptors redirected, for text that does not leave through a sink.
outcome capture_descriptors(const std::function<void()>& action);

// Removes the line numbers of source files: "nrxctl/base/channel.cpp:17" loses its ":17".
std::string without_line_numbers(const std::string& text);

}  // namespace tests
