#include "nrxctl/profiler/split.h"

#include <algorithm>

namespace nrx {

std::vector<std::string_view> split(std::string_view text, char delimiter) {
    std::vector<std::string_view> fields;
    while (!text.empty()) {
        const std::size_t length = std::min(text.find(delimiter), text.size());
        fields.push_back(text.substr(0, length));
        text.remove_prefix(std::min(length + 1, text.size()));
    }
    return fields;
}

}  // namespace nrx
