// Configuration words, one to a line. What is accepted is one whole record per component; what
// fails keeps what came before; the end of the process stays in the harness.
#include <cstddef>
#include <cstdint>
#include <string_view>
#include <vector>

#include "fuzz/support/command_line.h"
#include "fuzz/support/harness.h"
#include "nrxctl/profiler/config_grammar.h"
#include "nrxctl/profiler/config_printer.h"
#include "nrxctl/profiler/split.h"

namespace {

using config_list = std::vector<nrx::profiler_config>;

// What one word becomes.
struct parsed {
    bool completed = false;
    bool accepted = false;
    config_list configs;
};

parsed parse(std::string_view word) {
    parsed one;
    one.completed =
        fuzz::completes([&] { one.accepted = nrx::parse_profiler_config(word, one.configs); });
    return one;
}

void check_word(std::string_view word, const parsed& one) {
    const auto fields = nrx::split(word, ':');
    const auto* profiler = fields.empty() ? nullptr : nrx::find_profiler_grammar(fields[0]);
    if (one.completed && one.accepted) {
        fuzz::require(fields.size() >= 2 && fields.size() <= 4 && profiler != nullptr);
        fuzz::require(one.configs.size() == nrx::split(fields[1], ',').size());
    }
    for (const nrx::profiler_config& config : one.configs) {
        fuzz::require(profiler != nullptr && config.profiler == profiler->number);
        fuzz::require(config.state <= nrx::profiler_state::stop);
        fuzz::require(config.state != nrx::profiler_state::stop || config.component == 0);
        nrx::print_profiler_config(config);
    }
    const auto bytes = nrx::encode_configs(one.configs);
    fuzz::require(bytes.size() == one.configs.size() * nrx::profiler_config::wire_size);
    fuzz::require(nrx::encode_configs(nrx::decode_configs(bytes)) == bytes);
}

// All words together are the words one by one, up to the first that fails.
void check_words(const fuzz::command_line& line) {
    config_list expected;
    bool all = true;
    for (const std::string_view word : line.words()) {
        if (!all) break;
        const parsed one = parse(word);
        check_word(word, one);
        expected.insert(expected.end(), one.configs.begin(), one.configs.end());
        all = one.completed && one.accepted;
    }
    int index = 0;
    nrx::argument_words left(line.words(), index);
    config_list together;
    bool accepted = false;
    const bool completed =
        fuzz::completes([&] { accepted = nrx::parse_profiler_configs(left, together); });
    fuzz::require((completed && accepted) == all);
    fuzz::require(nrx::encode_configs(together) == nrx::encode_configs(expected));
    fuzz::require(index <= line.count());
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    check_words(fuzz::words_of(fuzz::as_text(data, size)));
    return 0;
}
