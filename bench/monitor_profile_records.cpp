// monitor_profile_records FILE: prints the event records of a file as text, through the profiler's
// monitor. A driver delivers them in its queue, followed by the end marker. Time is simulated, so
// waiting costs nothing.
#include <array>
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <utility>

#include "nrxctl/base/clock_references.h"
#include "nrxctl/decoders/record_text.h"
#include "nrxctl/profiler/monitor.h"
#include "platform/clock.h"
#include "platform/virtual/current_machine.h"
#include "platform/virtual/wrist/parts.h"

namespace {

using platform::simulated::shared_queue;

using open_file = std::unique_ptr<std::FILE, int (*)(std::FILE*)>;

// A queue that refills itself from a file when the tool has consumed its records.
class file_queue final : public shared_queue {
public:
    explicit file_queue(open_file file) : file_(std::move(file)) {}

    void catch_up() override {
        if (!empty()) return;
        const std::size_t records =
            std::fread(buffer_.data(), nrx::profile_record_size, buffer_.size(), file_.get());
        for (std::size_t i = 0; i < records; ++i)
            add(buffer_[i]);
        if (records == 0) add(nrx::profile_record{}.bytes);
    }

private:
    open_file file_;
    std::array<std::array<std::uint8_t, nrx::profile_record_size>, 1024> buffer_{};
};

class queue_driver final : public platform::simulated::driver {
public:
    explicit queue_driver(open_file file) : queue_(std::make_shared<file_queue>(std::move(file))) {}

    platform::return_code call(std::uint32_t /*selector*/, const platform::call_inputs& /*inputs*/,
                               platform::call_outputs& /*outputs*/) override {
        return platform::unsupported;
    }
    std::shared_ptr<shared_queue> memory(std::uint32_t /*type*/) override { return queue_; }
    std::shared_ptr<shared_queue> notification(std::uint32_t /*type*/) override { return queue_; }

private:
    std::shared_ptr<file_queue> queue_;
};

}  // namespace

int main(int argc, char** argv) {
    if (argc < 2) return EXIT_FAILURE;
    open_file file(std::fopen(argv[1], "rb"), std::fclose);
    if (!file) return EXIT_FAILURE;
    platform::simulated::machine host;
    platform::simulated::add_clocks(host);
    host.add({.name = "KeltoNRXProfileDriver",
              .driver = std::make_shared<queue_driver>(std::move(file))});
    const platform::simulated::installed_machine installed(host);
    nrx::tick_period = platform::tick_period();
    return nrx::monitor_profiler(0, nrx::print_profile_record) ? EXIT_SUCCESS : EXIT_FAILURE;
}
