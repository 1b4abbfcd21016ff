#pragma once

#include "designer/properties/JoinCommands.h"

#include <functional>

namespace zandor::designer {

class TotalCommands;

/// Adds to the control's menus what is offered for output columns and for joins, and the way to all
/// that can be said of a column.
class MenuQuestions final : public TalvikDBxZandor::Questions {
public:
    /// The totals, and what the others have been made of, outlive the object.
    MenuQuestions(TotalCommands& totals, JoinCommands joins, std::function<void()> showColumn)
        : mTotals(totals), mJoins(joins), mShowColumn(std::move(showColumn)) {}

    std::vector<TalvikDBxZandor::HostEntry>
    MenuEntries(const TalvikDBxZandor::MenuPlace& place) override;

private:
    TotalCommands& mTotals;
    JoinCommands mJoins;
    const std::function<void()> mShowColumn;
};

} // namespace zandor::designer
