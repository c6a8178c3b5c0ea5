// A program of the project as a process that a test talks to while it runs.
#pragma once

#include <string>
#include <sys/types.h>
#include <vector>

namespace tests {

class running_program {
public:
    // Starts the program; its standard output comes here, its standard error goes nowhere.
    running_program(const std::string& path, const std::vector<std::string>& arguments);
    // Ends it if it still runs.
    ~running_program();
    running_program(const running_program&) = delete;
    running_program& operator=(const running_program&) = delete;

    // Reads on until the output holds the text; false if it ends, or 10 seconds pass, before.
    bool wait_for(const std::string& text);

    void send_interrupt() const;

    // Reads the rest of the output and waits for the end. The exit status; 128 + the signal if one
    // ended it.
    int finish();

    // All output so far.
    [[nodiscard]] const std::string& out() const { return out_; }

    // Processor time that the program used, in seconds, once it has ended.
    [[nodiscard]] double processor_time() const { return processor_time_; }

private:
    bool read_more();

    pid_t child_ = -1;
    int output_ = -1;
    std::string out_;
    double processor_time_ = 0;
};

}  // namespace tests
