#include "Databases.h"
#include "Drawn.h"

#include "designer/Banner.h"
#include "designer/database/Database.h"
#include "designer/document/becomeQuery.h"
#include "designer/statement/FindBar.h"
#include "designer/statement/SqlView.h"
#include "designer/statement/StatementPanel.h"
#include "designer/tables/placeTables.h"
#include "support/QtHands.h"

#include <gmock/gmock.h>

#include <QAbstractItemView>
#include <QApplication>
#include <QClipboard>
#include <QGuiApplication>
#include <QLineEdit>
#include <QPushButton>
#include <QUndoStack>

using namespace zandor;

using testing::HasSubstr;
using testing::StartsWith;

namespace {

class TypingAStatement : public testing::Test {
protected:
    void SetUp() override {
        ASSERT_FALSE(database.open(sampleDatabase()));
        panel.takeTyping(database, [this](model::Query& other) {
            document.change("Type", [&](model::Query& query) {
                designer::becomeQuery(query, other);
                designer::placeUnplaced(query, 18000);
            });
        });
        panel.setDatabaseDialect(database.dialect());
        panel.resize(500, 400);
        panel.show();
        view().setFocus();
        QCoreApplication::processEvents();
    }

    designer::SqlView& view() { return *panel.findChild<designer::SqlView*>(); }
    designer::Banner& asleep() { return *panel.findChild<designer::Banner*>("asleep"); }
    /// The list of what is offered, which is a window of its own.
    static QAbstractItemView& names() {
        for (QWidget* widget : QApplication::topLevelWidgets())
            if (widget->objectName() == QLatin1String("names"))
                return dynamic_cast<QAbstractItemView&>(*widget);
        throw std::runtime_error("no list of names");
    }
    designer::StatementTyping& typing() { return *panel.typing(); }
    QPushButton& button(const char* name) { return *panel.findChild<QPushButton*>(name); }
    model::Query& query() { return *document.query(); }
    int tables() { return query().Tables().Count(); }
    int steps() { return document.steps().count(); }
    std::string text() { return view().text().toStdString(); }

    void type(const QString& text) {
        for (const QChar sign : text)
            hands::key(view(), sign == u'\n' ? Qt::Key_Return : Qt::Key_unknown, sign);
    }
    /// In place of what is there.
    void write(const QString& text) {
        view().selectAll();
        type(text);
    }
    bool drawn() {
        return soon([&] { return !typing().sleeps(); });
    }
    bool refused() {
        return soon([&] { return typing().refusal().has_value(); });
    }

    designer::Database database;
    designer::Document document;
    designer::StatementPanel panel{document};
};

} // namespace

TEST_F(TypingAStatement, DrawsItOnceItPausesInOneStep) {
    write("select name, o.status from customers, orders o where customers.id = o.customer_id");
    EXPECT_TRUE(typing().sleeps());
    EXPECT_EQ(tables(), 0) << "not before the pause";
    ASSERT_TRUE(drawn());
    EXPECT_EQ(tables(), 2);
    EXPECT_EQ(query().Joins().Count(), 1);
    EXPECT_EQ(query().ColumnDefinitions().Count(), 2);
    EXPECT_EQ(steps(), 1);
    EXPECT_THAT(text(), StartsWith("select name, o.status")) << "the text stays as it was typed";
    document.undo();
    EXPECT_EQ(tables(), 0);
    EXPECT_TRUE(soon([&] { return text().empty(); }));
}

TEST_F(TypingAStatement, SaysWhereItCannotBeReadAndTouchesNothing) {
    write("select id from orders");
    ASSERT_TRUE(drawn());
    write("select id,\n  stadus from orders");
    ASSERT_TRUE(refused());
    EXPECT_TRUE(typing().sleeps());
    EXPECT_TRUE(asleep().isVisible());
    EXPECT_EQ(
        asleep().text().toStdString(),
        "Line 2, column 3: no table has a column \"stadus\"; is \"status\" meant? The drawing "
        "sleeps until this can be read; Run takes the text as it is.");
    ASSERT_TRUE(view().isMarked());
    EXPECT_EQ(view().marked().selectedText(), "stadus");
    EXPECT_EQ(query().ColumnDefinitions().Count(), 1);
    EXPECT_EQ(steps(), 1);
}

