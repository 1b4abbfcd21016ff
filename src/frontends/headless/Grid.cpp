#include <Zandor/headless/Grid.h>

#include <Zandor/platform/RuntimeError.h>

#include <algorithm>
#include <utility>

namespace zandor::platform::headless {

Grid::Grid(Toolkit& toolkit, const Design& design, Element* container, std::int32_t rows,
           std::int32_t cols, MSFlexGridLib::GridEvents given)
    : Placed(toolkit, design, container), events(std::move(given)), mRows(rows),
      mColumns(static_cast<std::size_t>(cols)) {
    for (Column& column : mColumns) column.cells.resize(static_cast<std::size_t>(rows));
}

void Grid::Visible(bool value) {
    called("Visible");
    setVisible(value);
}

void Grid::Font(const platform::Font& value) {
    called("Font");
    mLook.font = value;
}

void Grid::SetFocus() {
    called("SetFocus");
    takeFocus();
}

std::int32_t Grid::Rows() const {
    called("Rows");
    return mRows;
}

std::int32_t Grid::Cols() const {
    called("Cols");
    return cols();
}

std::int32_t Grid::TopRow() const {
    called("TopRow");
    return mTopRow;
}

std::int32_t Grid::LeftCol() const {
    called("LeftCol");
    return mLeftCol;
}

std::int32_t Grid::Row() const {
    called("Row");
    return mRow;
}

void Grid::Row(std::int32_t value) {
    called("Row=");
    if (!isRow(value)) throw errors::invalidRow();
    mRow = value;
}

std::int32_t Grid::Col() const {
    called("Col");
    return mCol;
}

void Grid::Col(std::int32_t value) {
    called("Col=");
    if (!isCol(value)) throw errors::invalidCol();
    mCol = value;
}

String Grid::Text() const {
    called("Text");
    return cell(mRow, mCol).text;
}

void Grid::Text(const String& value) {
    called("Text=");
    cellAt(mRow, mCol).text = value;
}

void Grid::CellAlignment(std::int16_t value) {
    called("CellAlignment");
    if (value < 0 || value > 9) throw errors::invalidPropertyValue();
    cellAt(mRow, mCol).alignment = value;
}

float Grid::CellLeft() const {
    called("CellLeft");
    return leftOf(mCol);
}

float Grid::CellTop() const {
    called("CellTop");
    return topOf(mRow);
}

float Grid::CellWidth() const {
    called("CellWidth");
    return column(mCol).width;
}

float Grid::CellHeight() const {
    called("CellHeight");
    return gridRowHeight;
}

void Grid::EnsureVisible() {
    called("EnsureVisible");
    std::int32_t top = mRow == 0 ? mTopRow : std::min(mTopRow, mRow);
    std::int32_t left = mCol == 0 ? mLeftCol : std::min(mLeftCol, mCol);
    const auto hidden = [](float edge, float size) { return edge > size; };
    for (float bottom = topOf(mRow) + gridRowHeight;
         top < mRow && hidden(bottom, placement().Height); ++top)
        bottom -= gridRowHeight;
    for (float right = leftOf(mCol) + column(mCol).width;
         left < mCol && hidden(right, placement().Width); ++left)
        right -= column(left).width;
    scrollTo(top, left);
}

String Grid::TextMatrix(std::int32_t row, std::int32_t col) const {
    called("TextMatrix");
    return cell(row, col).text;
}

void Grid::TextMatrix(std::int32_t row, std::int32_t col, const String& value) {
    called("TextMatrix=");
    cellAt(row, col).text = value;
}

void Grid::CellNote(std::int32_t row, std::int32_t col, const String& value) {
    called("CellNote");
    cellAt(row, col).note = value;
}

float Grid::ColPos(std::int32_t col) const {
    called("ColPos");
    return leftOf(col);
}

float Grid::RowPos(std::int32_t row) const {
    called("RowPos");
    return topOf(row);
}

float Grid::ColWidth(std::int32_t col) const {
    called("ColWidth");
    return column(col).width;
}

void Grid::ColWidth(std::int32_t col, float value) {
    called("ColWidth=");
    Column& changed = column(col);
    if (!(value >= 0)) throw errors::invalidPropertyValue();
    changed.width = value;
}

void Grid::ColPosition(std::int32_t col, std::int32_t position) {
    called("ColPosition");
    if (!isCol(col) || !isCol(position)) throw errors::invalidCol();
    const auto from = mColumns.begin() + col;
    const auto to = mColumns.begin() + position;
    if (from < to)
        std::rotate(from, from + 1, to + 1);
    else
        std::rotate(to, from, from + 1);
}

std::int32_t Grid::ColData(std::int32_t col) const {
    called("ColData");
    return column(col).data;
}

void Grid::ColData(std::int32_t col, std::int32_t value) {
    called("ColData=");
    column(col).data = value;
}

const Grid::Cell& Grid::cell(std::int32_t row, std::int32_t col) const {
    if (!isRow(row) || !isCol(col)) throw errors::invalidPropertyArrayIndex();
    return column(col).cells[static_cast<std::size_t>(row)];
}

Bounds Grid::cellBounds(std::int32_t row, std::int32_t col) const {
    return {leftOf(col), topOf(row), column(col).width, gridRowHeight};
}

bool Grid::inView(std::int32_t row, std::int32_t col) const {
    return (row == 0 || row >= mTopRow) && (col == 0 || col >= mLeftCol);
}

void Grid::scrollTo(std::int32_t topRow, std::int32_t leftCol) {
    const std::int32_t top = std::clamp(topRow, 1, std::max(1, mRows - 1));
    const std::int32_t left = std::clamp(leftCol, 1, std::max(1, cols() - 1));
    if (top == mTopRow && left == mLeftCol) return;
    mTopRow = top;
    mLeftCol = left;
    if (events.Scroll) events.Scroll();
}

const Grid::Column& Grid::column(std::int32_t col) const {
    if (!isCol(col)) throw errors::invalidCol();
    return mColumns[static_cast<std::size_t>(col)];
}

Grid::Column& Grid::column(std::int32_t col) {
    return const_cast<Column&>(std::as_const(*this).column(col));
}

Grid::Cell& Grid::cellAt(std::int32_t row, std::int32_t col) {
    return const_cast<Cell&>(std::as_const(*this).cell(row, col));
}

float Grid::leftOf(std::int32_t col) const {
    if (!isCol(col)) throw errors::invalidCol();
    if (col == 0) return 0;
    float left = column(0).width;
    for (std::int32_t i = mLeftCol; i < col; ++i) left += column(i).width;
    for (std::int32_t i = col; i < mLeftCol; ++i) left -= column(i).width;
    return left;
}

float Grid::topOf(std::int32_t row) const {
    if (!isRow(row)) throw errors::invalidRow();
    return row == 0 ? 0 : gridRowHeight * static_cast<float>(1 + row - mTopRow);
}

} // namespace zandor::platform::headless
