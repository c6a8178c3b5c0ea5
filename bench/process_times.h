// What a whole process costs, from exec to exit.
#pragma once

#include <string>
#include <vector>

namespace bench {

struct process_cost {
    double microseconds;
    double megabytes;  // the most memory it had resident
};

// Runs a program, found as the shell finds it, with the words of a command line; standard output
// and standard error go to /dev/null, standard input comes from there. Ends this process with
// status 1, after a message, if the program cannot be started or is ended by a signal.
process_cost run_once(const std::vector<std::string>& words);

}  // namespace bench
