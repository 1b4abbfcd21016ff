#include "frontends/windows/toolkit/Grid.h"

#include <Zandor/platform/RuntimeError.h>

#include <utility>

namespace zandor::platform::windows {

void Grid::mustBeRow(std::int32_t row) const {
    if (!cells().isRow(row)) throw errors::invalidRow();
}

void Grid::mustBeCol(std::int32_t col) const {
    if (!cells().isCol(col)) throw errors::invalidCol();
}

void Grid::mustBeCell(std::int32_t row, std::int32_t col) const {
    if (!cells().isRow(row) || !cells().isCol(col)) throw errors::invalidPropertyArrayIndex();
}

void Grid::SetFocus() {
    // Tables that go together with their closed window ask for it.
    if (surroundings().focus.isOnScreen()) surroundings().focus.take(mWindow.get());
}

void Grid::Row(std::int32_t value) {
    mustBeRow(value);
    mWindow->setCurrent(value, Col());
}

void Grid::Col(std::int32_t value) {
    mustBeCol(value);
    mWindow->setCurrent(Row(), value);
}

Bounds Grid::current() const {
    return surroundings().scale.toTwips(mWindow->cellPlace(Row(), Col()));
}

void Grid::CellAlignment(std::int16_t value) {
    if (value < 0 || value > 9) throw errors::invalidPropertyValue();
    cells().cell(Row(), Col()).alignment = value;
    mWindow->touch();
}

String Grid::TextMatrix(std::int32_t row, std::int32_t col) const {
    mustBeCell(row, col);
    return cells().cell(row, col).text;
}

void Grid::TextMatrix(std::int32_t row, std::int32_t col, const String& value) {
    mustBeCell(row, col);
    if (std::as_const(cells()).cell(row, col).text == value) return;
    cells().cell(row, col).text = value;
    mWindow->touch();
}

void Grid::CellNote(std::int32_t row, std::int32_t col, const String& value) {
    mustBeCell(row, col);
    if (std::as_const(cells()).cell(row, col).note == value) return;
    cells().cell(row, col).note = value;
    mWindow->touch();
}

float Grid::ColPos(std::int32_t col) const {
    mustBeCol(col);
    return surroundings().scale.toTwips(mWindow->cellPlace(0, col).left);
}

float Grid::RowPos(std::int32_t row) const {
    mustBeRow(row);
    return surroundings().scale.toTwips(mWindow->cellPlace(row, 0).top);
}

float Grid::ColWidth(std::int32_t col) const {
    mustBeCol(col);
    return mWindow->widthInTwips(col);
}

void Grid::ColWidth(std::int32_t col, float value) {
    mustBeCol(col);
    if (!(value >= 0)) throw errors::invalidPropertyValue();
    if (col == 0) return mWindow->setLabelWidth(value);
    cells().column(col).width = value;
    mWindow->widthsChanged();
}

void Grid::ColPosition(std::int32_t col, std::int32_t position) {
    mustBeCol(col);
    mustBeCol(position);
    cells().move(col, position);
    mWindow->widthsChanged();
}

std::int32_t Grid::ColData(std::int32_t col) const {
    mustBeCol(col);
    return cells().column(col).data;
}

void Grid::ColData(std::int32_t col, std::int32_t value) {
    mustBeCol(col);
    cells().column(col).data = value;
}

} // namespace zandor::platform::windows
