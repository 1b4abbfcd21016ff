#include "frontends/qt/FieldGestures.h"

#include "frontends/qt/GridCells.h"
#include "frontends/qt/GridWidget.h"

#include <QApplication>
#include <QMouseEvent>
#include <QScrollBar>

namespace zandor::platform::qt {

void FieldGestures::pressed(const QMouseEvent& event) {
    cancel();
    mColumn = 0;
    if (event.button() != Qt::LeftButton) return;
    const int x = event.position().toPoint().x();
    if (mTitles.isOnBorder(x)) return;
    mColumn = mTitles.logicalIndexAt(x) + 1;
    mPressedAt = event.position();
}

void FieldGestures::moved(const QMouseEvent& event) {
    if (mColumn == 0 || !(event.buttons() & Qt::LeftButton)) return;
    const QPoint way = (event.position() - mPressedAt).toPoint();
    if (!mDragging && way.manhattanLength() < QApplication::startDragDistance()) return;
    if (!mDragging) {
        if (!mListener || !mListener->columnMovable(mColumn)) {
            mColumn = 0; // neither a drag nor a click
            return;
        }
        mDragging = true;
        mTitles.viewport()->setCursor(Qt::ClosedHandCursor);
    }
    // Beyond an edge the grid follows, a column with each move of the mouse.
    const int x = event.position().toPoint().x();
    auto& bar = *static_cast<QTableView*>(mTitles.parentWidget())->horizontalScrollBar();
    if (x < 0) bar.setValue(bar.value() - 1);
    if (x >= mTitles.viewport()->width()) bar.setValue(bar.value() + 1);
    mTitles.setGap(gapAt(x));
}

void FieldGestures::released(const QMouseEvent& event) {
    if (event.button() != Qt::LeftButton) return;
    const int x = event.position().toPoint().x();
    const int column = std::exchange(mColumn, 0);
    const bool dragged = mDragging;
    const int gap = gapAt(x);
    cancel();
    if (column == 0 || !mListener) return;
    if (dragged)
        mListener->columnMoved(column, gap > column ? gap - 1 : gap);
    else if (mTitles.logicalIndexAt(x) + 1 == column)
        mListener->fieldClicked(column);
}

bool FieldGestures::cancel() {
    if (!std::exchange(mDragging, false)) return false;
    mColumn = 0;
    mTitles.setGap(0);
    mTitles.viewport()->unsetCursor();
    return true;
}

int FieldGestures::gapAt(int x) const {
    const int inside = std::clamp(x, 0, std::max(0, mTitles.viewport()->width() - 1));
    const int section = mTitles.logicalIndexAt(inside);
    if (section < 0) return mTitles.count() + 1;
    const int middle = mTitles.sectionViewportPosition(section) + mTitles.sectionSize(section) / 2;
    return section + 1 + (inside > middle ? 1 : 0);
}

} // namespace zandor::platform::qt
