#pragma once

#include <QPointF>

class QMouseEvent;

namespace zandor::platform::qt {

class FieldTitles;
class GridListener;

/// What the mouse does to the fields at the head of the grid's columns: a click on one, and the
/// drag of a column to another place. Columns count from 1, the labels are column 0.
class FieldGestures {
public:
    explicit FieldGestures(FieldTitles& titles) : mTitles(titles) {}

    void setListener(GridListener* listener) { mListener = listener; }

    void pressed(const QMouseEvent& event);
    void moved(const QMouseEvent& event);
    /// May end the grid.
    void released(const QMouseEvent& event);
    /// Ends a drag where it began; false when there is none.
    bool cancel();

private:
    /// The gap between columns nearest to a place: that before the column of its number.
    int gapAt(int x) const;

    FieldTitles& mTitles;
    GridListener* mListener = nullptr;
    int mColumn = 0; ///< that was pressed; 0: none
    QPointF mPressedAt;
    bool mDragging = false;
};

} // namespace zandor::platform::qt
