// Arbitrary arguments of "generate", one per line. The first samples that they request are
// generated, and each line must read back as the sample that it describes.
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>

#include "fuzz/support/argument_list.h"
#include "fuzz/support/harness.h"
#include "nrxctl/base/end_process.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/replay/generate_samples.h"
#include "nrxctl/replay/sample_line.h"
#include "nrxctl/replay/virtual_event.h"

namespace {

constexpr std::uint32_t max_samples = 64;

std::optional<nrx::signal_request> read_request(const fuzz::argument_list& list) {
    int index = 0;
    nrx::argument_cursor arguments(list.arguments(), index);
    std::optional<nrx::signal_request> request;
    nrx::run_to_completion([&] { request = nrx::read_signal_request(arguments); });
    fuzz::require(!request || index == 4);
    return request;
}

void check_line(const std::string& line, const nrx::signal_request& request, std::uint32_t number) {
    nrx::sample_line split;
    fuzz::require(nrx::split_sample_line(line, split) && split.tag == request.service);
    const auto event = nrx::make_event(split.tag);
    fuzz::require(nrx::run_to_completion([&] { event->parse(split.values); }));
    fuzz::require(nrx::load_le<std::uint32_t>(event->data() + 8) == number);
    const auto value = nrx::load_le<std::int32_t>(event->data() + 16);
    fuzz::require(value >= -0x10000 && value <= 0x10000);
    // An event keeps 32 bits of its timestamp.
    fuzz::require(static_cast<std::uint32_t>(event->timestamp()) == number * request.interval);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const fuzz::argument_list list = fuzz::split_arguments(fuzz::as_text(data, size));
    auto request = read_request(list);
    if (!request) return 0;
    request->samples = std::min(request->samples, max_samples);
    nrx::generate_samples(*request);
    const auto event = nrx::make_event(request->service);
    if (!event || !event->init_generator(request->signal_type)) return 0;
    for (std::uint32_t i = 0; i < request->samples; ++i)
        check_line(event->generate(request->signal_type, request->interval, request->samples),
                   *request, i);
    return 0;
}
