// Measures whole processes.
#pragma once

#include <string>
#include <vector>

namespace bench {

// Time and memory from exec to exit.
struct process_cost {
    double microseconds;
    double megabytes;  // peak resident memory
};

// Runs a program, looked up in PATH, with its standard streams open on /dev/null. If the program
// cannot be started, is killed by a signal, or exits with status 126 or more, prints a message and
// ends this process with status 1.
process_cost measure_process(const std::vector<std::string>& arguments);

}  // namespace bench
