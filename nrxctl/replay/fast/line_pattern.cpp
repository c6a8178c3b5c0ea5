#include "nrxctl/replay/fast/line_pattern.h"

#include <algorithm>
#include <bit>

namespace nrx {

namespace {

// Returns the positions, among sixteen bytes, of those that cannot be part of a value.
std::uint32_t find_delimiters(const char* text) {
    return simd16(text).find(',', '=', '\n');
}

}  // namespace

void length_hint::assign(std::size_t length) {
    *this = {};
    if (length >= simd16::size) return;
    length_ = length;
    delimiter_ = std::uint32_t{1} << length;
    mask_ = delimiter_ | (delimiter_ - 1);
}

bool length_hint::matches(const char* value) const {
    return (find_delimiters(value) & mask_) == delimiter_;
}

bool line_pattern::token::assign(std::string_view name, char terminator) {
    if (name.size() >= text_.size()) return false;
    std::copy(name.begin(), name.end(), text_.begin());
    text_.at(name.size()) = terminator;
    size_ = name.size() + 1;
    mask_ = (std::uint32_t{1} << size_) - 1;
    return true;
}

void line_pattern::learn(std::string_view line) {
    fields_.clear();
    values_.clear();
    std::size_t end = line.find(',');
    if (end == std::string_view::npos || !tag_.assign(line.substr(0, end), ',')) return;
    // No field follows a comma at the very end.
    while (end + 1 < line.size()) {
        const std::size_t begin = end + 1;
        end = std::min(line.find(',', begin), line.size());
        const std::string_view key = line.substr(begin, line.find('=', begin) - begin);
        field& added = fields_.emplace_back();
        added.known_key = find_sample_key(key);
        if (!added.key.assign(key, '=')) return fields_.clear();
    }
    if (!fields_.empty()) fields_.back().terminator = '\n';
}

// Returns the length of the value at the front of the text and makes it the next hint. Returns 0 if
// the value is empty or does not end as expected.
std::size_t line_pattern::match_value(field& expected, std::string_view text) {
    for (std::size_t begin = 0; text.size() - begin >= simd16::size; begin += simd16::size) {
        const std::uint32_t delimiters = find_delimiters(text.data() + begin);
        if (delimiters == 0) continue;
        const std::size_t length = begin + static_cast<std::size_t>(std::countr_zero(delimiters));
        if (length == 0 || text[length] != expected.terminator) return 0;
        expected.hint.assign(length);
        return length;
    }
    return 0;
}

std::size_t line_pattern::match(std::string_view text) {
    // A field is compared before it is known to be there: up to sixteen bytes of its key, then
    // sixteen bytes of its value.
    constexpr std::size_t read_ahead = 2 * simd16::size;
    if (fields_.empty() || text.size() < read_ahead || !tag_.matches(text.data())) return 0;
    const char* position = text.data() + tag_.size();
    const char* const text_end = text.data() + text.size();
    const char* const last = text_end - read_ahead;
    for (field& expected : fields_) {
        if (position > last || !expected.key.matches(position)) return 0;
        const char* const value = position + expected.key.size();
        std::size_t length = expected.hint.length();
        if (!expected.hint.matches(value) || value[length] != expected.terminator) {
            length = match_value(expected, {value, text_end});
            if (length == 0) return 0;
        }
        if (expected.known_key) values_.set(*expected.known_key, {value, length});
        position = value + length + 1;
    }
    return static_cast<std::size_t>(position - text.data());
}

}  // namespace nrx
