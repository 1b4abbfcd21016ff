#include "frontends/windows/toolkit/FieldGestures.h"

#include "frontends/windows/toolkit/Drawing.h"
#include "frontends/windows/toolkit/GridWindow.h"

#include <algorithm>
#include <utility>

namespace zandor::platform::windows {

namespace {

constexpr int grip = 4; ///< of a border, logical pixels

} // namespace

std::int32_t FieldGestures::borderAt(POINT at) const {
    if (at.y >= mGrid.rowHeight()) return 0;
    const int reach = mGrid.surroundings().scale.pixels(grip);
    const int labels = mGrid.columnWidth(0);
    const int width = mGrid.area().right;
    for (std::int32_t col = mGrid.leftCol(); col < mGrid.cells().cols(); ++col) {
        const RECT place = mGrid.cellPlace(0, col);
        if (place.left - reach > width) break;
        if (at.x >= place.right - reach && at.x < place.right + reach && at.x >= labels) return col;
    }
    return 0;
}

void FieldGestures::pressed(const Message& message) {
    cancel();
    mColumn = 0;
    if (buttonOf(message.id) != 1) return;
    mPressedAt = message.at();
    if (const std::int32_t border = borderAt(mPressedAt)) {
        mBorder = border;
        mWidth = mGrid.columnWidth(border);
        mResized = false;
        return;
    }
    const auto [row, col] = mGrid.cellAt(mPressedAt);
    if (row == 0 && col > 0) mColumn = col;
}

void FieldGestures::moved(const Message& message) {
    const POINT at = message.at();
    if (!(message.w & MK_LBUTTON)) return;
    if (mBorder != 0) {
        const int width = std::max<int>(0, mWidth + at.x - mPressedAt.x);
        if (width != mGrid.columnWidth(mBorder)) mResized = true;
        mGrid.resizeColumn(mBorder, width);
        return;
    }
    if (mColumn == 0) return;
    const int reach = std::abs(at.x - mPressedAt.x) + std::abs(at.y - mPressedAt.y);
    if (!mDragging && reach < GetSystemMetrics(SM_CXDRAG)) return;
    if (!mDragging) {
        if (!mGrid.surroundings().comforts.columnMovable(mColumn)) {
            mColumn = 0; // neither a drag nor a click
            return;
        }
        mDragging = true;
    }
    SetCursor(LoadCursorW(nullptr, reinterpret_cast<const wchar_t*>(IDC_HAND)));
    // Beyond an edge the grid follows, a column with each move of the mouse.
    if (at.x < mGrid.columnWidth(0)) mGrid.scrollTo(mGrid.topRow(), mGrid.leftCol() - 1);
    if (at.x >= mGrid.area().right) mGrid.scrollTo(mGrid.topRow(), mGrid.leftCol() + 1);
    mGrid.showGap(gapAt(at.x));
}

void FieldGestures::released(const Message& message) {
    if (buttonOf(message.id) != 1) return;
    const POINT at = message.at();
    const std::int32_t column = std::exchange(mColumn, 0);
    const std::int32_t border = std::exchange(mBorder, 0);
    const bool resized = std::exchange(mResized, false);
    const bool dragged = mDragging;
    const std::int32_t gap = gapAt(at.x);
    cancel();
    auto& comforts = mGrid.surroundings().comforts;
    if (border != 0) {
        if (resized) comforts.borderDragged(border, mGrid.cells().column(border).width);
    } else if (dragged) {
        comforts.columnMoved(column, gap > column ? gap - 1 : gap);
    } else if (column != 0 &&
               mGrid.cellAt(at) == std::pair<std::int32_t, std::int32_t>(0, column)) {
        comforts.fieldClicked(column);
    }
}

bool FieldGestures::cancel() {
    mBorder = 0;
    if (!std::exchange(mDragging, false)) return false;
    mColumn = 0;
    mGrid.showGap(0);
    return true;
}

std::int32_t FieldGestures::gapAt(int x) const {
    const RECT inside = mGrid.area();
    const int at = std::clamp<int>(x, mGrid.columnWidth(0), std::max<int>(0, inside.right - 1));
    const std::int32_t column = mGrid.cellAt({at, 0}).second;
    if (column < 1) return mGrid.cells().cols();
    const RECT place = mGrid.cellPlace(0, column);
    return column + (at > (place.left + place.right) / 2 ? 1 : 0);
}

} // namespace zandor::platform::windows
