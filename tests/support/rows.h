// Tables of test cases.
#pragma once

#include <tuple>
#include <vector>

namespace tests {

// Rows of values that the loop over them gives names to.
template <class... Columns>
using rows = std::vector<std::tuple<Columns...>>;

}  // namespace tests
