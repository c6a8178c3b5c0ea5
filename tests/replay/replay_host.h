// A host with the replay application and the services that play samples back, and files to load.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "tests/support/device_test.h"
#include "tests/support/report_bytes.h"
#include "tests/support/rows.h"

namespace tests {

using lines = std::vector<std::string>;

// A file for as long as this object lives.
class sample_text_file {
public:
    explicit sample_text_file(std::string_view text);
    ~sample_text_file();
    sample_text_file(const sample_text_file&) = delete;
    sample_text_file& operator=(const sample_text_file&) = delete;

    [[nodiscard]] const std::string& path() const { return path_; }

private:
    std::string path_;
};

// Registers accel (id 0x10), gyro (0x11), compass (0x04030201), pressure (0x13) and NRXApp (0x51)
// with its client; the driver of NRXApp's reports. No service has samples.
interface_driver& put_replay_services(machine& host);

// Runs a subcommand as the command line gives it; how many further words it took.
int run_replay(lines words);

// The same, with what it wrote; how many further words it took, if asked.
outcome replay(const lines& words, int* taken = nullptr);

// Runs a subcommand that writes this on standard output and these failure reports.
void says(const lines& words, const std::string& out, const std::string& reports = "");

class replay_test : public device_test {
protected:
    void SetUp() override;

    // Loads a file with this text, and further words behind it; taken is then how many of all words
    // it took.
    outcome load(std::string_view text, lines further = {});
    int taken = 0;

    // The same, where this is written.
    void load_says(std::string_view text, const std::string& out, const std::string& reports = "");

    // Lets the application answer with these states, and take any.
    void answer_with(const byte_list& report);

    // The method calls since the last time, in the words of the log, without what they all end
    // with.
    lines calls();

    interface_driver* app = nullptr;

private:
    std::size_t seen_ = 0;
};

// The failure report of a service that is not there.
inline const std::string no_such_service =
    failed("base/service_discovery.cpp", "service != ((io_object_t) 0)");

// Reading the states, in the words of the log.
inline constexpr const char* read_state = "call NRXApp 2 scalars [0x47] in [] results 0 room 384";

}  // namespace tests
