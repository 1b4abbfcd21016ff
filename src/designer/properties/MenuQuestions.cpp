#include "designer/properties/MenuQuestions.h"

#include "designer/properties/TotalCommands.h"

#include <Zandor/qt/Text.h>

#include <QCoreApplication>

namespace zandor::designer {

namespace {

class MenuWords {
    Q_DECLARE_TR_FUNCTIONS(zandor::designer::MenuQuestions)
};

} // namespace

std::vector<TalvikDBxZandor::HostEntry>
MenuQuestions::MenuEntries(const TalvikDBxZandor::MenuPlace& place) {
    if (place.Join) return mJoins.entries(place.Join);
    const auto definition = std::dynamic_pointer_cast<model::ColumnDefinition>(place.Definition);
    auto entries = mTotals.entries(definition);
    if (place.Source != TalvikDBxZandor::menuSource::grid) return entries;
    if (!entries.empty()) entries.push_back({u"-", {}});
    entries.push_back({platform::qt::fromQt(MenuWords::tr("C&olumn\u2026")), mShowColumn});
    return entries;
}

} // namespace zandor::designer
