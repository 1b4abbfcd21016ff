#pragma once

#include "platform/Intrinsic.h"

#include <functional>

namespace TalvikDBxZandor {

/// Moments of the control that its hosts are told nothing of. What is built above the control may
/// listen to them; nobody does at first, and nothing comes of them then.
struct Hooks {
    platform::PlainEvent EditorOpened;   ///< over the grid's current cell, with the cell's value
    platform::PlainEvent EditorsClosing; ///< about to be hidden without being set
    platform::PlainEvent Bound;          ///< the model is shown afresh
    std::function<void(std::int32_t column)> CellWritten; ///< of the grid, with its alignment
};

} // namespace TalvikDBxZandor
