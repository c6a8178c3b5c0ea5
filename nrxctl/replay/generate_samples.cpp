#include "nrxctl/replay/generate_samples.h"

#include <string>

#include "nrxctl/base/check.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/replay/virtual_event.h"

namespace nrx {

namespace {

constexpr std::size_t unit_length = 2;
constexpr std::uint32_t microseconds_per_second = 1'000'000;

bool is_frequency(std::string_view argument) {
    return argument.size() > unit_length && (argument.ends_with("hz") || argument.ends_with("Hz"));
}

// Returns the number of samples in one period. Returns nullopt with a failure report if there is no
// period or no sample in it; an interval of 0 has none.
std::optional<std::uint32_t> samples_per_period(std::string_view argument, std::uint32_t interval) {
    argument.remove_suffix(unit_length);
    const std::uint32_t hz = parse_low_32_bits(argument, "invalid frequency");
    if (!check(hz, "hz")) return std::nullopt;
    const std::uint32_t product = hz * interval;
    const std::uint32_t num_samples = product == 0 ? 0 : microseconds_per_second / product;
    if (!check(num_samples, "num_samples")) return std::nullopt;
    return num_samples;
}

// All sample lines leave here. Returns false if the line could not be written.
bool write_sample(std::string line) {
    return write_output(line.append("\n"));
}

}  // namespace

std::optional<signal_request> read_signal_request(argument_cursor& arguments) {
    if (!check(arguments.remaining() >= 4, "argc >= optind+4")) return std::nullopt;
    signal_request request{};
    request.service = *arguments.next();
    request.signal_type = *arguments.next();
    request.interval = parse_low_32_bits(*arguments.next(), "invalid interval");
    const std::string_view count = *arguments.next();
    if (!is_frequency(count)) {
        request.samples = parse_low_32_bits(count, "invalid number of samples");
        return request;
    }
    const auto samples = samples_per_period(count, request.interval);
    if (!samples) return std::nullopt;
    request.samples = *samples;
    return request;
}

void generate_samples(const signal_request& request) {
    const event_ptr event = make_event(request.service);
    if (!event) {
        print_line(text_line().text("invalid service ").text(request.service).view());
        return;
    }
    if (!event->init_generator(request.signal_type)) {
        print_line(text_line().text("invalid generator ").text(request.signal_type).view());
        return;
    }
    const block_output blocks;
    for (std::uint32_t i = 0; i < request.samples; ++i) {
        if (!write_sample(event->generate(request.signal_type, request.interval, request.samples)))
            return;
    }
}

void replay::generate(argument_cursor& arguments) {
    if (const auto request = read_signal_request(arguments)) generate_samples(*request);
}

}  // namespace nrx
