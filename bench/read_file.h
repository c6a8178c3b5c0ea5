// Reads input for the code under measurement.
#pragma once

#include <cstdint>
#include <vector>

namespace bench {

// Returns all bytes of a file, or no bytes if it cannot be read.
std::vector<std::uint8_t> read_file(const char* path);

}  // namespace bench
