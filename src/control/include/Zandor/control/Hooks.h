#pragma once

#include <Zandor/platform/Intrinsic.h>

#include <functional>

namespace TalvikDBxZandor {

namespace platform = zandor::platform;

/// A join that has just been placed on the canvas, with the names that stand there.
struct PlacedJoin {
    platform::String LeftTable;
    platform::String LeftColumn;
    platform::String RightTable;
    platform::String RightColumn;
    std::int32_t JoinType = 0;
    std::int32_t CompareOperator = 0;
    bool LeftIsWest = true; ///< the line runs from west to east
};

/// Moments of the control that its hosts are told nothing of. What is built above the control may
/// listen to them; nobody does at first, and nothing comes of them then.
struct Hooks {
    platform::PlainEvent EditorOpened;   ///< over the grid's current cell, with the cell's value
    platform::PlainEvent EditorsClosing; ///< about to be hidden without being set
    platform::PlainEvent LaidOut;        ///< the constituents have the places of the moment
    platform::PlainEvent Bound;          ///< the model is shown afresh
    std::function<void(std::int32_t column)> CellWritten; ///< of the grid, with its alignment
    std::function<void(const PlacedJoin& join, platform::Line& line)> JoinPlaced;
    /// The entries of the menu are ready for what it opens over, one of menuSource.
    std::function<void(std::int16_t source)> MenuChecked;
};

} // namespace TalvikDBxZandor
