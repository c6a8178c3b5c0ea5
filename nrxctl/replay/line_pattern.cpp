#include "nrxctl/replay/line_pattern.h"

#include <algorithm>
#include <bit>

namespace nrx {

namespace {

// Which of sixteen bytes cannot be part of a value.
std::uint32_t find_ends(const char* place) {
    return sixteen_bytes(place).find(',', '=', '\n');
}

}  // namespace

bool line_pattern::short_text::assign(std::string_view name, char behind) {
    if (name.size() >= text_.size()) return false;
    std::copy(name.begin(), name.end(), text_.begin());
    text_[name.size()] = behind;
    size_ = name.size() + 1;
    mask_ = (std::uint32_t{1} << size_) - 1;
    return true;
}

void line_pattern::length_guess::assign(std::size_t length) {
    *this = {};
    if (length >= sixteen_bytes::size) return;
    length_ = length;
    end_ = std::uint32_t{1} << length;
    mask_ = end_ | (end_ - 1);
}

bool line_pattern::length_guess::holds(const char* value) const {
    return (find_ends(value) & mask_) == end_;
}

void line_pattern::learn(std::string_view line) {
    fields_.clear();
    values_.clear();
    std::size_t end = line.find(',');
    if (end == std::string_view::npos || !tag_.assign(line.substr(0, end), ',')) return;
    // A comma at the very end has no field behind it.
    while (end + 1 < line.size()) {
        const std::size_t begin = end + 1;
        end = std::min(line.find(',', begin), line.size());
        const std::string_view key = line.substr(begin, line.find('=', begin) - begin);
        field& added = fields_.emplace_back();
        added.known = find_sample_key(key);
        if (!added.key.assign(key, '=')) return fields_.clear();
    }
    if (!fields_.empty()) fields_.back().behind = '\n';
}

// The length of the value at the front of a text, which becomes the next guess; 0 if it is empty or
// does not end as expected.
std::size_t line_pattern::match_value(field& expected, std::string_view text) {
    for (std::size_t begin = 0; text.size() - begin >= sixteen_bytes::size;
         begin += sixteen_bytes::size) {
        const std::uint32_t ends = find_ends(text.data() + begin);
        if (ends == 0) continue;
        const std::size_t length = begin + static_cast<std::size_t>(std::countr_zero(ends));
        if (length == 0 || text[length] != expected.behind) return 0;
        expected.guess.assign(length);
        return length;
    }
    return 0;
}

std::size_t line_pattern::match(std::string_view text) {
    // Of each field, up to its key's end and sixteen bytes of its value are read before it is known
    // to be there.
    constexpr std::size_t read_ahead = 2 * sixteen_bytes::size;
    if (fields_.empty() || text.size() < read_ahead || !tag_.begins(text.data())) return 0;
    const char* place = text.data() + tag_.size();
    const char* const text_end = text.data() + text.size();
    const char* const last = text_end - read_ahead;
    for (field& expected : fields_) {
        if (place > last || !expected.key.begins(place)) return 0;
        const char* const value = place + expected.key.size();
        // Where the next field begins follows from the guess: the processor goes on there and need
        // not wait for the search, which takes three times as long.
        std::size_t length = expected.guess.length();
        if (!expected.guess.holds(value) || value[length] != expected.behind) {
            length = match_value(expected, {value, text_end});
            if (length == 0) return 0;
        }
        if (expected.known) values_.set(*expected.known, {value, length});
        place = value + length + 1;
    }
    return static_cast<std::size_t>(place - text.data());
}

}  // namespace nrx
