#include "Scenario.h"

namespace gridstage {

namespace {

TEST_F(AScenario, OfColumnsDraggedToTablesAndToTheGrid) {
    dragTo(ORDERS, {customer}, CUSTOMERS, id);
    dragTo(ORDERS, {id}, ORDERS, total);
    dragTo(ORDERS, {id}, CUSTOMERS, allColumns);
    dragTo(ORDERS, {allColumns}, CUSTOMERS, name);
    dragTo(ORDERS, {id, total}, CUSTOMERS, name);
    dragTo(CUSTOMERS, {id}, PARTS, nowhere);
    dragToColumn(ORDERS, {id, customer, total}, 1);
    dragToColumn(CUSTOMERS, {name}, 2);
    dragToColumn(PARTS, {no}, 0);
    dragToColumn(ORDERS, {allColumns}, 7);
    noteQuery(6);
    EXPECT_EQ(story(), R"(
> drag ORDERS.CUSTOMER to CUSTOMERS.ID
event:JoinCreated
event:Activate
> drag ORDERS.ID to ORDERS.TOTAL
event:Activate
> drag ORDERS.ID to CUSTOMERS.*
> drag ORDERS.* to CUSTOMERS.NAME
> drag ORDERS.ID, ORDERS.TOTAL to CUSTOMERS.NAME
event:JoinCreated
event:Activate
> drag CUSTOMERS.ID to PARTS.(empty)
> drag ORDERS.ID, ORDERS.CUSTOMER, ORDERS.TOTAL to column 1
event:ColumnCreated
event:ColumnCreated
event:ColumnCreated
event:Activate
> drag CUSTOMERS.NAME to column 2
event:ColumnCreated
event:Activate
> drag PARTS.NO to column 0
event:ColumnCreated
event:Activate
> drag ORDERS.* to column 7
event:ColumnCreated
event:Activate
> query
ORDERS.CUSTOMER - CUSTOMERS.ID 0 0
ORDERS.ID - CUSTOMERS.NAME 0 0
x1 ID '' 0 visible
x2 CUSTOMER '' 0 visible
x3 TOTAL '' 0 visible
x4 NAME '' 0 visible
x5 NO '' 0 visible
x6 * '' 0 visible
grid PARTS.NO, ORDERS.ID, CUSTOMERS.NAME, ORDERS.CUSTOMER, ORDERS.TOTAL, -
)");
    EXPECT_EQ(stage->cell(fieldRow, 7), u"ORDERS.*");
}

// The mouse alone; no key is pressed.
TEST_F(AScenario, OfTablesMovedSizedScrolledAndClosed) {
    dragTo(ORDERS, {customer}, CUSTOMERS, id);
    dragTo(CUSTOMERS, {name}, PARTS, no);
    dragToColumn(CUSTOMERS, {id, name}, 1);
    const auto move = [this](std::int16_t table, float x, float y) {
        note("> move table " + std::to_string(table));
        stage->moveTable(table, x, y);
        notePlace(table);
    };
    move(ORDERS, 900, 600);
    move(ORDERS, -450, -600);
    move(PARTS, 11700, 4350);
    move(PARTS, 9000, 3000);
    note("> size table 1");
    stage->resizeTable(ORDERS, 3000, 2700);
    notePlace(ORDERS);
    note("> scroll");
    stage->scrollBarTo("hsbTable", 300);
    stage->scrollBarTo("vsbTable", 600);
    stage->scrollList(ORDERS, 1);
    move(ORDERS, 150, 300);
    move(PARTS, 12000, 6000);
    note("> home");
    stage->clickButton("cmdHome");
    EXPECT_EQ(stage->look("hsbTable").value, 0);
    EXPECT_EQ(stage->look("fraTable").bounds.Top, 0);
    note("> close table 2");
    stage->closeTable(CUSTOMERS);
    noteQuery(1);
    note("> close table 1");
    stage->closeTable(ORDERS);
    EXPECT_EQ(control().DeletedTable, u"ORDERS");
    EXPECT_TRUE(stage->look("hsbTable").enabled);
    note("> close table 3");
    stage->closeTable(PARTS);
    EXPECT_FALSE(stage->look("hsbTable").enabled);
    EXPECT_EQ(story(), R"(
> drag ORDERS.CUSTOMER to CUSTOMERS.ID
event:JoinCreated
event:Activate
> drag CUSTOMERS.NAME to PARTS.NO
event:JoinCreated
event:Activate
> drag CUSTOMERS.ID, CUSTOMERS.NAME to column 1
event:ColumnCreated
event:ColumnCreated
event:Activate
> move table 1
event:TableMoved
  at 900 600, 2400 by 2400
> move table 1
event:TableMoved
  at 0 0, 2400 by 2400
> move table 3
event:TableMoved
  at 11400 3900, 2100 by 2400
> move table 3
event:TableMoved
  at 9000 3000, 2100 by 2400
> size table 1
  at 0 0, 3000 by 2700
> scroll
> move table 1
event:TableMoved
  at 300 600, 3000 by 2700
> move table 3
event:TableMoved
  at 11700 4500, 2100 by 2400
> home
> close table 2
event:TableDeleted
> query
ORDERS.CUSTOMER - CUSTOMERS.ID 0 0
CUSTOMERS.NAME - PARTS.NO 0 0
x1 ID '' 0 visible
x2 NAME '' 0 visible
grid -
> close table 1
event:TableDeleted
> close table 3
event:TableDeleted
)");
}

TEST_F(AScenario, ToldByTheTraces) {
    note("> focus table 3");
    stage->focus("lstTable(3)");
    stage->selectEntries(ORDERS, {id, total});
    stage->selectEntries(CUSTOMERS, {name});
    control().DebugSwitch(1);
    note("> press ORDERS.ID");
    stage->pressEntry(ORDERS, id, left);
    note("> release it");
    stage->releaseEntry(ORDERS, id, left);
    note("> menu on CUSTOMERS.NAME");
    stage->pressEntry(CUSTOMERS, name, right);
    stage->releaseEntry(CUSTOMERS, name, right);
    stage->selectEntries(ORDERS, {customer});
    dragTo(ORDERS, {customer}, CUSTOMERS, id);
    note("> move table 3");
    stage->moveTable(PARTS, 9000, 900);
    note("> size table 3");
    stage->resizeTable(PARTS, 2400, 2100);
    menuOnJoin(1, "mnuJoinShowDefinition");
    note("> close table 2");
    stage->closeTable(CUSTOMERS);
    note("> close the control");
    stage->closeControl();
    EXPECT_EQ(story(), R"(
> focus table 3
> press ORDERS.ID
box:SetCurrentTable
box:Looking for Table: ORDERS
box:Table found.
box:Table refreshed.
box:SetSelectedTable
box:lstTable_ColumnMouseDown
box:Selected column found: ID
box:Tabulet Column selected: ID
box:Selected column found: TOTAL
box:Tabulet Column selected: TOTAL
> release it
> menu on CUSTOMERS.NAME
box:SetCurrentTable
box:Looking for Table: CUSTOMERS
box:Table found.
box:Table refreshed.
box:SetSelectedTable
box:lstTable_ColumnMouseDown
box:Selected column found: NAME
box:Tabulet Column selected: NAME
event:Activate
message:0
menu
  can mnuTableDefinitionCopy, mnuTableDefinitionDelete
message:1
> drag ORDERS.CUSTOMER to CUSTOMERS.ID
box:SetCurrentTable
box:Looking for Table: ORDERS
box:Table found.
box:Table refreshed.
box:SetSelectedTable
box:lstTable_ColumnMouseDown
box:Selected column found: CUSTOMER
box:Tabulet Column selected: CUSTOMER
event:JoinCreated
event:Activate
> move table 3
box:SetCurrentTable
box:Looking for Table: PARTS
box:Table found.
box:Table refreshed.
box:SetSelectedTable
event:TableMoved
box:OrganizeTables
> size table 3
box:OrganizeTables
> menu on join 1 mnuJoinShowDefinition
event:Activate
message:0
menu
  can mnuJoinShowDefinition, mnuJoinDelete
box:Module: TalvikDBxZandor.frmJoinDefinition
  Function: P_SET Join
  Message: Left Table Name: ORDERS
box:Module: TalvikDBxZandor.frmJoinDefinition
  Function: P_SET Join
  Message: Left Column Name: CUSTOMER
box:Module: TalvikDBxZandor.frmJoinDefinition
  Function: P_SET Join
  Message: Right Table Name: CUSTOMERS
box:Module: TalvikDBxZandor.frmJoinDefinition
  Function: P_SET Join
  Message: Right Column Name: ID
dialog
  shows Normal =
message:1
> close table 2
box:OrganizeTables
event:TableDeleted
> close the control
box:UserControl_Terminate
box:Terminate
box:OrganizeTables
box:OrganizeTables
)");
}

} // namespace

} // namespace gridstage
