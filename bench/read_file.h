// The bytes that the measured code works on.
#pragma once

#include <cstdint>
#include <vector>

namespace bench {

// All bytes of a file; none if it cannot be read.
std::vector<std::uint8_t> read_file(const char* path);

}  // namespace bench
