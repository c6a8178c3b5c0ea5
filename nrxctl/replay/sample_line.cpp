#include "nrxctl/replay/sample_line.h"

#include <algorithm>

namespace nrx {

bool split_sample_line(std::string_view line, sample_line& split) {
    std::size_t begin = std::min(line.find(','), line.size());
    split.tag = line.substr(0, begin++);
    split.values.clear();
    // Each equals sign is looked for once: one beyond its field is that of the next.
    std::size_t equals_sign = begin < line.size() ? line.find('=', begin) : 0;
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

bool is_passed_over(std::string_view tag) {
    return tag.empty() || tag.front() == '#' || tag.find(' ') != std::string_view::npos;
}

}  // namespace nrx
