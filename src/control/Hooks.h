#pragma once

#include "platform/Intrinsic.h"

namespace TalvikDBxZandor {

/// Moments of the control that its hosts are told nothing of. What is built above the control may
/// listen to them; nobody does at first, and nothing comes of them then.
struct Hooks {
    platform::PlainEvent EditorOpened;   ///< over the grid's current cell, with the cell's value
    platform::PlainEvent EditorsClosing; ///< about to be hidden without being set
};

} // namespace TalvikDBxZandor
