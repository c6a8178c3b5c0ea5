// A payload that parse_payload accepts is wholly described by its values. The input is words, one
// to a line, after a byte that gives the position to begin at.
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "fuzz/support/harness.h"
#include "nrxctl/base/payload.h"

namespace {

// Words as a program receives them.
class command_line {
public:
    explicit command_line(std::vector<std::string> words) : words_(std::move(words)) {
        for (std::string& word : words_) {
            pointers_.push_back(word.data());
        }
    }

    [[nodiscard]] std::span<char* const> words() const { return pointers_; }
    [[nodiscard]] int count() const { return static_cast<int>(words_.size()); }
    [[nodiscard]] std::string_view word(int position) const {
        return position < count() ? words_[static_cast<std::size_t>(position)] : std::string_view{};
    }

private:
    std::vector<std::string> words_;
    std::vector<char*> pointers_;
};

std::vector<std::string> lines_of(std::string_view text) {
    std::vector<std::string> lines;
    while (!text.empty()) {
        const auto length = std::min(text.find('\n'), text.size());
        // A NUL ends a word wherever it stands.
        lines.emplace_back(std::string(text.substr(0, length)).c_str());
        text.remove_prefix(std::min(length + 1, text.size()));
    }
    return lines;
}

std::size_t width_of(std::string_view word) {
    if (word == "u16") return 2;
    return word == "u32" ? 4 : 1;
}

// The payload as words: the width, then each value in decimal.
command_line written(const std::vector<std::uint8_t>& payload, std::size_t width) {
    std::vector<std::string> words{"u" + std::to_string(8 * width)};
    for (std::size_t offset = 0; offset < payload.size(); offset += width) {
        std::uint32_t value = 0;
        for (std::size_t i = width; i-- > 0;) {
            value = value << 8 | payload[offset + i];
        }
        words.push_back("0d" + std::to_string(value));
    }
    return command_line(std::move(words));
}

void check_payload(const command_line& line, int first, int position,
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
    const command_line line(lines_of(fuzz::as_text(data + 1, size - 1)));
    const int first = data[0] % 4;
    int position = first;
    std::vector<std::uint8_t> payload{0xee};  // what was there before must go
    if (fuzz::completes([&] { nrx::parse_payload(line.words(), position, payload); })) {
        check_payload(line, first, position, payload);
    }
    return 0;
}
