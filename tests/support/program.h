// Runs a program of the project as a process of its own.
#pragma once

#include <string>
#include <sys/types.h>
#include <vector>

namespace tests {

struct program_result {
    int status;  // exit status; 128 + the signal if one ended it
    std::string out;
    std::string err;
};

// Where a program's standard output goes.
enum class output_to { pipe, closed_pipe, full_device, nowhere };

// Starts the program with descriptors for its output; a negative one stands for none. Its process.
pid_t start_program(const std::string& path, const std::vector<std::string>& arguments, int out,
                    int err);

// Runs the program to its end with its standard output and standard error kept apart.
program_result run_program(const std::string& path, const std::vector<std::string>& arguments,
                           output_to target = output_to::pipe);

// Runs the program with its standard output in a pipe that keeps each write apart; the writes in
// order.
std::vector<std::string> writes_of(const std::string& path,
                                   const std::vector<std::string>& arguments);

}  // namespace tests
