// Tables of what words mean.
#pragma once

#include <algorithm>
#include <string_view>

namespace nrx {

// The row of a table whose member `word` is the given word; null if there is none.
template <class Table>
auto find_word_row(const Table& table, std::string_view word) -> decltype(table.data()) {
    const auto found =
        std::find_if(table.begin(), table.end(), [&](const auto& row) { return row.word == word; });
    return found == table.end() ? nullptr : &*found;
}

}  // namespace nrx
