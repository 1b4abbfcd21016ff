#include "Databases.h"
#include "database/Answers.h"

#include "designer/database/Database.h"
#include "designer/tables/TableTip.h"
#include "designer/tables/TablesPanel.h"

#include <gmock/gmock.h>

#include <QHelpEvent>
#include <QLabel>
#include <QLineEdit>
#include <QListView>
#include <QMenu>
#include <QToolButton>
#include <QToolTip>

using namespace zandor;

using designer::Database;
using designer::TablesPanel;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

class TheTablesPanel : public testing::Test {
protected:
    TheTablesPanel() {
        QObject::connect(&panel, &TablesPanel::chosen, [this](const auto& tables) {
            for (const auto& id : tables) chosen.push_back(platform::toUtf8(id.name));
        });
        panel.resize(260, 500);
        panel.show();
        list = panel.findChild<QListView*>();
    }

    void open() { ASSERT_EQ(database.open(sampleDatabase()), std::nullopt); }

    QString count() { return panel.findChild<QLabel*>(QStringLiteral("count"))->text(); }

    QString emptyText() {
        const auto* label = panel.findChild<QLabel*>(QStringLiteral("empty"));
        return label->isVisible() ? label->text() : QString();
    }

    QPoint placeOf(int row) { return list->visualRect(list->model()->index(row, 0)).center(); }

    void doubleClick(int row) {
        QWidget& view = *list->viewport();
        hands::click(view, placeOf(row));
        hands::mouse(view, QEvent::MouseButtonDblClick, placeOf(row), Qt::LeftButton,
                     Qt::LeftButton);
        hands::mouse(view, QEvent::MouseButtonRelease, placeOf(row), Qt::LeftButton);
    }

    Database database;
    TablesPanel panel{database};
    QListView* list;
    std::vector<std::string> chosen;
};

} // namespace

TEST_F(TheTablesPanel, SaysThatADatabaseIsToBeOpened) {
    EXPECT_EQ(emptyText(), "Open a database to see its tables.");
    EXPECT_EQ(count(), "");
    EXPECT_FALSE(panel.filterBox().isEnabled());
    EXPECT_FALSE(panel.findChild<QToolButton*>()->isEnabled());
}

TEST_F(TheTablesPanel, ShowsTheTablesOfTheDatabase) {
    open();
    EXPECT_EQ(emptyText(), "");
    EXPECT_EQ(list->model()->rowCount(), 16);
    EXPECT_EQ(count(), "16 tables");
}

TEST_F(TheTablesPanel, ShowsWhatIsTypedForAndHowManyThatAre) {
    open();
    type(panel.filterBox(), QStringLiteral("ship"));
    EXPECT_EQ(list->model()->rowCount(), 2);
    EXPECT_EQ(count(), "2 of 16 tables");
    type(panel.filterBox(), QStringLiteral("zzz"));
    EXPECT_EQ(emptyText(), "No table has all of this in its name.");
    EXPECT_EQ(count(), "0 of 16 tables");
    hands::key(panel.filterBox(), Qt::Key_Escape);
    EXPECT_EQ(count(), "16 tables");
}

TEST_F(TheTablesPanel, ChoosesTheBestMatchWithEnter) {
    open();
    type(panel.filterBox(), QStringLiteral("order"));
    hands::key(panel.filterBox(), Qt::Key_Return);
    EXPECT_THAT(chosen, ElementsAre("order_lines"));
    type(panel.filterBox(), QStringLiteral(" zzz"));
    hands::key(panel.filterBox(), Qt::Key_Return);
    EXPECT_EQ(chosen.size(), 1U);
}

TEST_F(TheTablesPanel, ChoosesNothingWithEnterBeforeAnythingIsSelected) {
    open();
    hands::key(panel.filterBox(), Qt::Key_Return);
    EXPECT_THAT(chosen, IsEmpty());
}

TEST_F(TheTablesPanel, IsWalkedThroughWithTheKeyboard) {
    open();
    type(panel.filterBox(), QStringLiteral("order"));
    hands::key(panel.filterBox(), Qt::Key_Down);
    EXPECT_EQ(panel.focusWidget(), list);
    hands::key(*list, Qt::Key_Down);
    hands::key(*list, Qt::Key_Down, {}, Qt::ShiftModifier);
    hands::key(*list, Qt::Key_Return);
    EXPECT_THAT(chosen, ElementsAre("order_totals", "orders"));
}

TEST_F(TheTablesPanel, ChoosesWithADoubleClickOnce) {
    open();
    doubleClick(3);
    EXPECT_THAT(chosen, ElementsAre("customers"));
}

TEST_F(TheTablesPanel, ChoosesNothingWithOneClick) {
    open();
    hands::click(*list->viewport(), placeOf(3));
    EXPECT_THAT(chosen, IsEmpty());
}

TEST_F(TheTablesPanel, ChoosesFromItsMenu) {
    open();
    hands::click(*list->viewport(), placeOf(2));
    QTimer::singleShot(0, [] {
        auto* const menu = dynamic_cast<QMenu*>(QApplication::activePopupWidget());
        ASSERT_NE(menu, nullptr);
        menu->actions().front()->trigger();
        menu->close();
    });
    QContextMenuEvent event(QContextMenuEvent::Mouse, placeOf(2),
                            list->viewport()->mapToGlobal(placeOf(2)));
    QCoreApplication::sendEvent(list->viewport(), &event);
    EXPECT_THAT(chosen, ElementsAre("countries"));
}

TEST_F(TheTablesPanel, ReadsTheTablesAgainAndKeepsTheFilter) {
    DatabaseFolder folder;
    const QString name = QStringLiteral("a.sqlite");
    ASSERT_EQ(database.open(folder.database(name, {QStringLiteral("CREATE TABLE one (x)")})),
              std::nullopt);
    EXPECT_EQ(count(), "1 table");
    type(panel.filterBox(), QStringLiteral("o"));
    folder.database(
        name, {QStringLiteral("CREATE TABLE two (x)"), QStringLiteral("CREATE TABLE three (x)")});
    auto* const again = panel.findChild<QToolButton*>();
    hands::click(*again, again->rect().center());
    EXPECT_EQ(count(), "2 of 3 tables");
    open();
    EXPECT_EQ(panel.filterBox().text(), "");
    EXPECT_EQ(count(), "16 tables");
}

TEST_F(TheTablesPanel, ShowsTheColumnsOfATableUnderTheMouse) {
    open();
    QHelpEvent event(QEvent::ToolTip, placeOf(2), list->viewport()->mapToGlobal(placeOf(2)));
    QCoreApplication::sendEvent(list->viewport(), &event);
    EXPECT_TRUE(QToolTip::text().contains(QStringLiteral("<b>countries</b>")));
    EXPECT_TRUE(QToolTip::text().contains(QStringLiteral("<u>code</u>")));
    EXPECT_TRUE(QToolTip::text().contains(QStringLiteral("vat_rate")));
    QToolTip::hideText();
}

TEST(ATableTip, ShowsNamesAsTheyAreAndNotTooMany) {
    model::TableDescription table{u"", u"a<b>", {}};
    for (int n = 0; n < 30; ++n) table.columns.push_back({u"c" + platform::decimal(n)});
    const QString tip = designer::tipText(table, true);
    EXPECT_TRUE(tip.contains(QStringLiteral("<b>a&lt;b&gt; (view)</b>"))) << tip.toStdString();
    EXPECT_TRUE(tip.contains(QStringLiteral("c23")));
    EXPECT_FALSE(tip.contains(QStringLiteral("c24")));
    EXPECT_TRUE(tip.contains(QStringLiteral("and 6 more")));
}
