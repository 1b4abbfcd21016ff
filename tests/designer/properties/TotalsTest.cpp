#include "OpenProperties.h"

#include "designer/properties/CurrentColumn.h"
#include "designer/properties/MenuQuestions.h"
#include "designer/properties/TotalCommands.h"
#include "designer/properties/totals.h"

#include <QMenu>
#include <QToolButton>

using namespace zandor;

using model::Total;
using testing::ElementsAre;

namespace {

class TheTotals : public OpenProperties {
protected:
    QAction& action(Total total) {
        return found<QAction>(qPrintable(QString("total%1").arg(static_cast<int>(total))));
    }
    std::vector<std::string> entriesFor(const TalvikDBxZandor::MenuPlace& place) {
        std::vector<std::string> result;
        for (const auto& entry : asked(place)) result.push_back(platform::toUtf8(entry.Caption));
        return result;
    }
    std::vector<TalvikDBxZandor::HostEntry> asked(const TalvikDBxZandor::MenuPlace& place) {
        auto* const commands = window->findChild<designer::TotalCommands*>();
        return designer::MenuQuestions(
                   *commands, designer::JoinCommands(window->document(), window->drawing()), [] {})
            .MenuEntries(place);
    }
    TalvikDBxZandor::MenuPlace over(int column) {
        TalvikDBxZandor::MenuPlace place;
        place.Source = TalvikDBxZandor::menuSource::grid;
        if (column > 0) place.Definition = query().ColumnDefinitions().Item(column);
        return place;
    }
};

} // namespace

TEST_F(TheTotals, AreSetInOneStepForTheColumnThatTheGridIsIn) {
    goToColumn(2);
    EXPECT_TRUE(found<QToolButton>("totals").isEnabled());
    action(Total::Sum).trigger();
    calm();
    EXPECT_EQ(definition(2).total(), Total::Sum);
    EXPECT_EQ(definition(1).total(), Total::None);
    EXPECT_EQ(made(), 1);
    EXPECT_EQ(lastStep(), "Change total of quantity");
    EXPECT_EQ(grid().model().text(0, 2), "sum(order_lines.quantity)");
    EXPECT_TRUE(action(Total::Sum).isChecked());
    window->document().undo();
    calm();
    EXPECT_EQ(definition(2).total(), Total::None);
    EXPECT_EQ(grid().model().text(0, 2), "order_lines.quantity");
    EXPECT_TRUE(action(Total::None).isChecked());
}

TEST_F(TheTotals, AreOnlyThoseThatTheValuesCanHave) {
    EXPECT_FALSE(action(Total::Sum).isEnabled()) << "of texts";
    EXPECT_TRUE(action(Total::Count).isEnabled());
    EXPECT_TRUE(action(Total::Largest).isEnabled());
    goToColumn(2);
    EXPECT_TRUE(action(Total::Sum).isEnabled());
    goToColumn(3);
    EXPECT_FALSE(found<QToolButton>("totals").isEnabled()) << "a blank column";
    goToColumn(2);
    EXPECT_TRUE(found<QToolButton>("totals").isEnabled());
    window->drawing().setOptions({{"OnlyJoin", true}});
    calm();
    EXPECT_FALSE(found<QToolButton>("totals").isEnabled()) << "no grid";
    using model::ColumnType;
    EXPECT_FALSE(model::suits(Total::Smallest, ColumnType::Blob));
    EXPECT_TRUE(model::suits(Total::Sum, ColumnType::Unknown));
}

TEST_F(TheTotals, AreEntriesOfTheGridsMenu) {
    EXPECT_THAT(entriesFor(over(1)), ElementsAre("&Count", "Count &different values", "S&mallest",
                                                 "&Largest", "-", "C&olumn\u2026"));
    definition(2).total(Total::Sum);
    EXPECT_THAT(entriesFor(over(2)),
                ElementsAre("&No total", "&Average", "&Count", "Count &different values",
                            "S&mallest", "&Largest", "-", "C&olumn\u2026"));
    EXPECT_THAT(entriesFor(over(0)), ElementsAre("C&olumn\u2026"));
    EXPECT_TRUE(entriesFor({}).empty()) << "over the canvas";
    const auto entries = asked(over(1));
    const int steps = this->steps();
    entries[0].Chosen();
    EXPECT_EQ(definition(1).total(), Total::Count);
    EXPECT_EQ(this->steps(), steps + 1);
    // The column may have gone while the menu was open.
    const auto late = asked(over(1));
    query().ColumnDefinitions().Remove(definition(1).Key());
    late[0].Chosen();
    EXPECT_EQ(definition(1).total(), Total::Sum);
}

TEST_F(TheTotals, HaveADifferentMnemonicEach) {
    std::set<QChar> signs;
    for (const Total total : designer::allTotals()) {
        const QString name = designer::nameOf(total);
        EXPECT_TRUE(signs.insert(name[name.indexOf('&') + 1].toLower()).second)
            << name.toStdString();
    }
}
