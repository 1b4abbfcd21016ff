#pragma once

#include "control/Zandor.h"

namespace comforts {

/// The way from the comforts into the control: all of its procedures that they act by, and no more.
/// Its members throw what the control's parts and the host's model throw.
class Door {
public:
    explicit Door(TalvikDBxZandor::Zandor& control) : mControl(control) {}

    /// Whether the grid is on the control at all.
    bool hasGrid() const { return !mControl.mOnlyJoin; }
    const MSFlexGridLib::MSFlexGrid& grid() const { return *mControl.sprColumn; }

    /// The last grid column with a field in it; 0 when there is none.
    std::int32_t lastColumn() const;

    /// Makes an output column of an entry (1-based) of the table in a slot, as dropping it on a
    /// grid column does. What was copied for a later "Paste Column" stays.
    void drop(std::int16_t table, std::int32_t entry, std::int32_t column);

private:
    TalvikDBxZandor::Zandor& mControl;
};

} // namespace comforts
