// A program of the project as a process that a test interacts with while it runs.
#pragma once

#include <string>
#include <sys/types.h>
#include <vector>

namespace tests {

class running_program {
public:
    // Starts the program. Its standard output is read here; its standard error is discarded.
    running_program(const std::string& path, const std::vector<std::string>& arguments);
    // Kills it if it is still running.
    ~running_program();
    running_program(const running_program&) = delete;
    running_program& operator=(const running_program&) = delete;

    // Reads until the output contains the text after a position. Returns false if the output ends
    // or 10 seconds pass before that.
    bool wait_for(const std::string& text, std::size_t position = 0);

    void send_signal(int signal) const;

    // Closes the pipe: nobody reads the output any more.
    void stop_reading();

    // Reads the rest of the output and waits for the end. Returns the exit status, or 128 + the
    // signal that ended the process.
    int finish();

    // All output so far.
    [[nodiscard]] const std::string& out() const { return out_; }

    // The processor time that the program used, in seconds. Known after finish().
    [[nodiscard]] double processor_time() const { return processor_time_; }

private:
    bool read_more();

    pid_t child_ = -1;
    int output_ = -1;
    std::string out_;
    double processor_time_ = 0;
};

}  // namespace tests
