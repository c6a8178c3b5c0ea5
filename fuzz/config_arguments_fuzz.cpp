// Configuration arguments, one per line. A valid argument gives one record per component, an
// invalid one keeps the records before it, and the process does not end.
#include <cstddef>
#include <cstdint>
#include <string_view>
#include <vector>

#include "fuzz/support/argument_list.h"
#include "fuzz/support/harness.h"
#include "nrxctl/base/end_process.h"
#include "nrxctl/profiler/config_parser.h"

namespace {

using config_list = std::vector<nrx::profiler_config>;

struct parse_result {
    bool completed = false;
    bool valid = false;
    config_list configs;
};

parse_result parse(std::string_view argument) {
    parse_result result;
    result.completed = nrx::run_to_completion(
        [&] { result.valid = nrx::parse_profiler_config(argument, result.configs); });
    return result;
}

void check_argument(std::string_view argument, const parse_result& result) {
    const auto fields = nrx::split(argument, ':');
    const auto* profiler = fields.empty() ? nullptr : nrx::find_profiler_grammar(fields[0]);
    if (result.completed && result.valid) {
        fuzz::require(fields.size() >= 2 && fields.size() <= 4 && profiler != nullptr);
        fuzz::require(result.configs.size() == nrx::split(fields[1], ',').size());
    }
    for (const nrx::profiler_config& config : result.configs) {
        fuzz::require(profiler != nullptr && config.profiler == profiler->number);
        fuzz::require(config.state <= nrx::profiler_state::stop);
        fuzz::require(config.state != nrx::profiler_state::stop || config.component == 0);
        nrx::print_profiler_config(config);
    }
    const auto bytes = nrx::encode_configs(result.configs);
    fuzz::require(bytes.size() == result.configs.size() * nrx::profiler_config::wire_size);
    fuzz::require(nrx::encode_configs(nrx::decode_configs(bytes)) == bytes);
}

// Parsing all arguments together must give the records of each, up to the first invalid one.
void check_arguments(const fuzz::argument_list& list) {
    config_list expected;
    bool all_valid = true;
    for (const std::string_view argument : list.arguments()) {
        if (!all_valid) break;
        const parse_result result = parse(argument);
        check_argument(argument, result);
        expected.insert(expected.end(), result.configs.begin(), result.configs.end());
        all_valid = result.completed && result.valid;
    }
    int index = 0;
    nrx::argument_cursor arguments(list.arguments(), index);
    config_list configs;
    bool valid = false;
    const bool completed =
        nrx::run_to_completion([&] { valid = nrx::parse_profiler_configs(arguments, configs); });
    fuzz::require((completed && valid) == all_valid);
    fuzz::require(nrx::encode_configs(configs) == nrx::encode_configs(expected));
    fuzz::require(index <= list.count());
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    check_arguments(fuzz::split_arguments(fuzz::as_text(data, size)));
    return 0;
}
