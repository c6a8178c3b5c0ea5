#include "nrxctl/replay/generate_samples.h"

#include <string>
#include <vector>

#include "nrxctl/base/check.h"
#include "nrxctl/base/explanation.h"
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

std::string_view without_unit(std::string_view argument) {
    if (is_frequency(argument)) argument.remove_suffix(unit_length);
    return argument;
}

// Returns true if an argument is a number that is not used as it is, with an explanation.
bool drops_bits(std::string_view argument) {
    return read_number(argument) && !check_32_bit_number(argument);
}

explanation no_sample_in_period() {
    return {"a period contains no sample", "expected a shorter interval or a lower frequency"};
}

// Returns true if a period contains a sample, also if more than 32 bits are used to compute it.
bool has_whole_period(std::string_view interval, std::string_view hz) {
    const auto product = static_cast<std::uint64_t>(*read_number(interval)) *
                         static_cast<std::uint64_t>(*read_number(hz));
    if (product <= microseconds_per_second) return true;
    explain(no_sample_in_period);
    return false;
}

// Returns the number of samples in one period. Returns nullopt with a failure report if there is no
// period or no sample in it; an interval of 0 has none.
std::optional<std::uint32_t> samples_per_period(std::string_view argument, std::uint32_t interval) {
    const std::uint32_t hz = parse_low_32_bits(without_unit(argument), "invalid frequency");
    if (!check_explained(hz, "hz", [] {
            return explanation{"the frequency is 0", "expected at least 1hz"};
        })) {
        return std::nullopt;
    }
    const std::uint32_t product = hz * interval;
    const std::uint32_t num_samples = product == 0 ? 0 : microseconds_per_second / product;
    if (!check_explained(num_samples, "num_samples", no_sample_in_period)) return std::nullopt;
    return num_samples;
}

std::vector<std::string_view> generating_tags() {
    auto tags = event_tags();
    std::erase_if(tags,
                  [](std::string_view tag) { return make_event(tag)->signal_types().empty(); });
    return tags;
}

explanation unknown_signal(const VirtualEvent& event, std::string_view signal_type) {
    const auto keywords = event.signal_types();
    if (!keywords.empty()) return unknown_keyword("signal", signal_type, "expected", keywords);
    return unknown_keyword("generator", event.name(), "expected", generating_tags());
}

// Returns a generator of the requested signal, or null after a message if there is none.
event_ptr make_generator(const signal_request& request) {
    event_ptr event = make_event(request.service);
    if (!event) {
        print_failure(text_line().text("invalid service ").text(request.service).view());
        explain([&] {
            return unknown_keyword("generator", request.service, "expected", generating_tags());
        });
        return nullptr;
    }
    if (!event->init_generator(request.signal_type)) {
        print_failure(text_line().text("invalid generator ").text(request.signal_type).view());
        explain([&] { return unknown_signal(*event, request.signal_type); });
        return nullptr;
    }
    return event;
}

}  // namespace

std::optional<signal_request> read_signal_request(argument_cursor& arguments) {
    if (!check_explained(arguments.remaining() >= 4, "argc >= optind+4", [] {
            return explanation{"generate needs SERVICE SIGNAL INTERVAL COUNT|FREQUENCYhz"};
        })) {
        return std::nullopt;
    }
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
    const event_ptr event = make_generator(request);
    if (!event) return;
    const block_output blocks;
    for (std::uint32_t i = 0; i < request.samples; ++i) {
        std::string line = event->generate(request.signal_type, request.interval, request.samples);
        if (!write_output(line.append("\n"))) return;
    }
}

namespace replay {

void generate(argument_cursor& arguments) {
    if (const auto request = read_signal_request(arguments)) generate_samples(*request);
}

arguments_check check_generate(argument_cursor& arguments) {
    const auto interval = arguments.peek(2);
    const auto count = arguments.peek(3);
    if (count && (drops_bits(*interval) || drops_bits(without_unit(*count))))
        return arguments_check::usage_error;
    const auto request = read_signal_request(arguments);
    if (!request || !make_generator(*request)) return arguments_check::refused;
    return is_frequency(*count) && !has_whole_period(*interval, without_unit(*count))
               ? arguments_check::usage_error
               : arguments_check::accepted;
}

}  // namespace replay

}  // namespace nrx
