// A payload that parse_payload accepts is wholly described by its values. The input is words, one
// to a line, after a byte that gives the position to begin at.
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "fuzz/support/command_line.h"
#include "fuzz/support/harness.h"
#include "nrxctl/base/payload.h"

namespace {

std::size_t width_of(std::string_view word) {
    if (word == "u16") return 2;
    return word == "u32" ? 4 : 1;
}

// The payload as words: the width, then each value in decimal.
fuzz::command_line written(const std::vector<std::uint8_t>& payload, std::size_t width) {
    std::vector<std::string> words{"u" + std::to_string(8 * width)};
    for (std::size_t offset = 0; offset < payload.size(); offset += width) {
        std::uint32_t value = 0;
        for (std::size_t i = width; i-- > 0;) {
            value = value << 8 | payload[offset + i];
        }
        words.push_back("0d" + std::to_string(value));
    }
    return fuzz::command_line(std::move(words));
}

void check_payload(const fuzz::command_line& line, int first, int position,
                   const std::vector<std::uint8_t>& payload) {
    if (first >= line.count()) {
        fuzz::require(position == first && payload.empty());
        return;
    }
    const auto head = line.word(first);
    const auto width = width_of(head);
    const bool named = width > 1 || head == "u8";
    const auto values = position - first - (named ? 1 : 0);
    fuzz::require(values >= 0 && position <= line.count());
    fuzz::require(position == line.count() || line.word(position).starts_with('-'));
    fuzz::require(payload.size() == static_cast<std::size_t>(values) * width);

    const auto again = written(payload, width);
    std::vector<std::uint8_t> same;
    int end = 0;
    fuzz::require(fuzz::completes([&] { nrx::parse_payload(again.words(), end, same); }));
    fuzz::require(end == again.count() && same == payload);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) return 0;
    const fuzz::command_line line = fuzz::words_of(fuzz::as_text(data + 1, size - 1));
    const int first = data[0] % 4;
    int position = first;
    std::vector<std::uint8_t> payload{0xee};  // what was there before must go
    if (fuzz::completes([&] { nrx::parse_payload(line.words(), position, payload); })) {
        check_payload(line, first, position, payload);
    }
    return 0;
}
