#include "Drawn.h"

#include "designer/statement/SqlView.h"
#include "designer/statement/StatementPanel.h"
#include "support/QtHands.h"

#include <gmock/gmock.h>

#include <QClipboard>
#include <QComboBox>
#include <QGuiApplication>
#include <QListWidget>
#include <QPlainTextEdit>
#include <QPushButton>

using namespace zandor;

using model::Finding;
using model::sql::Dialect;
using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

class TheStatementPanel : public testing::Test {
protected:
    void SetUp() override {
        panel.setDatabaseDialect(Dialect::SQLite);
        panel.resize(320, 400);
        panel.show();
    }

    designer::SqlView& view() { return *panel.findChild<designer::SqlView*>(); }
    QListWidget& list() { return *panel.findChild<QListWidget*>(); }
    QComboBox& dialects() { return *panel.findChild<QComboBox*>(); }
    QPushButton& copy() { return *panel.findChild<QPushButton*>("copy"); }
    std::string text() { return view().toPlainText().toStdString(); }
    std::string instead() { return view().placeholderText().toStdString(); }

    testing::AssertionResult shows(const char* part) {
        if (soon([&] { return text().find(part) != std::string::npos; }))
            return testing::AssertionSuccess();
        return testing::AssertionFailure() << "it shows " << text();
    }

    /// Two tables without a join, and a criterion that cannot be read.
    void drawFaults() {
        const auto orders = drawn.table(u"orders");
        drawn.table(u"customers", 3000);
        drawn.output(orders, u"name", u"Like");
        drawn.finish();
        ASSERT_TRUE(soon([&] { return list().count() == 2; }));
    }

    Drawn drawn;
    designer::StatementPanel panel{drawn.document};
};

} // namespace

TEST_F(TheStatementPanel, InvitesToAddATable) {
    EXPECT_EQ(text(), "");
    EXPECT_EQ(instead(), "Add a table to begin: the statement appears here.");
    EXPECT_FALSE(list().isVisible());
    EXPECT_FALSE(copy().isEnabled());
}

TEST_F(TheStatementPanel, ShowsTheStatementAndFollowsTheQuery) {
    drawn.output(drawn.table(u"orders"), u"name");
    drawn.finish();
    EXPECT_TRUE(shows("SELECT\n    orders.name\nFROM orders"));
    drawn.document.change(
        "Add", [](model::Query& query) { query.addTable(Drawn::description(u"customers")); });
    EXPECT_TRUE(shows("customers"));
}

TEST_F(TheStatementPanel, WritesValuesOut) {
    drawn.output(drawn.table(u"orders"), u"name", u"'Smith'");
    drawn.finish();
    EXPECT_TRUE(shows("'Smith'"));
}

TEST_F(TheStatementPanel, IsMadeOnceForManyChanges) {
    int times = 0;
    QObject::connect(&view(), &QPlainTextEdit::textChanged, [&] { ++times; });
    for (int n = 0; n < 20; ++n) {
        drawn.table(u"t" + platform::decimal(n));
        drawn.finish();
        EXPECT_EQ(times, 0);
    }
    EXPECT_TRUE(shows("t19"));
    EXPECT_EQ(times, 1);
}

TEST_F(TheStatementPanel, WorksWhileItCannotBeSeenForCellsShowWhatItFinds) {
    panel.hide();
    drawn.table(u"orders");
    drawn.finish();
    QCoreApplication::processEvents();
    EXPECT_THAT(text(), HasSubstr("FROM orders"));
}

TEST_F(TheStatementPanel, SpeaksTheDatabasesDialectUnlessAnotherIsChosen) {
    drawn.table(u"order");
    drawn.finish();
    EXPECT_TRUE(shows("\"order\""));
    panel.setDatabaseDialect(Dialect::MySQL);
    EXPECT_EQ(dialects().currentText(), "MySQL/MariaDB (as the database)");
    EXPECT_TRUE(shows("`order`"));
    for (int n = 0; n < 4; ++n) hands::key(dialects(), Qt::Key_Down);
    EXPECT_EQ(dialects().currentText(), "SQL Server");
    EXPECT_TRUE(shows("[order]"));
    panel.setDatabaseDialect(Dialect::PostgreSQL);
    QCoreApplication::processEvents();
    EXPECT_EQ(panel.dialect(), Dialect::SqlServer);
    EXPECT_THAT(text(), HasSubstr("[order]"));
}

TEST_F(TheStatementPanel, CopiesTheStatement) {
    drawn.table(u"orders");
    drawn.finish();
    ASSERT_TRUE(shows("FROM orders"));
    hands::click(copy(), copy().rect().center());
    EXPECT_EQ(QGuiApplication::clipboard()->text(), view().statement() + u';');
    EXPECT_THAT(QGuiApplication::clipboard()->text().toStdString(), StartsWith("SELECT"));
}

TEST_F(TheStatementPanel, CopiesParametersAsTheEnginesOwnShellTakesThem) {
    drawn.output(drawn.table(u"orders"), u"name", u"[Whose order?]");
    drawn.finish();
    ASSERT_TRUE(shows("= :\"Whose order?\""));
    const auto copied = [this](Dialect dialect) {
        panel.setDatabaseDialect(dialect);
        panel.copy();
        return QGuiApplication::clipboard()->text().toStdString();
    };
    EXPECT_THAT(copied(Dialect::SQLite), EndsWith("WHERE orders.name = :Whose_order;"));
    EXPECT_THAT(copied(Dialect::PostgreSQL), EndsWith("WHERE orders.name = :'Whose_order';"));
    EXPECT_THAT(copied(Dialect::MySQL), EndsWith("WHERE orders.name = @Whose_order;"));
    EXPECT_THAT(copied(Dialect::SqlServer), EndsWith("WHERE orders.name = @Whose_order;"));
}

