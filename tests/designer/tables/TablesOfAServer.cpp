#include "Drawing.h"
#include "database/Answers.h"
#include "model/reader/OneServer.h"

#include "designer/tables/TablesPanel.h"

#include <gmock/gmock.h>

#include <QHelpEvent>
#include <QListView>
#include <QToolTip>

using namespace zandor;

using reader::TableId;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

class TheTablesOfAServer : public Drawing {
protected:
    TheTablesOfAServer() {
        runOnServer({QStringLiteral("DROP SCHEMA IF EXISTS shop CASCADE"),
                     QStringLiteral("CREATE SCHEMA shop"),
                     QStringLiteral("CREATE TABLE shop.lines (o int, pos int, PRIMARY KEY (o, "
                                    "pos))"),
                     QStringLiteral("CREATE TABLE shop.parts (o int, pos int, FOREIGN KEY (o, pos) "
                                    "REFERENCES shop.lines)")});
        EXPECT_EQ(database.open(serverAddress()), std::nullopt);
        QObject::connect(&database, &designer::Database::lost,
                         [this](const QString& why) { lost << why; });
    }

    const TableId lines{u"shop", u"lines"};
    const TableId parts{u"shop", u"parts"};
    QStringList lost;
};

} // namespace

TEST_F(TheTablesOfAServer, AreAddedWithTheirCompositeKeys) {
    adding.add({lines});
    EXPECT_TRUE(database.reader().knowsTable(lines));
    EXPECT_FALSE(database.reader().knowsTable(parts));
    adding.add({parts});
    EXPECT_THAT(refused, IsEmpty());
    EXPECT_THAT(joins(), ElementsAre("parts.o = lines.o", "parts.pos = lines.pos"));
}

TEST_F(TheTablesOfAServer, CannotBeAddedWhenItIsGoneAndTheDrawingStays) {
    adding.add({lines});
    const auto before = places();
    oneServer.server().kill();
    adding.add({parts});
    EXPECT_EQ(refused.size(), 1);
    EXPECT_EQ(lost.size(), 1);
    EXPECT_EQ(places(), before);
    oneServer.server().restart();
    EXPECT_EQ(database.renew(), std::nullopt);
    EXPECT_EQ(places(), before);
    adding.add({parts});
    EXPECT_EQ(refused.size(), 1);
    EXPECT_EQ(joins().size(), 2U);
}

TEST_F(TheTablesOfAServer, ShowTheirColumnsUnderTheMouseWhenTheyHaveBeenRead) {
    designer::TablesPanel panel(database);
    panel.resize(260, 500);
    panel.show();
    type(*panel.focusProxy(), QStringLiteral("parts"));
    auto* const list = panel.findChild<QListView*>();
    const QPoint at = list->visualRect(list->model()->index(0, 0)).center();
    QHelpEvent event(QEvent::ToolTip, at, list->viewport()->mapToGlobal(at));
    QCoreApplication::sendEvent(list->viewport(), &event);
    EXPECT_FALSE(database.reader().knowsTable(parts));
    EXPECT_TRUE(until([] { return QToolTip::text().contains(QStringLiteral("<b>parts</b>")); }));
    EXPECT_TRUE(database.reader().knowsTable(parts));
    QToolTip::hideText();
}
