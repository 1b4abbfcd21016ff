#include "GridStage.h"

namespace gridstage {

class ADoubleClickOnAnEntry : public GridTest {
protected:
    ADoubleClickOnAnEntry() {
        model->definition(customers, u"NAME");
        bind();
        stage->comforts().setFlags({.AddsOnDoubleClick = true});
    }
};

TEST_F(ADoubleClickOnAnEntry, AddsItBehindTheLastOutputColumn) {
    stage->doubleClickEntry(1, total);
    stage->doubleClickEntry(2, id);
    EXPECT_EQ(fields(4), (Texts{u"NAME", u"ORDERS.TOTAL", u"CUSTOMERS.ID", u""}));
    EXPECT_EQ(events(), (Names{"ColumnCreated", "Activate", "ColumnCreated", "Activate"}));
    ASSERT_EQ(model->definitionCount(), 3);
    EXPECT_EQ(model->definitionAt(2).column.get(), orders->columnRef(u"TOTAL").get());
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(ADoubleClickOnAnEntry, TiesTheNewColumnToItsDefinition) {
    stage->doubleClickEntry(1, total);
    EXPECT_EQ(grid().ColData(2), 2);
    EXPECT_EQ(stage->cell(visibleRow, 2), u"Visible");
}

TEST_F(ADoubleClickOnAnEntry, AddsAllColumnsAsWell) {
    stage->doubleClickEntry(1, allColumns);
    EXPECT_EQ(fields(3), (Texts{u"NAME", u"ORDERS.*", u""}));
}

TEST_F(ADoubleClickOnAnEntry, LeavesItAloneSelected) {
    stage->selectEntries(1, {id, customer});
    stage->doubleClickEntry(1, total);
    EXPECT_EQ(stage->look("lstTable(1)").selected, (Texts{u"TOTAL"}));
}

TEST_F(ADoubleClickOnAnEntry, LeavesWhatWasCopied) {
    copy(1, {customer});
    stage->doubleClickEntry(2, id);
    menuOverCell(synonymRow, 1, "mnuColumnDefinitionPaste");
    EXPECT_EQ(fields(4), (Texts{u"ORDERS.CUSTOMER", u"NAME", u"CUSTOMERS.ID", u""}));
}

TEST_F(ADoubleClickOnAnEntry, AddsNothingToAFullGrid) {
    for (std::int32_t col = 2; col < grid().Cols(); ++col) grid().TextMatrix(0, col, u"taken");
    stage->doubleClickEntry(1, total);
    EXPECT_EQ(stage->cell(fieldRow, grid().Cols() - 1), u"taken");
    EXPECT_EQ(events(), Names{});
}

TEST_F(ADoubleClickOnAnEntry, AddsNothingWhereThereIsNoGrid) {
    control().OnlyJoin(true);
    stage->doubleClickEntry(1, total);
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(model->definitionCount(), 1);
}

TEST_F(ADoubleClickOnAnEntry, ReportsAHostThatRefuses) {
    model->calls->failNext("Zandor.AddColumnDefinition", refusal());
    stage->doubleClickEntry(1, total);
    ASSERT_FALSE(stage->boxes.empty());
    EXPECT_EQ(stage->boxes[0], report(u"AddNewAndCriterium", refusal()));
}

TEST_F(ADoubleClickOnAnEntry, IsTwoPressesToTheBareControl) {
    stage->comforts().setFlags({});
    stage->doubleClickEntry(1, total);
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(model->definitionCount(), 1);
}

} // namespace gridstage
