// The words behind "generate", one to a line. What they ask for is generated, up to a number of
// samples, and each line reads back as the sample that it stands for.
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>

#include "fuzz/support/command_line.h"
#include "fuzz/support/harness.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/replay/make_event.h"
#include "nrxctl/replay/sample_line.h"
#include "nrxctl/replay/signal_request.h"

namespace {

constexpr std::uint32_t most_samples = 64;

std::optional<nrx::signal_request> read(const fuzz::command_line& line) {
    int index = 0;
    nrx::argument_words left(line.words(), index);
    std::optional<nrx::signal_request> request;
    fuzz::completes([&] { request = nrx::read_signal_request(left); });
    fuzz::require(!request || index == 4);
    return request;
}

void check_line(const std::string& line, const nrx::signal_request& request, std::uint32_t number) {
    nrx::sample_line split;
    fuzz::require(nrx::split_sample_line(line, split) && split.tag == request.service);
    const auto event = nrx::make_event(split.tag);
    fuzz::require(fuzz::completes([&] { event->parse(split.values); }));
    fuzz::require(nrx::load_le<std::uint32_t>(event->data() + 8) == number);
    const auto value = nrx::load_le<std::int32_t>(event->data() + 16);
    fuzz::require(value >= -0x10000 && value <= 0x10000);
    // Time stamps of lines have 32 bits.
    fuzz::require(static_cast<std::uint32_t>(event->timestamp()) == number * request.interval);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const fuzz::command_line line = fuzz::words_of(fuzz::as_text(data, size));
    auto request = read(line);
    if (!request) return 0;
    request->samples = std::min(request->samples, most_samples);
    nrx::generate_samples(*request);
    const auto event = nrx::make_event(request->service);
    if (!event || !event->init_generator(request->signal_type)) return 0;
    for (std::uint32_t i = 0; i < request->samples; ++i)
        check_line(event->generate(request->signal_type, request->interval, request->samples),
                   *request, i);
    return 0;
}
