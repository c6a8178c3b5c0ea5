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
// cannot be started or a signal kills it, prints a message and ends this process with status 1.
process_cost run_once(const std::vector<std::string>& arguments);

}  // namespace bench
