#include "nrxctl/replay/signal_request.h"

#include <string>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/numbers.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/replay/make_event.h"

namespace nrx {

namespace {

constexpr std::size_t unit_length = 2;
constexpr std::uint32_t microseconds_per_second = 1'000'000;

bool is_frequency(std::string_view word) {
    return word.size() > unit_length && (word.ends_with("hz") || word.ends_with("Hz"));
}

// How many samples there are in one period. None, with a failure report, if there is no period, or
// no sample in it; an interval of 0 is one of these.
std::optional<std::uint32_t> samples_per_period(std::string_view word, std::uint32_t interval) {
    const std::uint32_t hz =
        parse_low_32_bits(word.substr(0, word.size() - unit_length), "invalid frequency");
    if (!check(hz, "hz")) return std::nullopt;
    const std::uint32_t product = hz * interval;
    const std::uint32_t num_samples = product == 0 ? 0 : microseconds_per_second / product;
    if (!check(num_samples, "num_samples")) return std::nullopt;
    return num_samples;
}

void print_refusal(std::string_view what, std::string_view word) {
    print_line(text_line().text(what).text(" ").text(word).view());
}

}  // namespace

std::optional<signal_request> read_signal_request(argument_words& words) {
    if (!check(words.left() >= 4, "argc >= optind+4")) return std::nullopt;
    const std::string_view service = *words.take();
    const std::string_view signal_type = *words.take();
    const std::string_view interval_word = *words.take();
    const std::string_view count_word = *words.take();
    signal_request request{service, signal_type,
                           parse_low_32_bits(interval_word, "invalid interval"), 0};
    if (!is_frequency(count_word)) {
        request.samples = parse_low_32_bits(count_word, "invalid number of samples");
        return request;
    }
    const auto samples = samples_per_period(count_word, request.interval);
    if (!samples) return std::nullopt;
    request.samples = *samples;
    return request;
}

void generate_samples(const signal_request& request) {
    const event_ptr event = make_event(request.service);
    if (!event) {
        print_refusal("invalid service", request.service);
        return;
    }
    if (!event->init_generator(request.signal_type)) {
        print_refusal("invalid generator", request.signal_type);
        return;
    }
    for (std::uint32_t i = 0; i < request.samples; ++i) {
        std::string line = event->generate(request.signal_type, request.interval, request.samples);
        if (!write_output(line.append("\n"))) return;
    }
}

}  // namespace nrx
