#include "Scenario.h"

namespace gridstage {

namespace {

TEST_F(AScenario, OfColumnsDraggedToTablesAndToTheGrid) {
    play();
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

TEST_F(AScenario, OfTablesMovedSizedScrolledAndClosed) {
    play();
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
  scrolled by 0, 0; deleted '  '
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
  scrolled by 0, 0; deleted 'ORDERS'
> close table 3
event:TableDeleted
  scrolled by 0, disabled, 0; deleted 'PARTS'
)");
}

TEST_F(AScenario, ToldByTheTraces) {
    play();
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
