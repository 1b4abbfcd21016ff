#include "OpenWindow.h"

#include "designer/statement/SqlCommands.h"
#include "designer/statement/SqlView.h"

#include <QClipboard>
#include <QFile>
#include <QGuiApplication>
#include <QMimeData>
#include <QUndoStack>
#include <QUrl>

using namespace zandor;

using testing::ElementsAre;
using testing::HasSubstr;
using testing::StartsWith;
using testing::UnorderedElementsAre;

namespace {

class SqlInTheWindow : public OpenWindow {
protected:
    void copied(const QString& text) { QGuiApplication::clipboard()->setText(text); }
    designer::SqlView& view() { return *window->findChild<designer::SqlView*>(); }
    std::string text() { return view().text().toStdString(); }
    /// What the message says that comes while something is done.
    std::string told(const std::function<void()>& run) {
        std::string text;
        answering([&](QMessageBox& box) { text = box.text().toStdString(), press(box, "OK"); },
                  run);
        return text;
    }
    model::QueryRecord record() { return query().record(); }

    const QString two = "SELECT c.name, o.status FROM customers c, orders o\n"
                        "WHERE o.customer_id = c.id AND o.status = 'open'";
};

} // namespace

TEST_F(SqlInTheWindow, IsPastedAsADrawingInOneStep) {
    open();
    const auto before = record();
    ASSERT_FALSE(before.tables.empty());
    copied(two);
    command("pasteSql");
    EXPECT_THAT(shownTables(), UnorderedElementsAre("c", "o"));
    EXPECT_EQ(query().Joins().Count(), 1);
    EXPECT_EQ(text(), two.toStdString());
    EXPECT_EQ(window->document().steps().count(), 1);
    command("undo");
    EXPECT_EQ(record(), before);
    command("redo");
    EXPECT_THAT(shownTables(), UnorderedElementsAre("c", "o"));
}

TEST_F(SqlInTheWindow, IsPastedOverTheDrawingByItsKey) {
    open({.tables = {"products"}});
    copied("  -- mine\nSELECT id FROM orders");
    window->drawing().control().setFocus();
    hands::shortcut(window->drawing().control(), Qt::Key_V, Qt::ControlModifier);
    calm();
    EXPECT_THAT(shownTables(), ElementsAre("orders"));
    copied("just some words");
    hands::shortcut(window->drawing().control(), Qt::Key_V, Qt::ControlModifier);
    calm();
    EXPECT_THAT(shownTables(), ElementsAre("orders"));
}

TEST_F(SqlInTheWindow, StandsInThePanelWithItsPlaceMarkedWhenItCannotBeDrawn) {
    open();
    const auto before = record();
    copied("SELECT nam FROM customers");
    EXPECT_EQ(told([&] { command("pasteSql"); }),
              "Line 1, column 8: no table has a column \"nam\"; is \"name\" meant?");
    EXPECT_EQ(record(), before);
    EXPECT_EQ(window->document().steps().count(), 0);
    EXPECT_EQ(text(), "SELECT nam FROM customers");
    EXPECT_TRUE(view().isVisible());
    EXPECT_EQ(view().marked().selectedText(), "nam");
}

TEST_F(SqlInTheWindow, NeedsSomethingToPaste) {
    open();
    QGuiApplication::clipboard()->clear();
    EXPECT_THAT(told([&] { command("pasteSql"); }), StartsWith("The clipboard has no text"));
}

TEST_F(SqlInTheWindow, IsOpenedFromAFileAsAQueryOfItsOwn) {
    open();
    commandWithFile("openSql", folder.file("two.sql", two.toUtf8()));
    EXPECT_THAT(shownTables(), UnorderedElementsAre("c", "o"));
    EXPECT_THAT(title(), StartsWith("Untitled[*] "));
    EXPECT_TRUE(window->isWindowModified());
    EXPECT_EQ(window->document().steps().count(), 0);
    for (const auto& table : record().tables) EXPECT_GE(table.left, 0);
}

TEST_F(SqlInTheWindow, IsOpenedOnlyAfterAskingForWhatWouldBeLost) {
    open();
    add("stock");
    const auto before = record();
    std::string asked;
    answering([&](QMessageBox& box) { asked = box.text().toStdString(), press(box, "Cancel"); },
              [&] { command("openSql"); });
    EXPECT_THAT(asked, StartsWith("Save the changes"));
    EXPECT_EQ(record(), before);
}

TEST_F(SqlInTheWindow, LeavesTheQueryAloneWhenAFileCannotBeDrawn) {
    open();
    const auto before = record();
    const QString path = folder.file("bad.sql", "SELECT 1 UNION SELECT 2");
    const Answering answers({[&](QDialog& dialog) { choose(dialog, path); },
                             [&](QDialog& dialog) {
                                 EXPECT_THAT(textOf(dynamic_cast<QMessageBox&>(dialog)),
                                             HasSubstr("UNION"));
                                 press(dialog, "OK");
                             }});
    command("openSql");
    EXPECT_EQ(record(), before);
    EXPECT_EQ(text(), "SELECT 1 UNION SELECT 2");
}

TEST_F(SqlInTheWindow, IsSavedAsItStandsInThePanel) {
    open();
    copied(two);
    command("pasteSql");
    commandWithFile("saveSqlAs", folder.path("mine.sql"));
    QFile file(folder.path("mine.sql"));
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    EXPECT_EQ(file.readAll(), two.toUtf8() + '\n');
}

TEST_F(SqlInTheWindow, MovesNoTableThatStaysWhenItIsTyped) {
    open();
    copied(two);
    command("pasteSql");
    window->document().change("Move", [](model::Query& query) {
        query.tableNamed(u"c")->Left(6000);
        query.tableNamed(u"c")->Top(3000);
    });
    calm();
    copied("SELECT c.name, l.quantity FROM customers c, orders o, order_lines l\n"
           "WHERE o.customer_id = c.id AND l.order_id = o.id");
    command("pasteSql");
    EXPECT_EQ(query().tableNamed(u"c")->Left(), 6000);
    EXPECT_EQ(query().tableNamed(u"c")->Top(), 3000);
    EXPECT_THAT(shownTables(), UnorderedElementsAre("c", "o", "l"));
}

TEST(AFileWithAStatement, IsDroppedByItsName) {
    DatabaseFolder folder;
    const auto dropped = [](const QString& path) {
        QMimeData data;
        data.setUrls({QUrl::fromLocalFile(path)});
        return designer::droppedStatement(data);
    };
    const QString path = folder.file("One.SQL", "SELECT 1");
    EXPECT_EQ(dropped(path), path);
    EXPECT_EQ(dropped(folder.file("one.txt", "SELECT 1")), std::nullopt);
    EXPECT_EQ(dropped(folder.path("none.sql")), std::nullopt);
}

TEST(AText, LooksLikeAStatementByItsFirstWord) {
    for (const char* text : {"select 1", "  SELECT 1", "WITH a AS (SELECT 1) SELECT * FROM a",
                             "-- one\n/* two\n */ select 1", "(select 1)"})
        EXPECT_TRUE(designer::looksLikeStatement(text)) << text;
    for (const char* text : {"", "selected", "DELETE FROM t", "-- select 1", "/* select 1"})
        EXPECT_FALSE(designer::looksLikeStatement(text)) << text;
}
