#include "Scenario.h"

namespace gridstage {

namespace {

TEST_F(AScenario, OfCellsSetLeftAndSetTwice) {
    play();
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
