#include "control/GridStage.h"

#include <Zandor/headless/Toolkit.h>

#include <Zandor/control/basZandor.h>

using namespace zandor;

namespace gridstage {

namespace headless = platform::headless;

/// What only a toolkit that shows everything, and that can be made to fail, tells of the grid.
class TheGridOnAFailingToolkit : public GridTest {
protected:
    TheGridOnAFailingToolkit() {
        definition = model->definition(orders, u"ID", {u"> 1"});
        bind();
    }

    headless::Toolkit& toolkit() { return dynamic_cast<headless::Toolkit&>(stage->toolkit()); }
    void fail(const std::string& call, int nth = 1) {
        toolkit().faults.failNext(call, refusal(), nth);
    }
    std::int16_t alignment(std::int32_t row, std::int32_t col) {
        return toolkit().find<headless::Grid>("sprColumn").cell(row, col).alignment;
    }
    bool isDefault(const std::string& button) {
        return toolkit().find<headless::CommandButton>(button).isDefault();
    }

    Ref<fake::Definition> definition;
};

TEST_F(TheGridOnAFailingToolkit, CentresFieldSortOrderAndVisibilityAndNothingElse) {
    drag(1, {total}, 2);
    for (const std::int32_t row : {fieldRow, sortRow, visibleRow})
        EXPECT_EQ(alignment(row, 1), MSFlexGridLib::alignCenterCenter) << row;
    for (const std::int32_t row : {synonymRow, criteriaRow})
        EXPECT_EQ(alignment(row, 1), MSFlexGridLib::alignLeftCenter) << row;
    EXPECT_EQ(alignment(fieldRow, 2), MSFlexGridLib::alignCenterCenter);
    EXPECT_EQ(alignment(visibleRow, 2), MSFlexGridLib::alignCenterCenter);
}

TEST_F(TheGridOnAFailingToolkit, AlignsACellAnewWhenItsEditorIsSet) {
    for (const std::int32_t row : {synonymRow, sortRow, visibleRow, criteriaRow}) {
        grid().Row(row);
        grid().Col(1);
        grid().CellAlignment(7);
    }
    press(left, sortRow, 1);
    stage->clickButton("cmdSetSortOrder");
    press(left, visibleRow, 1);
    stage->clickButton("cmdSetVisibility");
    press(left, synonymRow, 1);
    stage->clickButton("cmdSetTextValue");
    press(left, criteriaRow, 1);
    stage->clickButton("cmdSetTextValue");
    EXPECT_EQ(alignment(synonymRow, 1), MSFlexGridLib::alignLeftCenter);
    EXPECT_EQ(alignment(sortRow, 1), MSFlexGridLib::alignCenterCenter);
    EXPECT_EQ(alignment(visibleRow, 1), MSFlexGridLib::alignCenterCenter);
    EXPECT_EQ(alignment(criteriaRow, 1), MSFlexGridLib::alignLeftCenter);
}

TEST_F(TheGridOnAFailingToolkit, BringsAnOpeningEditorToTheFront) {
    for (const auto& [row, frame] : {std::pair{sortRow, "fraSortOrder"},
                                     {visibleRow, "fraVisibility"},
                                     {synonymRow, "fraValue"},
                                     {sortRow, "fraSortOrder"}}) {
        press(left, row, 1);
        EXPECT_EQ(toolkit().surface().children().back()->name(), frame);
    }
}

TEST_F(TheGridOnAFailingToolkit, MakesTheSetButtonOfAnOpeningEditorTheDefault) {
    press(left, sortRow, 1);
    EXPECT_TRUE(isDefault("cmdSetSortOrder"));
    press(left, visibleRow, 1);
    EXPECT_TRUE(isDefault("cmdSetVisibility"));
    press(left, synonymRow, 1);
    EXPECT_TRUE(isDefault("cmdSetTextValue"));
}

TEST_F(TheGridOnAFailingToolkit, ReportsAHitTestThatFailsUnderTheModulesName) {
    std::int32_t col = -7;
    std::int32_t row = -7;
    fail("sprColumn.ColPos");
    TalvikDBxZandor::basZandor::SpreadHitTest(toolkit(), col, row, grid(), 3000, 300);
    EXPECT_EQ(stage->boxes,
              Boxes{report(u"SpreadHitTest", refusal(), u"TalvikDBxZandor.basZandor")});
    EXPECT_EQ(col, -7);
    EXPECT_EQ(row, -7);
}

TEST_F(TheGridOnAFailingToolkit, KeepsTheColumnOfAHitTestThatFailsAtItsRow) {
    std::int32_t col = -7;
    std::int32_t row = -7;
    fail("sprColumn.RowPos");
    TalvikDBxZandor::basZandor::SpreadHitTest(toolkit(), col, row, grid(), grid().ColPos(2), 300);
    EXPECT_EQ(stage->boxes.size(), 1U);
    EXPECT_EQ(col, 2);
    EXPECT_EQ(row, -7);
}

TEST_F(TheGridOnAFailingToolkit, OpensNoEditorWhereTheHitTestFails) {
    fail("sprColumn.LeftCol");
    press(left, sortRow, 1);
    EXPECT_EQ(stage->boxes,
              Boxes{report(u"SpreadHitTest", refusal(), u"TalvikDBxZandor.basZandor")});
    EXPECT_FALSE(shows("fraSortOrder"));
}

TEST_F(TheGridOnAFailingToolkit, ReportsEachEditorThatCannotBeOpenedUnderItsName) {
    fail("cobSortOrder.ListIndex=");
    press(left, sortRow, 1);
    fail("cobVisibility.ListIndex=");
    press(left, visibleRow, 1);
    fail("txtValue.Text=");
    press(left, synonymRow, 1);
    EXPECT_EQ(stage->boxes,
              (Boxes{report(u"GetSortOrder", refusal()), report(u"GetVisibility", refusal()),
                     report(u"GetTextValue", refusal())}));
    EXPECT_FALSE(shows("fraSortOrder") || shows("fraVisibility") || shows("fraValue"));
}

TEST_F(TheGridOnAFailingToolkit, KeepsAnEditorOpenWhoseInputCannotTakeTheFocus) {
    fail("txtValue.SetFocus");
    press(left, synonymRow, 1);
    EXPECT_EQ(stage->boxes, Boxes{report(u"GetTextValue", refusal())});
    EXPECT_TRUE(shows("fraValue"));
}

TEST_F(TheGridOnAFailingToolkit, ReportsAnEditorThatCannotBeClosedAndLeavesTheOthers) {
    press(left, sortRow, 1);
    fail("fraValue.Visible");
    Backstage::MakeGetValueFieldsInvisible(control());
    EXPECT_EQ(stage->boxes, Boxes{report(u"MakeGetValueFieldsInvisible", refusal())});
    EXPECT_TRUE(shows("fraSortOrder"));
}

TEST_F(TheGridOnAFailingToolkit, HasChangedTheModelWhenTheCellCannotBeWritten) {
    press(left, sortRow, 1);
    stage->choose("cobSortOrder", 2);
    fail("sprColumn.Text=");
    stage->clickButton("cmdSetSortOrder");
    EXPECT_EQ(stage->boxes, Boxes{report(u"cmdSetSortOrder_Click", refusal())});
    EXPECT_EQ(definition->sortOrder, 2);
    EXPECT_EQ(events(), Names{"ColumnModified"});
    EXPECT_EQ(stage->cell(sortRow, 1), u"");
    EXPECT_TRUE(shows("fraSortOrder"));
}

TEST_F(TheGridOnAFailingToolkit, ReportsTheKeyHandlersUnderTheirNames) {
    press(left, sortRow, 1);
    fail("cobSortOrder.ListIndex=");
    stage->key("cobSortOrder", escape);
    EXPECT_TRUE(shows("fraSortOrder"));
    press(left, visibleRow, 1);
    fail("cobVisibility.ListIndex=");
    stage->key("cobVisibility", escape);
    EXPECT_TRUE(shows("fraVisibility"));
    press(left, synonymRow, 1);
    fail("txtValue.Text=");
    stage->key("txtValue", escape);
    EXPECT_TRUE(shows("fraValue"));
    EXPECT_EQ(stage->boxes, (Boxes{report(u"cobSortOrder_KeyDown", refusal()),
                                   report(u"cobVisibility_KeyDown", refusal()),
                                   report(u"txtValue_KeyDown", refusal())}));
}

TEST_F(TheGridOnAFailingToolkit, ReportsAColumnThatCannotBeOpened) {
    copy(1, {total});
    fail("sprColumn.ColPosition");
    menuOverCell(synonymRow, 1, "mnuColumnDefinitionPaste");
    ASSERT_FALSE(stage->boxes.empty());
    EXPECT_EQ(stage->boxes.front(), report(u"InsertColumnDefinition", refusal()));
}

TEST_F(TheGridOnAFailingToolkit, AnswersFalseWhenAColumnCannotBeRemoved) {
    fail("sprColumn.TextMatrix=");
    EXPECT_FALSE(Backstage::RemoveColumn(control(), 1));
    EXPECT_EQ(stage->boxes, Boxes{report(u"RemoveColumn", refusal())});
    EXPECT_EQ(stage->cell(fieldRow, 1), u"ID");
}

TEST_F(TheGridOnAFailingToolkit, AnswersTrueForTheLastColumnAndChangesNothing) {
    const std::int32_t last = grid().Cols() - 1;
    grid().TextMatrix(fieldRow, last, u"LAST");
    EXPECT_TRUE(Backstage::RemoveColumn(control(), last));
    EXPECT_EQ(stage->cell(fieldRow, last), u"LAST");
    EXPECT_EQ(stage->boxes, Boxes{});
}

} // namespace gridstage
