#include "nrxctl/replay/sample_values.h"

#include <optional>

namespace nrx {

namespace {

std::optional<sample_key> named(std::string_view word, std::string_view name, sample_key key) {
    return word == name ? std::optional(key) : std::nullopt;
}

// By the length first: no two longer names are equally long.
std::optional<sample_key> find_key(std::string_view word) {
    switch (word.size()) {
        case 1:
            switch (word.front()) {
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
        case 5:
            return named(word, "shake", sample_key::shake);
        case 8:
            return named(word, "sampleid", sample_key::sampleid);
        case 9:
            return named(word, "timestamp", sample_key::timestamp);
        case 11:
            return named(word, "temperature", sample_key::temperature);
        default:
            return std::nullopt;
    }
}

}  // namespace

void sample_values::set(std::string_view key, std::string_view value) {
    if (const auto known = find_key(key)) values_[static_cast<std::size_t>(*known)] = value;
}

}  // namespace nrx
