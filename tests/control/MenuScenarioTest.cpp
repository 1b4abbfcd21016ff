#include "Scenario.h"

namespace gridstage {

namespace {

TEST_F(AScenario, OfTheMenuInItsThreePlaces) {
    menuOnEntry(ORDERS, total);
    menuOnCell(synonymRow, 1);
    menuOnEntry(ORDERS, customer, "mnuTableDefinitionCopy");
    menuOnEntry(ORDERS, total, "mnuTableDefinitionPaste");
    menuOnEntry(CUSTOMERS, id, "mnuTableDefinitionPaste");
    note("> menu on the canvas");
    menuOnCanvas(4350, 3900);
    menuOnCell(synonymRow, 1, "mnuColumnDefinitionPaste");
    menuOnCell(sortRow, 1, "mnuColumnDefinitionPaste");
    menuOnEntry(PARTS, no, "mnuTableDefinitionCopy");
    menuOnCell(synonymRow, 0, "mnuColumnDefinitionPaste");
    menuOnCell(synonymRow, 2, "mnuColumnDefinitionDelete");
    menuOnCell(synonymRow, 7, "mnuColumnDefinitionDelete");
    menuOnJoin(1, "mnuJoinDelete");
    menuOnEntry(PARTS, no, "mnuTableDefinitionDelete");
    noteQuery(3);
    EXPECT_EQ(story(), R"(
> menu on ORDERS.TOTAL 
event:Activate
message:0
menu
  can mnuTableDefinitionCopy, mnuTableDefinitionDelete
message:1
> menu on column 1 
event:Activate
message:0
menu
  can 
message:1
> menu on ORDERS.CUSTOMER mnuTableDefinitionCopy
event:Activate
message:0
menu
  can mnuTableDefinitionCopy, mnuTableDefinitionDelete
message:1
> menu on ORDERS.TOTAL mnuTableDefinitionPaste
event:Activate
message:0
menu
  can mnuTableDefinitionCopy, mnuTableDefinitionDelete
message:1
> menu on CUSTOMERS.ID mnuTableDefinitionPaste
event:Activate
message:0
menu
  can mnuTableDefinitionCopy, mnuTableDefinitionPaste, mnuTableDefinitionDelete
message:1
> menu on the canvas
event:Activate
message:0
menu
  can 
message:1
> menu on column 1 mnuColumnDefinitionPaste
event:Activate
message:0
menu
  can mnuColumnDefinitionPaste
event:ColumnCreated
message:1
> menu on column 1 mnuColumnDefinitionPaste
event:Activate
message:0
menu
  can mnuColumnDefinitionPaste, mnuColumnDefinitionDelete
event:ColumnCreated
message:1
> menu on PARTS.NO mnuTableDefinitionCopy
event:Activate
message:0
menu
  can mnuTableDefinitionCopy, mnuTableDefinitionPaste, mnuTableDefinitionDelete
message:1
> menu on column 0 mnuColumnDefinitionPaste
event:Activate
message:0
menu
  can mnuColumnDefinitionPaste
event:ColumnCreated
message:1
> menu on column 2 mnuColumnDefinitionDelete
event:Activate
message:0
menu
  can mnuColumnDefinitionPaste, mnuColumnDefinitionDelete
event:ColumnRemoved
message:1
> menu on column 7 mnuColumnDefinitionDelete
event:Activate
message:0
menu
  can mnuColumnDefinitionPaste
message:1
> menu on join 1 mnuJoinDelete
event:Activate
message:0
menu
  can mnuJoinShowDefinition, mnuJoinDelete
event:JoinRemoved
message:1
> menu on PARTS.NO mnuTableDefinitionDelete
event:Activate
message:0
menu
  can mnuTableDefinitionCopy, mnuTableDefinitionDelete
event:TableDeleted
message:1
> query
x1 CUSTOMER '' 0 visible
x3 NO '' 0 visible
grid ORDERS.CUSTOMER, -, -
)");
    EXPECT_FALSE(stage->exists("lstTable(3)"));
}

TEST_F(AScenario, OfAJoinsDefinitionShownKeptLeftAndChanged) {
    dragTo(ORDERS, {customer}, CUSTOMERS, id);
    const auto choose = [this](std::int16_t type, std::int16_t compare, const char* button) {
        return [this, type, compare, button] {
            stage->choose("cboJoinType", type);
            stage->choose("cboJoinCompareOperator", compare);
            if (*button) stage->clickButton(button);
        };
    };
    const std::string show = "mnuJoinShowDefinition";
    menuOnJoin(1, show, [this] { stage->clickButton("cmdOk"); });
    menuOnJoin(1, show, [this] { stage->clickButton("cmdCancel"); });
    menuOnJoin(1, show, choose(1, 5, "cmdCancel"));
    menuOnJoin(1, show, choose(2, 3, ""));
    menuOnJoin(1, show, [this] { stage->key("cboJoinType", escape); });
    menuOnJoin(1, show, choose(1, 0, "cmdOk"));
    noteQuery(1);
    control().JoinModifyDisabled(0);
    menuOnJoin(1, show, choose(3, 4, "cmdOk"));
    noteQuery(1);
    EXPECT_EQ(story(), R"(
> drag ORDERS.CUSTOMER to CUSTOMERS.ID
event:JoinCreated
event:Activate
> menu on join 1 mnuJoinShowDefinition
event:Activate
message:0
menu
  can mnuJoinShowDefinition, mnuJoinDelete
dialog
  shows Normal =
message:1
> menu on join 1 mnuJoinShowDefinition
event:Activate
message:0
menu
  can mnuJoinShowDefinition, mnuJoinDelete
dialog
  shows Normal =
message:1
> menu on join 1 mnuJoinShowDefinition
event:Activate
message:0
menu
  can mnuJoinShowDefinition, mnuJoinDelete
dialog
  shows Normal =
message:1
> menu on join 1 mnuJoinShowDefinition
event:Activate
message:0
menu
  can mnuJoinShowDefinition, mnuJoinDelete
dialog
  shows Normal =
message:1
> menu on join 1 mnuJoinShowDefinition
event:Activate
message:0
menu
  can mnuJoinShowDefinition, mnuJoinDelete
dialog
  shows Normal =
message:1
> menu on join 1 mnuJoinShowDefinition
event:Activate
message:0
menu
  can mnuJoinShowDefinition, mnuJoinDelete
dialog
  shows Normal =
event:JoinModified
message:1
> query
ORDERS.CUSTOMER - CUSTOMERS.ID 1 0
grid -
> menu on join 1 mnuJoinShowDefinition
event:Activate
message:0
menu
  can mnuJoinShowDefinition, mnuJoinDelete
dialog
  shows Left Outer =
message:1
> query
ORDERS.CUSTOMER - CUSTOMERS.ID 1 0
grid -
)");
}

} // namespace

} // namespace gridstage
