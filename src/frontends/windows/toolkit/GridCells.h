#pragma once

#include <Zandor/platform/MSFlexGrid.h>

#include <vector>

namespace zandor::platform::windows {

/// What a grid holds: texts, alignments and notes of cells, widths and numbers of columns. Rows and
/// columns are right; whoever asks has seen to it.
class GridCells {
public:
    GridCells(std::int32_t rows, std::int32_t cols, float width);

    std::int32_t rows() const { return mRows; }
    std::int32_t cols() const { return static_cast<std::int32_t>(mColumns.size()); }
    bool isRow(std::int32_t row) const { return row >= 0 && row < rows(); }
    bool isCol(std::int32_t col) const { return col >= 0 && col < cols(); }

    struct Cell {
        String text;
        std::int16_t alignment = MSFlexGridLib::alignLeftCenter;
        String note;
    };
    const Cell& cell(std::int32_t row, std::int32_t col) const;
    Cell& cell(std::int32_t row, std::int32_t col);

    struct Column {
        float width = 0;
        std::int32_t data = 0;
        std::vector<Cell> cells; ///< none as long as all are blank
    };
    const Column& column(std::int32_t col) const { return mColumns[static_cast<std::size_t>(col)]; }
    Column& column(std::int32_t col) { return mColumns[static_cast<std::size_t>(col)]; }
    void move(std::int32_t from, std::int32_t to);

    /// The first blank column behind the last that is not; 0: there is none.
    std::int32_t firstBlank() const;

private:
    std::int32_t mRows;
    std::vector<Column> mColumns;
};

} // namespace zandor::platform::windows
