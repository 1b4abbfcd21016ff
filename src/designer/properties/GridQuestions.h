#pragma once

#include <Zandor/Questions.h>

#include <functional>

namespace zandor::designer {

class TotalCommands;

/// Adds the totals to the menu of the grid, and the way to all that can be said of a column.
class GridQuestions final : public TalvikDBxZandor::Questions {
public:
    /// The commands outlive the object.
    GridQuestions(TotalCommands& totals, std::function<void()> showColumn)
        : mTotals(totals), mShowColumn(std::move(showColumn)) {}

    std::vector<TalvikDBxZandor::HostEntry>
    MenuEntries(const TalvikDBxZandor::MenuPlace& place) override;

private:
    TotalCommands& mTotals;
    const std::function<void()> mShowColumn;
};

} // namespace zandor::designer
