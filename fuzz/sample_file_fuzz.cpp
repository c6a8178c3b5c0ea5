// Arbitrary bytes as a file of samples. The samples must be grouped by service, in order, with
// deltas that lead from one to the next, and the same as a plain reading line by line gives.
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <unistd.h>

#include "fuzz/support/harness.h"
#include "nrxctl/base/end_process.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/replay/sample_file.h"

namespace {

std::uint32_t word_at(const nrx::VirtualEvent& event, std::size_t offset) {
    return nrx::load_le<std::uint32_t>(event.data() + offset);
}

// A file that is refilled for each input. A failed run leaves it behind.
class temporary_file {
public:
    temporary_file() : file_(::mkstemp(path_.data())) { fuzz::require(file_ >= 0); }
    ~temporary_file() {
        ::close(file_);
        ::unlink(path_.c_str());
    }
    temporary_file(const temporary_file&) = delete;
    temporary_file& operator=(const temporary_file&) = delete;

    void fill(const std::uint8_t* data, std::size_t size) const {
        fuzz::require(::pwrite(file_, data, size, 0) == static_cast<ssize_t>(size));
        fuzz::require(::ftruncate(file_, static_cast<off_t>(size)) == 0);
    }
    [[nodiscard]] const std::string& path() const { return path_; }

private:
    std::string path_ = std::filesystem::temp_directory_path() / "samples-XXXXXX";
    int file_;
};

std::optional<nrx::sample_groups> read(const std::string& path) {
    std::optional<nrx::sample_groups> groups;
    nrx::run_to_completion([&] { groups = nrx::read_sample_file(path); });
    return groups;
}

// Starting from the base time, the deltas must add up to the timestamps.
void check_list(const std::string& name, const nrx::event_list& events, std::uint64_t base) {
    fuzz::require(!events.empty());
    std::uint64_t previous = base;
    for (const auto& event : events) {
        fuzz::require(event->name() == name);
        fuzz::require(event->size() == (name == "pressure" ? 20U : 28U));
        fuzz::require(word_at(*event, 0) == event->size());
        fuzz::require(event->timestamp() >= previous);
        fuzz::require(word_at(*event, 4) ==
                      static_cast<std::uint32_t>(event->timestamp() - previous));
        previous = event->timestamp();
    }
}

// Reads the samples line by line: no buffer, no pattern, no deltas.
std::optional<nrx::sample_groups> read_plainly(std::string_view text) {
    nrx::sample_groups groups;
    while (!text.empty()) {
        const std::string_view text_of_line = text.substr(0, text.find('\n'));
        text.remove_prefix(std::min(text.size(), text_of_line.size() + 1));
        nrx::sample_line line;
        if (!nrx::split_sample_line(text_of_line, line)) return std::nullopt;
        auto event = nrx::is_skipped(line.tag) ? nullptr : nrx::make_event(line.tag);
        if (!event) continue;
        if (!nrx::run_to_completion([&] { event->parse(line.values); })) return std::nullopt;
        groups[event->name()].push_back(std::move(event));
    }
    for (auto& [name, events] : groups)
        std::stable_sort(events.begin(), events.end(), [](const auto& a, const auto& b) {
            return a->timestamp() < b->timestamp();
        });
    return groups;
}

// Compressed and binary files are refused although they may hold valid lines.
bool begins_as_text(std::string_view text) {
    constexpr std::size_t header_size = 512;
    constexpr std::string_view magic_beginnings =
        "\x1f"
        "BP(\xfd";
    return text.substr(0, header_size).find('\0') == std::string_view::npos &&
           (text.empty() || magic_beginnings.find(text.front()) == std::string_view::npos);
}

// Equal but for the delta, which is the second word.
bool is_same_event(const nrx::event_ptr& event, const nrx::event_ptr& other) {
    return event->timestamp() == other->timestamp() && event->size() == other->size() &&
           word_at(*event, 0) == word_at(*other, 0) &&
           std::equal(event->data() + 8, event->data() + event->size(), other->data() + 8);
}

void check_same_events(const nrx::sample_groups& groups, const nrx::sample_groups& expected) {
    fuzz::require(groups.size() == expected.size());
    for (const auto& [name, events] : groups) {
        const auto match = expected.find(name);
        fuzz::require(match != expected.end() &&
                      std::equal(events.begin(), events.end(), match->second.begin(),
                                 match->second.end(), is_same_event));
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const temporary_file file;
    file.fill(data, size);
    const auto groups = read(file.path());
    const auto expected = read_plainly(fuzz::as_text(data, size));
    if (!groups) {
        fuzz::require(!expected || !begins_as_text(fuzz::as_text(data, size)));
        return 0;
    }
    fuzz::require(expected.has_value());
    check_same_events(*groups, *expected);
    std::uint64_t base = UINT64_MAX;
    for (const auto& [name, events] : *groups)
        base = std::min(base, events.front()->timestamp());
    for (const auto& [name, events] : *groups)
        check_list(name, events, base);
    return 0;
}