TEST_F(TypingAStatement, TakesTheMarkAwayWhileSomebodyTypesOn) {
    write("select stadus from orders");
    ASSERT_TRUE(refused());
    type(" ");
    EXPECT_FALSE(view().isMarked());
    EXPECT_FALSE(asleep().isVisible());
    ASSERT_TRUE(refused());
    write("select status from orders");
    ASSERT_TRUE(drawn());
    EXPECT_FALSE(asleep().isVisible());
}

TEST_F(TypingAStatement, MarksWhatIsMissingAtTheEnd) {
    write("select id from orders where  ");
    ASSERT_TRUE(refused());
    ASSERT_TRUE(view().isMarked());
    EXPECT_EQ(view().marked().selectedText(), "e");
}

TEST_F(TypingAStatement, GoesBackToTheDrawingsTextByEscapeOrByTheButton) {
    write("select id from orders");
    ASSERT_TRUE(drawn());
    for (const bool byKey : {true, false}) {
        write("select nonsense");
        ASSERT_TRUE(refused());
        if (byKey)
            hands::key(view(), Qt::Key_Escape);
        else
            button("backToDrawing").click();
        EXPECT_EQ(text(), "SELECT\n    orders.id\nFROM orders");
        EXPECT_FALSE(typing().sleeps());
        EXPECT_FALSE(asleep().isVisible());
        EXPECT_FALSE(view().isMarked());
        EXPECT_EQ(document.steps().undoText(), "Back to the drawing");
        EXPECT_EQ(query().ColumnDefinitions().Count(), 1);
    }
}

TEST_F(TypingAStatement, FollowsTheDrawingAgainOnceThatSaysSomethingElse) {
    write("select  id  from  orders");
    ASSERT_TRUE(drawn());
    document.change("Move", [](model::Query& query) { query.tableNamed(u"orders")->Left(900); });
    QCoreApplication::processEvents();
    EXPECT_EQ(text(), "select  id  from  orders") << "that says the same";
    document.change("Rename", [](model::Query& query) {
        query.renameTable(query.tableNamed(u"orders"), u"bills");
    });
    EXPECT_TRUE(soon([&] { return text() == "SELECT\n    bills.id\nFROM orders AS bills"; }));
}

TEST_F(TypingAStatement, KeepsWhatWaitsWhileTheDrawingChanges) {
    write("select id from orders");
    ASSERT_TRUE(drawn());
    write("select id frm orders");
    document.change("Rename", [](model::Query& query) {
        query.renameTable(query.tableNamed(u"orders"), u"bills");
    });
    ASSERT_TRUE(refused());
    EXPECT_EQ(text(), "select id frm orders");
    hands::key(view(), Qt::Key_Escape);
    EXPECT_THAT(text(), HasSubstr("FROM orders AS bills"));
}

TEST_F(TypingAStatement, IsFormattedAsTheDrawingSaysIt) {
    write("select id from orders");
    ASSERT_TRUE(drawn());
    ASSERT_TRUE(button("format").isEnabled());
    button("format").click();
    EXPECT_EQ(text(), "SELECT\n    orders.id\nFROM orders");
    EXPECT_FALSE(button("format").isEnabled());
    EXPECT_EQ(steps(), 1);
}

TEST_F(TypingAStatement, IsReadAtOnceWhenTheKeyboardGoesElsewhere) {
    write("select id from orders");
    EXPECT_EQ(tables(), 0);
    hands::click(button("format"), button("format").rect().center());
    EXPECT_EQ(tables(), 1);
}

TEST_F(TypingAStatement, IsReadBeforeACommandOfTheWindowIsGiven) {
    write("select id from orders");
    QKeyEvent run(QEvent::ShortcutOverride, Qt::Key_F5, Qt::NoModifier);
    QCoreApplication::sendEvent(&view(), &run);
    EXPECT_EQ(tables(), 1);
}

TEST_F(TypingAStatement, LeavesTakingBackToTheWindowOnceItIsDrawn) {
    const auto takes = [&] {
        QKeyEvent undo(QEvent::ShortcutOverride, Qt::Key_Z, Qt::ControlModifier);
        QCoreApplication::sendEvent(&view(), &undo);
        return undo.isAccepted();
    };
    write("select id from orders");
    EXPECT_TRUE(takes()) << "the typing, letter by letter";
    ASSERT_TRUE(drawn());
    EXPECT_FALSE(takes()) << "the step, by the window's own command";
}

