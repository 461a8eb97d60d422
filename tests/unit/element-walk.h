#pragma once
// Looking a tag up the plain way: a walk over the rows in order, the first match wins. The reference for the
// index that the library uses, in results and (in the benchmark) in time.

#include "unit/element-rows.h"

#include <cstddef>
#include <string_view>

namespace zel_test {

inline constexpr std::size_t kNoRow = kElementRows.size();

// `current` and `enclosing` are the two top rows of the open elements, kNoRow where there is none.
template <typename Rows>
std::size_t walk_rows(const Rows &rows, std::string_view tag, std::size_t current, std::size_t enclosing) {
    for (std::size_t row = 0; row < rows.size(); ++row) {
        if (rows[row].tag != tag) continue;
        if (rows[row].parent.empty()) return row;
        const std::size_t reference = row == current ? enclosing : current;
        if (reference != kNoRow && rows[reference].tag == rows[row].parent) return row;
    }
    return kNoRow;
}

} // namespace zel_test
