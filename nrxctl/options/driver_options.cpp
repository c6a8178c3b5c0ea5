#include "nrxctl/options/driver_options.h"

#include <vector>

#include "nrxctl/nrxtoollib.h"

namespace nrx::nrxctl {

namespace {

constexpr std::size_t reply_capacity = 65'536;

}  // namespace

outcome call_scalar(const option_words& words) {
    std::vector<std::uint64_t> scalars;
    while (const auto word = words.take()) {
        const std::int64_t scalar = parse_number(*word, "scalar is invalid");
        if (scalar < 0) refuse_word("scalar is invalid", *word);
        scalars.push_back(static_cast<std::uint64_t>(scalar));
    }
    return outcome_of(call_scalar_method(words.argument, scalars));
}

outcome get_property(const option_words& words) {
    const auto name = words.take();
    if (!name) return outcome::misused;
    std::vector<std::uint8_t> buffer(reply_capacity);
    platform::byte_span value = buffer;
    const platform::return_code result = get_named_property(words.argument, *name, value);
    if (result == platform::success) hex_dump(value);
    return outcome_of(result);
}

outcome set_property(const option_words& words) {
    const auto name = words.take();
    if (!name) return outcome::misused;
    std::vector<std::uint8_t> value;
    parse_payload(words.all, words.index, value);
    if (value.empty()) return outcome::misused;
    return outcome_of(set_named_property(words.argument, *name, value));
}

outcome ask_hid_driver(const option_words& words) {
    std::vector<std::uint8_t> input;
    parse_payload(words.all, words.index, input);
    if (input.empty()) return outcome::misused;
    std::vector<std::uint8_t> buffer(reply_capacity);
    platform::byte_span output = buffer;
    const platform::return_code result = call_hid_driver(input, output);
    if (result == platform::success) hex_dump(output);
    return outcome_of(result);
}

outcome turn_mca(const option_words& words) {
    if (words.argument != "on" && words.argument != "off")
        refuse_word("mca is neither on nor off", words.argument);
    return outcome_of(switch_mca(words.argument == "on"));
}

}  // namespace nrx::nrxctl