TEST_F(TypingAStatement, CopiesWhatIsThere) {
    write("select id from orders");
    ASSERT_TRUE(drawn());
    panel.copy();
    EXPECT_EQ(QGuiApplication::clipboard()->text(), "SELECT\n    orders.id\nFROM orders;");
    write("select nonsense");
    ASSERT_TRUE(refused());
    panel.copy();
    EXPECT_EQ(QGuiApplication::clipboard()->text(), "select nonsense");
}

TEST_F(TypingAStatement, BelongsToTheQueryItWasTypedFor) {
    write("select nonsense");
    ASSERT_TRUE(refused());
    document.setQuery(platform::makeRef<model::Query>());
    QCoreApplication::processEvents();
    EXPECT_EQ(text(), "");
    EXPECT_FALSE(asleep().isVisible());
}

TEST_F(TypingAStatement, NeedsADatabase) {
    EXPECT_FALSE(view().isReadOnly());
    database.close();
    EXPECT_TRUE(view().isReadOnly());
}

TEST_F(TypingAStatement, KeepsProtectedBlanksInATextAsTheyAre) {
    const QString text = QStringLiteral("select id from orders where status = 'a\u00a0b'");
    panel.type(text);
    ASSERT_FALSE(typing().sleeps());
    EXPECT_EQ(view().text(), text);
    const auto definition =
        std::static_pointer_cast<model::ColumnDefinition>(query().ColumnDefinitions().Item(2));
    EXPECT_THAT(platform::toUtf8(definition->criteria().rows().begin()->second->Criterium()),
                HasSubstr("\u00a0"));
}

TEST_F(TypingAStatement, OffersTheNamesOfTables) {
    write("select * from ord");
    auto& list = names();
    ASSERT_TRUE(soon([&] { return list.isVisible(); }));
    QStringList offered;
    for (int n = 0; n < list.model()->rowCount(); ++n)
        offered << list.model()->index(n, 0).data().toString();
    EXPECT_EQ(offered, QStringList({"order_lines", "order_totals", "orders"}));
    hands::key(list, Qt::Key_Down);
    hands::key(list, Qt::Key_Return);
    EXPECT_EQ(text(), "select * from order_lines");
    EXPECT_FALSE(list.isVisible());
    ASSERT_TRUE(drawn());
}

TEST_F(TypingAStatement, OffersTheColumnsOfATableByWhatTheTextCallsIt) {
    write("select * from orders as o, customers where o.cust");
    auto& list = names();
    ASSERT_TRUE(soon([&] { return list.isVisible(); }));
    EXPECT_EQ(list.model()->rowCount(), 1);
    EXPECT_EQ(list.model()->index(0, 0).data().toString(), "customer_id");
    hands::key(list, Qt::Key_Escape);
    EXPECT_FALSE(list.isVisible());
    EXPECT_THAT(text(), testing::EndsWith("o.cust")) << "Escape was for the list";
}

TEST_F(TypingAStatement, FindsTextInTheStatement) {
    panel.type("select id, status, id + 1 as next from orders where id > 3");
    auto& bar = *panel.findChild<designer::FindBar*>();
    EXPECT_FALSE(bar.isVisible());
    hands::key(view(), Qt::Key_F, {}, Qt::ControlModifier);
    ASSERT_TRUE(bar.isVisible());
    auto& field = *bar.findChild<QLineEdit*>("findText");
    view().moveCursor(QTextCursor::Start);
    for (const QChar sign : QStringLiteral("id")) hands::key(field, Qt::Key_unknown, sign);
    const auto at = [&] { return view().textCursor().selectionStart(); };
    EXPECT_EQ(at(), 7);
    hands::key(field, Qt::Key_Return);
    EXPECT_EQ(at(), 19);
    hands::key(field, Qt::Key_Return);
    hands::key(field, Qt::Key_Return);
    EXPECT_EQ(at(), 7) << "round the end";
    hands::key(field, Qt::Key_Return, {}, Qt::ShiftModifier);
    EXPECT_EQ(view().textCursor().selectedText(), "id");
    EXPECT_GT(at(), 40);
    hands::key(field, Qt::Key_Escape);
    EXPECT_FALSE(bar.isVisible());
}
