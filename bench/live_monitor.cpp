// live_monitor SECONDS: monitors the virtual profiler at 10,000 records a second, as text and in
// real time, and prints the share of a core that this uses, as a row of the table of scripts/bench.
#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <string>
#include <sys/resource.h>
#include <unistd.h>

#include "nrxctl/base/clock_references.h"
#include "nrxctl/profiler/profile_command.h"
#include "platform/clock.h"
#include "platform/virtual/current_machine.h"
#include "platform/virtual/interface_driver.h"
#include "platform/virtual/profiler/profiler.h"
#include "platform/virtual/wrist/parts.h"

namespace {

constexpr std::uint32_t records_per_second = 10'000;
constexpr double budget_percent = 5;

double seconds(const timeval& time) {
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) / 1e6;
}

double processor_seconds() {
    rusage usage{};
    ::getrusage(RUSAGE_SELF, &usage);
    return seconds(usage.ru_utime) + seconds(usage.ru_stime);
}

// Runs the monitor with standard output redirected to /dev/null.
void monitor(std::string milliseconds) {
    std::string config = "sensor:accel,gyro:data,lat";
    char* const arguments[]{milliseconds.data(), config.data()};
    const int output = ::dup(STDOUT_FILENO);
    ::dup2(::open("/dev/null", O_WRONLY | O_CLOEXEC), STDOUT_FILENO);
    int index = 0;
    nrx::profile_command("human", arguments, index);
    ::dup2(output, STDOUT_FILENO);
}

}  // namespace

int main(int argc, char** argv) {
    const int duration = argc > 1 ? std::atoi(argv[1]) : 1;
    platform::simulated::machine host;
    host.clock().follow_host();
    platform::simulated::add_interface_services(host);
    platform::simulated::add_clocks(host);
    platform::simulated::add_profiler(host, records_per_second);
    const platform::simulated::installed_machine installed(host);
    nrx::tick_period = platform::tick_period();
    const double before = processor_seconds();
    monitor(std::to_string(duration * 1000));
    const double percent = (processor_seconds() - before) / duration * 100;
    std::printf("%-42s %8.2f %% of a core, budget %.0f %%%s\n", "live monitor, 10,000 records/s",
                percent, budget_percent, percent > budget_percent ? " over" : "");
    return EXIT_SUCCESS;
}
