#include "Scenario.h"

namespace gridstage {

namespace {

TEST_F(AScenario, OfTheMenuInItsThreePlaces) {
    play();
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
    play();
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