TEST_F(TheStatementPanel, CopiesTheStatementOfTheMomentEvenWhileItCannotBeSeen) {
    panel.hide();
    drawn.table(u"orders");
    drawn.finish();
    panel.copy();
    EXPECT_THAT(QGuiApplication::clipboard()->text().toStdString(), HasSubstr("FROM orders"));
}

TEST_F(TheStatementPanel, SaysWhyThereIsNoStatement) {
    const auto orders = drawn.table(u"orders");
    drawn.join(orders, drawn.table(u"customers", 3000), 3);
    drawn.finish();
    ASSERT_TRUE(shows("FULL JOIN"));
    panel.setDatabaseDialect(Dialect::MySQL);
    ASSERT_TRUE(soon([&] { return text().empty(); }));
    EXPECT_EQ(instead(), "MySQL/MariaDB cannot say this query:\n\nMySQL/MariaDB has no join that "
                         "keeps all rows of both tables: let this one keep those of one table.");
    EXPECT_FALSE(copy().isEnabled());
    EXPECT_EQ(list().count(), 1);
}

TEST_F(TheStatementPanel, GivesFindingsNoMoreRoomThanTheyNeed) {
    panel.resize(900, 400);
    drawFaults();
    const auto needed = [&] {
        return list().visualItemRect(list().item(list().count() - 1)).bottom();
    };
    EXPECT_TRUE(soon([&] { return list().viewport()->height() >= needed(); }));
    EXPECT_LT(list().height(), needed() + 30);
    EXPECT_GT(view().height(), list().height());
    panel.resize(900, 160);
    EXPECT_TRUE(soon([&] { return list().height() <= view().height() + 1; }));
}

TEST_F(TheStatementPanel, ListsErrorsBeforeWarningsEachWithItsMark) {
    drawFaults();
    EXPECT_TRUE(list().isVisible());
    drawn.document.change("Add", [this](model::Query& query) {
        const auto all = drawn.library.NewZDColumnDefinition();
        all->Column(query.tableNamed(u"orders")->Columns().Item(1));
        all->SortOrder(1);
        query.AddColumnDefinition(all);
    });
    ASSERT_TRUE(soon([&] { return list().count() == 3; }));
    EXPECT_EQ(list().item(0)->text(),
              "orders.name: At character 5: after Like comes a pattern, as in Like 'A*'.");
    EXPECT_EQ(list().item(1)->text(), "No join connects customers with orders, so that every row "
                                      "of one comes with every row of the other: draw a join "
                                      "between them, add the table that lies between, or "
                                      "delete one.");
    EXPECT_EQ(list().item(2)->text(),
              "orders.* stands for all columns and cannot be sorted by: add "
              "the column that is to decide, and sort by that.");
    EXPECT_THAT(list().item(0)->data(Qt::AccessibleTextRole).toString().toStdString(),
                StartsWith("Error: orders.name"));
    EXPECT_THAT(list().item(1)->data(Qt::AccessibleTextRole).toString().toStdString(),
                StartsWith("Warning: No join"));
    const auto picture = [&](int row) { return list().item(row)->icon().pixmap(16).toImage(); };
    EXPECT_NE(picture(0), picture(1));
    EXPECT_FALSE(picture(0).isNull());
}

TEST_F(TheStatementPanel, HasNoListWhenThereIsNothingToSay) {
    drawFaults();
    drawn.document.setQuery(platform::makeRef<model::Query>());
    EXPECT_TRUE(soon([&] { return !list().isVisible(); }));
}

TEST_F(TheStatementPanel, TellsWhichFindingIsClickedOrEntered) {
    drawFaults();
    std::vector<Finding> chosen;
    QObject::connect(&panel, &designer::StatementPanel::findingChosen,
                     [&](const Finding& finding) { chosen.push_back(finding); });
    hands::click(*list().viewport(), list().visualItemRect(list().item(1)).center());
    ASSERT_EQ(chosen.size(), 1U);
    EXPECT_EQ(chosen[0].kind, Finding::Kind::cartesianProduct);
    EXPECT_EQ(chosen[0].table, u"t2");
    hands::key(list(), Qt::Key_Up);
    hands::key(list(), Qt::Key_Return);
    ASSERT_EQ(chosen.size(), 2U);
    EXPECT_EQ(chosen[1].kind, Finding::Kind::badCriterion);
    EXPECT_EQ(chosen[1].definition, u"x1");
}

TEST_F(TheStatementPanel, SurvivesThatTheQueryGoesWhenAFindingIsChosen) {
    drawFaults();
    QObject::connect(&panel, &designer::StatementPanel::findingChosen, [&](const Finding& finding) {
        drawn.document.setQuery(platform::makeRef<model::Query>());
        QCoreApplication::processEvents();
        EXPECT_EQ(finding.definition, u"x1");
    });
    hands::click(*list().viewport(), list().visualItemRect(list().item(0)).center());
    EXPECT_EQ(list().count(), 0);
}

TEST_F(TheStatementPanel, GoesIntoANarrowDock) { EXPECT_LE(panel.minimumSizeHint().width(), 260); }
