#include "nrxctl/replay/sample_values.h"

namespace nrx {

namespace {

std::optional<sample_key> named(std::string_view word, std::string_view name, sample_key key) {
    return word == name ? std::optional(key) : std::nullopt;
}

}  // namespace

// By the length first: no two longer names are equally long.
std::optional<sample_key> find_sample_key(std::string_view name) {
    switch (name.size()) {
        case 1:
            switch (name.front()) {
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
            return named(name, "shake", sample_key::shake);
        case 8:
            return named(name, "sampleid", sample_key::sampleid);
        case 9:
            return named(name, "timestamp", sample_key::timestamp);
        case 11:
            return named(name, "temperature", sample_key::temperature);
        default:
            return std::nullopt;
    }
}

void sample_values::set(std::string_view key, std::string_view value) {
    if (const auto known = find_sample_key(key)) set(*known, value);
}

}  // namespace nrx
