#include "nrxctl/replay/sample_line.h"

#include <algorithm>

namespace nrx {

namespace {

std::optional<sample_key> key_if(bool is_match, sample_key key) {
    return is_match ? std::optional(key) : std::nullopt;
}

std::optional<sample_key> find_axis(char name) {
    switch (name) {
        case 'x':
            return sample_key::x;
        case 'y':
            return sample_key::y;
        case 'z':
            return sample_key::z;
        case 'p':
            return sample_key::p;
        default:
            return std::nullopt;
    }
}

}  // namespace

// Selects by the length first: no two longer names have the same length.
std::optional<sample_key> find_sample_key(std::string_view name) {
    switch (name.size()) {
        case 1:
            return find_axis(name.front());
        case 5:
            return key_if(name == "shake", sample_key::shake);
        case 8:
            return key_if(name == "sampleid", sample_key::sampleid);
        case 9:
            return key_if(name == "timestamp", sample_key::timestamp);
        case 11:
            return key_if(name == "temperature", sample_key::temperature);
        default:
            return std::nullopt;
    }
}

std::string_view sample_key_name(sample_key key) {
    constexpr std::array<std::string_view, sample_key_count> names{
        "sampleid", "temperature", "x", "y", "z", "p", "timestamp", "shake"};
    return names[static_cast<std::size_t>(key)];
}

void sample_values::set(std::string_view key, std::string_view value) {
    if (const auto known_key = find_sample_key(key)) set(*known_key, value);
}

bool split_sample_line(std::string_view line, sample_line& split) {
    std::size_t begin = std::min(line.find(','), line.size());
    split.tag = line.substr(0, begin++);
    split.values.clear();
    // Each equals sign is searched for once: a sign found past the end of the current field is kept
    // for a later one.
    std::size_t equals_sign = line.find('=', begin);
    while (begin < line.size()) {
        const std::size_t end = std::min(line.find(',', begin), line.size());
        if (equals_sign == std::string_view::npos || equals_sign + 1 >= end) return false;
        const std::string_view key = line.substr(begin, equals_sign - begin);
        const std::string_view value = line.substr(equals_sign + 1, end - equals_sign - 1);
        equals_sign = line.find('=', equals_sign + 1);
        if (equals_sign < end) return false;
        split.values.set(key, value);
        begin = end + 1;
    }
    return true;
}

bool is_skipped(std::string_view tag) {
    return tag.empty() || tag.front() == '#' || tag.find(' ') != std::string_view::npos;
}

}  // namespace nrx
