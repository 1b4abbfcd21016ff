#include "Scenario.h"

namespace gridstage {

namespace {

TEST_F(AScenario, OfCellsSetLeftAndSetTwice) {
    dragToColumn(ORDERS, {id, total}, 1);
    openCell(synonymRow, 1);
    stage->type("txtValue", u"Number");
    stage->clickButton("cmdSetTextValue");
    openCell(synonymRow, 2);
    stage->type("txtValue", u"Sum");
    stage->key("txtValue", enter);
    noteEditor();
    openCell(sortRow, 1);
    stage->choose("cobSortOrder", 2);
    stage->key("cobSortOrder", enter);
    openCell(sortRow, 1);
    stage->choose("cobSortOrder", 1);
    stage->key("cobSortOrder", escape);
    noteEditor();
    openCell(visibleRow, 2);
    stage->choose("cobVisibility", 1);
    stage->clickButton("cmdSetVisibility");
    openCell(visibleRow, 1);
    stage->choose("cobVisibility", 1);
    stage->key("cobVisibility", escape);
    openCell(criteriaRow, 1);
    stage->type("txtValue", u"> 7");
    stage->clickButton("cmdSetTextValue");
    openCell(criteriaRow + 1, 1);
    stage->type("txtValue", u"never");
    openCell(criteriaRow, 1);
    stage->type("txtValue", u"never either");
    note("> press the canvas");
    stage->pressCanvas(left, 4350, 3900);
    stage->releaseCanvas(left, 4350, 3900);
    noteEditor();
    openCell(criteriaRow, 1);
    note("> press the field row");
    press(left, fieldRow, 1);
    noteEditor();
    openCell(criteriaRow, 2);
    stage->type("txtValue", u"");
    stage->clickButton("cmdSetTextValue");
    openCell(criteriaRow, 1);
    stage->type("txtValue", u"");
    stage->clickButton("cmdSetTextValue");
    openCell(synonymRow, 5);
    stage->type("txtValue", u"lost");
    stage->clickButton("cmdSetTextValue");
    note("> again");
    stage->clickButton("cmdSetTextValue");
    noteEditor();
    note("> scroll the grid");
    stage->scrollGrid(1, 2);
    noteEditor();
    noteQuery(2);
    EXPECT_EQ(story(), R"(
> drag ORDERS.ID, ORDERS.TOTAL to column 1
event:ColumnCreated
event:ColumnCreated
event:Activate
> open row 1 of column 1
  txtValue reads ''
event:ColumnModified
> open row 1 of column 2
  txtValue reads ''
event:ColumnModified
> open row 2 of column 1
  cobSortOrder reads '(None)'
event:ColumnModified
> open row 2 of column 1
  cobSortOrder reads 'Descending'
> open row 3 of column 2
  cobVisibility reads 'Visible'
event:ColumnModified
> open row 3 of column 1
  cobVisibility reads 'Visible'
> open row 4 of column 1
  txtValue reads ''
event:ColumnModified
> open row 5 of column 1
  txtValue reads ''
> open row 4 of column 1
  txtValue reads '> 7'
> press the canvas
> open row 4 of column 1
  txtValue reads '> 7'
> press the field row
> open row 4 of column 2
  txtValue reads ''
> open row 4 of column 1
  txtValue reads '> 7'
event:ColumnModified
> open row 1 of column 5
  txtValue reads ''
box:Module: TalvikDBxZandor.Zandor
  Function: cmdSetTextValue_Click
  Error No: 5
  Error: Invalid procedure call or argument
> again
box:Module: TalvikDBxZandor.Zandor
  Function: cmdSetTextValue_Click
  Error No: 5
  Error: Invalid procedure call or argument
  txtValue reads 'lost'
> scroll the grid
> query
x1 ID 'Number' 2 visible
x2 TOTAL 'Sum' 0 hidden
grid ORDERS.ID, ORDERS.TOTAL
)");
}

} // namespace

} // namespace gridstage
