#include "nrxctl/options/service_options.h"

#include <limits>
#include <vector>

#include "nrxctl/nrxtoollib.h"

namespace nrx::nrxctl {

namespace {

constexpr std::size_t usual_report_capacity = 65'536;
constexpr std::size_t largest_report_capacity = 1 << 20;

std::uint32_t parse_report_id(std::string_view word) {
    return parse_number_up_to(std::numeric_limits<std::uint8_t>::max(), word,
                              "report id is invalid");
}

}  // namespace

outcome list(const option_words& /*words*/) {
    return outcome_of(list_services());
}

outcome read_report(const option_words& words) {
    const auto id_word = words.take();
    if (!id_word) return outcome::misused;
    const std::uint32_t id = parse_report_id(*id_word);
    std::size_t capacity = usual_report_capacity;
    if (const auto word = words.take()) {
        capacity = parse_number_up_to(largest_report_capacity, *word, "capacity is invalid");
    }
    std::vector<std::uint8_t> buffer(capacity);
    platform::byte_span report = buffer;
    const platform::return_code result = get_report(words.argument, id, report);
    if (result != platform::success) return outcome::failed;
    print_report(words.argument, static_cast<std::int32_t>(id), report);
    return outcome::done;
}

outcome write_report(const option_words& words) {
    const auto id_word = words.take();
    if (!id_word) return outcome::misused;
    const std::uint32_t id = parse_report_id(*id_word);
    std::vector<std::uint8_t> payload;
    parse_payload(words.all, words.index, payload);
    if (payload.empty()) return outcome::misused;
    return outcome_of(set_report(words.argument, id, payload));
}

outcome run_command(const option_words& words) {
    const auto code_word = words.take();
    if (!code_word) return outcome::misused;
    const std::uint32_t code = parse_number_up_to(std::numeric_limits<std::uint32_t>::max(),
                                                  *code_word, "command code is invalid");
    std::vector<std::uint8_t> payload;
    parse_payload(words.all, words.index, payload);
    std::vector<std::uint8_t> buffer(usual_report_capacity);
    platform::byte_span reply = buffer;
    const platform::return_code result = send_command(words.argument, code, payload, reply);
    if (result == platform::success) hex_dump(reply);
    return outcome_of(result);
}

}  // namespace nrx::nrxctl
