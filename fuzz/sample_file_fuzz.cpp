// Any bytes as a file of samples. What is read is grouped by service, in order, with deltas that
// lead from sample to sample; reading it twice gives the same.
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <sys/mman.h>
#include <unistd.h>
#include <vector>

#include "fuzz/support/harness.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/replay/sample_file.h"

namespace {

std::uint32_t word(const nrx::VirtualEvent& event, std::size_t offset) {
    return nrx::load_le<std::uint32_t>(event.data() + offset);
}

// A file in memory under a path, filled anew for each input.
class memory_file {
public:
    explicit memory_file(const char* name) : file_(::memfd_create(name, MFD_CLOEXEC)) {}
    ~memory_file() { ::close(file_); }
    memory_file(const memory_file&) = delete;
    memory_file& operator=(const memory_file&) = delete;

    void fill(const std::uint8_t* data, std::size_t size) const {
        fuzz::require(::ftruncate(file_, 0) == 0);
        fuzz::require(::pwrite(file_, data, size, 0) == static_cast<ssize_t>(size));
    }
    [[nodiscard]] std::string path() const { return "/proc/self/fd/" + std::to_string(file_); }

private:
    int file_;
};

std::optional<nrx::sample_groups> read(const std::string& path) {
    std::optional<nrx::sample_groups> groups;
    fuzz::completes([&] { groups = nrx::read_sample_file(path); });
    return groups;
}

// From the base time on, the deltas add up to the time stamps.
void check_list(const std::string& name, const nrx::event_list& events, std::uint64_t base) {
    fuzz::require(!events.empty());
    std::uint64_t previous = base;
    for (const auto& event : events) {
        fuzz::require(event->name() == name);
        fuzz::require(event->size() == (name == "pressure" ? 20U : 28U));
        fuzz::require(word(*event, 0) == event->size());
        fuzz::require(event->timestamp() >= previous);
        fuzz::require(word(*event, 4) == static_cast<std::uint32_t>(event->timestamp() - previous));
        previous = event->timestamp();
    }
}

std::vector<std::uint8_t> records_of(const nrx::sample_groups& groups) {
    std::vector<std::uint8_t> records;
    for (const auto& [name, events] : groups) {
        for (const auto& event : events)
            records.insert(records.end(), event->data(), event->data() + event->size());
    }
    return records;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const memory_file file("samples");
    file.fill(data, size);
    const auto groups = read(file.path());
    if (!groups) return 0;
    std::uint64_t base = UINT64_MAX;
    std::size_t count = 0;
    for (const auto& [name, events] : *groups) {
        base = std::min(base, events.front()->timestamp());
        count += events.size();
    }
    for (const auto& [name, events] : *groups)
        check_list(name, events, base);
    fuzz::require(count <= 1 + static_cast<std::size_t>(std::count(data, data + size, '\n')));
    const auto again = read(file.path());
    fuzz::require(again && records_of(*again) == records_of(*groups));
    return 0;
}
