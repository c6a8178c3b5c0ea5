// Tables of test cases.
#pragma once

#include <tuple>
#include <vector>

namespace tests {

// Rows of values; the loop over them names the columns.
template <class... Columns>
using rows = std::vector<std::tuple<Columns...>>;

}  // namespace tests
