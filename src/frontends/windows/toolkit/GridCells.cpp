#include "frontends/windows/toolkit/GridCells.h"

#include <algorithm>
#include <utility>

namespace zandor::platform::windows {

GridCells::GridCells(std::int32_t rows, std::int32_t cols, float width)
    : mRows(rows), mColumns(static_cast<std::size_t>(cols)) {
    for (Column& column : mColumns) column.width = width;
}

const GridCells::Cell& GridCells::cell(std::int32_t row, std::int32_t col) const {
    static const Cell blank;
    const auto& cells = column(col).cells;
    return cells.empty() ? blank : cells[static_cast<std::size_t>(row)];
}

GridCells::Cell& GridCells::cell(std::int32_t row, std::int32_t col) {
    auto& cells = column(col).cells;
    cells.resize(static_cast<std::size_t>(mRows));
    return cells[static_cast<std::size_t>(row)];
}

void GridCells::move(std::int32_t from, std::int32_t to) {
    const auto at = [this](std::int32_t col) { return mColumns.begin() + col; };
    if (from < to)
        std::rotate(at(from), at(from + 1), at(to + 1));
    else
        std::rotate(at(to), at(from), at(from + 1));
}

std::int32_t GridCells::firstBlank() const {
    const auto isBlank = [this](std::int32_t col) {
        return std::as_const(*this).cell(0, col).text.empty();
    };
    std::int32_t last = cols() - 1;
    if (last < 1 || !isBlank(last)) return 0;
    while (last > 0 && isBlank(last)) --last;
    return last + 1;
}

} // namespace zandor::platform::windows
