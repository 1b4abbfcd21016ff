#include "Designer.h"

#include <QCoreApplication>

#include <gtest/gtest.h>

#include <unistd.h>

/// A failed comparison shows the lines.
void PrintTo(const QStringList& lines, std::ostream* out) {
    for (const QString& line : lines) *out << "\n  " << line.toStdString();
}

namespace {

/// From four tables of the sample database to a finished query, and part of the way back.
class AJourney : public testing::Test {
protected:
    Screen screen;
    Designer designer{
        screen, QStringLiteral(ZANDOR_JOURNEY_HOST), {QStringLiteral(ZANDOR_SAMPLE_DATABASE)}};

    void joinTwoTables() {
        designer.click("entry customers country_code");
        designer.carry("entry customers country_code", "entry suppliers country_code");
        EXPECT_EQ(designer.ask("selected suppliers"), QStringList("country_code"));
        designer.picture("journey-2-carried-to-a-column");
        designer.drop();
        designer.awaitEvents({"JoinCreated", "Activate"});
        EXPECT_TRUE(designer.isShown("join 3"));
    }

    void defineTheJoin() {
        designer.openMenu("join 3", "mnuJoinShowDefinition");
        designer.picture("journey-3-menu-of-a-join");
        designer.click("menu mnuJoinShowDefinition");
        designer.pick("cboJoinType", 1, "Left Outer");
        designer.picture("journey-4-definition-of-a-join");
        designer.click("control cmdOk");
        designer.awaitGone("control cmdOk");
        designer.awaitEvents({"Activate", "JoinModified"});
        EXPECT_TRUE(designer.query().contains(
            "join customers.country_code = suppliers.country_code, type 1"));
    }

    void putColumnsOnTheGrid() {
        designer.click("entry orders id");
        screen.holdKey("Control_L");
        designer.click("entry orders ordered_at");
        designer.click("entry orders status");
        screen.letGoOfKey("Control_L");
        await("three columns are selected", [this] {
            return designer.ask("selected orders") == QStringList({"id", "ordered_at", "status"});
        });
        designer.carry("entry orders ordered_at", "cell 4 1");
        designer.picture("journey-5-three-columns-carried-to-the-grid");
        designer.drop();
        designer.awaitEvents({"ColumnCreated", "ColumnCreated", "ColumnCreated", "Activate"});
    }

    void setTheirCells() {
        designer.click("cell 2 2");
        designer.place("control cobSortOrder");
        screen.key("Down");
        await("the item is chosen",
              [this] { return designer.ask("text cobSortOrder") == QStringList("Ascending"); });
        screen.key("Return");
        designer.awaitGone("control cobSortOrder");
        designer.awaitEvents({"ColumnModified"});

        designer.click("cell 3 1");
        designer.pick("cobVisibility", 1, "Not Visible");
        designer.picture("journey-6-visibility-editor");
        // The second click falls on what lies below the button by then.
        screen.doubleClick(designer.place("control cmdSetVisibility"));
        designer.awaitEvents({"ColumnModified"});

        designer.click("cell 4 3");
        designer.type("txtValue", "= 'open'");
        designer.picture("journey-7-criterion");
        screen.key("Return");
        designer.awaitGone("control txtValue");
        designer.awaitEvents({"ColumnModified"});

        designer.click("cell 5 3");
        designer.type("txtValue", "given up");
        screen.key("Escape");
        designer.awaitGone("control txtValue");
        EXPECT_EQ(columns(), QStringList({"column orders.id '' sort 0 hidden",
                                          "column orders.ordered_at '' sort 1 visible",
                                          "column orders.status '' sort 0 visible [= 'open']"}));
    }

    void copyPasteAndDeleteColumns() {
        designer.click("entry customers name");
        designer.choose("entry customers name", "mnuTableDefinitionCopy");
        designer.choose("cell 1 1", "mnuColumnDefinitionPaste");
        designer.awaitEvents({"Activate", "Activate", "ColumnCreated"});
        designer.openMenu("cell 1 3", "mnuColumnDefinitionDelete");
        designer.picture("journey-8-menu-of-a-column");
        designer.click("menu mnuColumnDefinitionDelete");
        designer.awaitEvents({"Activate", "ColumnRemoved"});
        EXPECT_EQ(columns(), QStringList({"column customers.name '' sort 0 visible",
                                          "column orders.id '' sort 0 hidden",
                                          "column orders.status '' sort 0 visible [= 'open']"}));
        designer.picture("journey-9-finished");
    }

    void deleteATable() {
        designer.click("close orders");
        designer.awaitEvents({"TableDeleted"});
        designer.awaitGone("title orders");
        designer.picture("journey-10-table-deleted");
    }

    QStringList columns() { return designer.query().filter("column "); }
};

TEST_F(AJourney, WithMouseAndKeyboardLeavesTheQueryThatWasMade) {
    designer.place("entry orders id");
    designer.picture("journey-1-start");
    EXPECT_EQ(designer.query().filter("join "),
              QStringList({"join orders.customer_id = customers.id, type 0",
                           "join order_lines.order_id = orders.id, type 0"}));
    joinTwoTables();
    defineTheJoin();
    putColumnsOnTheGrid();
    setTheirCells();
    copyPasteAndDeleteColumns();
    deleteATable();
    EXPECT_EQ(designer.query(),
              QStringList({"table suppliers", "table customers", "table order_lines",
                           "join customers.country_code = suppliers.country_code, type 1",
                           "column customers.name '' sort 0 visible"}));
    EXPECT_TRUE(designer.quit());
}

} // namespace

int main(int argc, char** argv) {
    // Whatever happens, nothing is left behind: the children die with this program.
    alarm(120);
    const QCoreApplication application(argc, argv);
    testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}
