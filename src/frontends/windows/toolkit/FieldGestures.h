#pragma once

#include "frontends/windows/toolkit/system.h"

#include <cstdint>

namespace zandor::platform::windows {

class GridWindow;
struct Message;

/// What the mouse does on the fields of the grid, the first cells of its columns: a click, a drag
/// to another place, and a border that gives a column another width.
class FieldGestures {
public:
    explicit FieldGestures(GridWindow& grid) : mGrid(grid) {}

    void pressed(const Message& message);
    void moved(const Message& message);
    /// May end with the grid.
    void released(const Message& message);
    /// Whether there was a drag or a border to let go.
    bool cancel();

    /// The column whose right border is at a place; 0: none.
    std::int32_t borderAt(POINT at) const;

private:
    std::int32_t gapAt(int x) const;

    GridWindow& mGrid;
    std::int32_t mColumn = 0; ///< that was pressed
    std::int32_t mBorder = 0; ///< the column that is made wider
    POINT mPressedAt{};
    int mWidth = 0; ///< of that column as it was
    bool mDragging = false;
    bool mResized = false;
};

} // namespace zandor::platform::windows
