#include "GridStage.h"

using namespace zandor;

namespace gridstage {

/// The grid as it is filled from a bound model, and what can be done with columns filled so.
class ABoundGrid : public GridTest {};

TEST_F(ABoundGrid, ShowsEachDefinitionInAColumnOfItsOwnFromTheFirstOn) {
    model->definition(orders, u"ID");
    model->definition(customers, u"NAME");
    bind();
    EXPECT_EQ(fields(3), (Texts{u"ID", u"NAME", u""}));
}

TEST_F(ABoundGrid, ShowsSynonymSortOrderAndVisibilityAsText) {
    auto ascending = model->definition(orders, u"ID");
    ascending->synonym = u"Number";
    ascending->sortOrder = 1;
    auto descending = model->definition(orders, u"TOTAL");
    descending->sortOrder = 2;
    descending->visible = false;
    bind();
    EXPECT_EQ(stage->cell(synonymRow, 1), u"Number");
    EXPECT_EQ(stage->cell(sortRow, 1), u"Ascending");
    EXPECT_EQ(stage->cell(visibleRow, 1), u"Visible");
    EXPECT_EQ(stage->cell(synonymRow, 2), u"");
    EXPECT_EQ(stage->cell(sortRow, 2), u"Descending");
    EXPECT_EQ(stage->cell(visibleRow, 2), u"Invisible");
}

TEST_F(ABoundGrid, LeavesTheSortCellOfAnUnsortedDefinitionEmpty) {
    model->definition(orders, u"ID");
    bind();
    EXPECT_EQ(stage->cell(sortRow, 1), u"");
}

TEST_F(ABoundGrid, ShowsOneCriterionARowInTheirOrder) {
    model->definition(orders, u"ID", {u"> 1", u"= 0", u"< 9"});
    bind();
    EXPECT_EQ(stage->cell(criteriaRow, 1), u"> 1");
    EXPECT_EQ(stage->cell(criteriaRow + 1, 1), u"= 0");
    EXPECT_EQ(stage->cell(criteriaRow + 2, 1), u"< 9");
}

TEST_F(ABoundGrid, MakesAColumnAsWideAsItsFieldAnd120Twips) {
    model->definition(orders, u"CUSTOMER");
    bind();
    EXPECT_EQ(grid().ColWidth(1), stage->toolkit().TextWidth(u"CUSTOMER") + 120);
}

TEST_F(ABoundGrid, CarriesTheNumberOfEachKeyInItsColumn) {
    model->definition(orders, u"ID")->key = u"x7";
    bind();
    EXPECT_EQ(grid().ColData(1), 7);
}

TEST_F(ABoundGrid, LeavesAColumnUntiedWhoseKeyHasAnotherForm) {
    model->definition(orders, u"ID")->key = u"x";
    model->definition(orders, u"TOTAL")->key = u"y5";
    model->definition(customers, u"ID")->key = u"x5y";
    bind();
    EXPECT_EQ(grid().ColData(1), 0);
    EXPECT_EQ(grid().ColData(2), 0);
    EXPECT_EQ(grid().ColData(3), 0);
}

TEST_F(ABoundGrid, TiesNoColumnThatTheLastBindingDidNotFill) {
    for (const char16_t* const column : {u"ID", u"CUSTOMER", u"TOTAL"})
        model->definition(orders, column);
    bind();
    model->definitions.items.Remove(u"x1");
    bind();
    ASSERT_EQ(fields(4), (Texts{u"CUSTOMER", u"TOTAL", u"TOTAL", u""}));
    EXPECT_EQ(grid().ColData(2), 3);
    EXPECT_EQ(grid().ColData(3), 0);

    menuOverCell(synonymRow, 3, "mnuColumnDefinitionDelete");
    EXPECT_EQ(model->definitionCount(), 2) << "a stranger's definition stays";
    EXPECT_EQ(stage->boxes.size(), 1U);
}

TEST_F(ABoundGrid, TiesNoColumnToTheModelThatTerminateLeaves) {
    model->definition(orders, u"ID");
    bind();
    control().Terminate();
    ASSERT_EQ(fields(1), Texts{u"ID"});
    EXPECT_EQ(grid().ColData(1), 0);
}

TEST_F(ABoundGrid, LetsTheUserEditADefinitionFilledByBinding) {
    auto first = model->definition(orders, u"ID");
    auto second = model->definition(orders, u"TOTAL");
    bind();
    press(left, sortRow, 2);
    stage->choose("cobSortOrder", 2);
    stage->clickButton("cmdSetSortOrder");
    EXPECT_EQ(second->sortOrder, 2);
    EXPECT_EQ(first->sortOrder, 0);
    EXPECT_EQ(stage->cell(sortRow, 2), u"Descending");
    ASSERT_EQ(events(), Names{"ColumnModified"});
    EXPECT_EQ(stage->raised[0].arguments.Definition.get(), second.get());
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(ABoundGrid, LetsTheUserEditTheCriteriaShownByBinding) {
    auto definition = model->definition(orders, u"ID", {u"> 1", u"= 0"});
    bind();
    press(left, criteriaRow + 1, 1);
    EXPECT_EQ(stage->look("txtValue").text, u"= 0");
    stage->type("txtValue", u"= 3");
    stage->clickButton("cmdSetTextValue");
    EXPECT_EQ(definition->criterion(u"5"), u"= 3");
    EXPECT_EQ(definition->criterion(u"4"), u"> 1");
}

TEST_F(ABoundGrid, LetsTheUserDeleteADefinitionFilledByBinding) {
    auto first = model->definition(orders, u"ID");
    auto second = model->definition(orders, u"TOTAL");
    bind();
    menuOverCell(synonymRow, 1, "mnuColumnDefinitionDelete");
    EXPECT_EQ(fields(2), (Texts{u"TOTAL", u""}));
    ASSERT_EQ(model->definitionCount(), 1);
    EXPECT_EQ(&model->definitionAt(1), second.get());
    ASSERT_EQ(events(), (Names{"Activate", "ColumnRemoved"}));
    EXPECT_EQ(stage->raised[1].arguments.Definition.get(), first.get());
}

TEST_F(ABoundGrid, KeepsBoundColumnsTiedWhenAColumnIsInsertedBeforeThem) {
    auto bound = model->definition(orders, u"ID");
    bind();
    drag(1, {total}, 1);
    EXPECT_EQ(fields(2), (Texts{u"ORDERS.TOTAL", u"ID"}));
    press(left, visibleRow, 2);
    stage->choose("cobVisibility", 1);
    stage->clickButton("cmdSetVisibility");
    EXPECT_FALSE(bound->visible);
}

TEST_F(ABoundGrid, RefusesToEditAnUntiedColumn) {
    model->definition(orders, u"ID")->key = u"y5";
    bind();
    press(left, sortRow, 1);
    stage->clickButton("cmdSetSortOrder");
    EXPECT_EQ(stage->boxes,
              (Boxes{report(u"cmdSetSortOrder_Click", platform::errors::invalidProcedureCall())}));
    EXPECT_EQ(events(), Names{});
}

} // namespace gridstage
