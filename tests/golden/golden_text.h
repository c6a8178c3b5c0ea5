// Long expected texts, such as the output of a whole program run, from the files in this folder.
#pragma once

#include <fstream>
#include <iterator>
#include <string>

namespace tests {

// Returns the text of a file, or an empty string if it cannot be read.
inline std::string golden_text(const std::string& file) {
    std::ifstream stream(GOLDEN_FOLDER "/" + file, std::ios::binary);
    return {std::istreambuf_iterator<char>(stream), {}};
}

}  // namespace tests
