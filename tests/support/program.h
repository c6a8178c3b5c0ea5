// Runs a program of the project as a process.
#pragma once

#include <string>
#include <sys/types.h>
#include <vector>

namespace tests {

struct program_result {
    int status;  // exit status; 128 + the signal if one ended it
    std::string out;
    std::string err;
    double processor_time;  // in seconds
};

// Where a program's standard output goes.
enum class output_target { pipe, file, closed_pipe, full_device, closed };

// Starts the program with descriptors for its output; a negative one closes the stream. Returns the
// process id.
pid_t start_program(const std::string& path, const std::vector<std::string>& arguments, int out,
                    int err);

// How a process ended.
struct process_end {
    int status;             // exit status; 128 + the signal if one ended it
    double processor_time;  // in seconds
};

// Waits for the end of a program.
process_end wait_for(pid_t child);

// Runs the program to its end and keeps its standard output and standard error apart.
program_result run_program(const std::string& path, const std::vector<std::string>& arguments,
                           output_target target = output_target::pipe);

// Runs the program and returns the writes to its standard output, in order.
std::vector<std::string> record_writes(const std::string& path,
                                       const std::vector<std::string>& arguments);

}  // namespace tests
