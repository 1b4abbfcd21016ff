#include "GridStage.h"

using namespace zandor;

namespace gridstage {

/// What an editor leaves behind when something fails.
class AFailingCellEditor : public GridTest {
protected:
    static constexpr std::int32_t blankColumn = 3;

    AFailingCellEditor() {
        definition = model->definition(orders, u"ID", {u"> 1"});
        bind();
    }

    void openText(std::int32_t row, const String& text) {
        press(left, row, 1);
        stage->type("txtValue", text);
    }

    /// The "&Set" button failed before it wrote the cell: one box, no event, the editor still open.
    void expectRefused(platform::StringView procedure, const platform::RuntimeError& error,
                       const std::string& frame, std::int32_t row, std::int32_t col,
                       const String& cellText) {
        EXPECT_EQ(stage->boxes, Boxes{report(procedure, error)});
        EXPECT_EQ(events(), Names{});
        EXPECT_TRUE(shows(frame));
        EXPECT_EQ(stage->cell(row, col), cellText);
    }

    Ref<fake::Definition> definition;
};

TEST_F(AFailingCellEditor, ReportsABlankColumnAndKeepsTheSortEditorOpen) {
    press(left, sortRow, blankColumn);
    stage->choose("cobSortOrder", 1);
    stage->clickButton("cmdSetSortOrder");
    expectRefused(u"cmdSetSortOrder_Click", platform::errors::invalidProcedureCall(),
                  "fraSortOrder", sortRow, blankColumn, u"");
}

TEST_F(AFailingCellEditor, ReportsABlankColumnAndKeepsTheVisibilityEditorOpen) {
    press(left, visibleRow, blankColumn);
    stage->choose("cobVisibility", 1);
    stage->clickButton("cmdSetVisibility");
    expectRefused(u"cmdSetVisibility_Click", platform::errors::invalidProcedureCall(),
                  "fraVisibility", visibleRow, blankColumn, u"");
}

TEST_F(AFailingCellEditor, ReportsABlankColumnAndKeepsTheTextEditorOpen) {
    press(left, criteriaRow, blankColumn);
    stage->type("txtValue", u"= 1");
    stage->clickButton("cmdSetTextValue");
    expectRefused(u"cmdSetTextValue_Click", platform::errors::invalidProcedureCall(), "fraValue",
                  criteriaRow, blankColumn, u"");
}

TEST_F(AFailingCellEditor, StaysOpenUntilTheNextClickOnTheGrid) {
    press(left, sortRow, blankColumn);
    stage->clickButton("cmdSetSortOrder");
    ASSERT_TRUE(shows("fraSortOrder"));
    press(left, fieldRow, blankColumn);
    EXPECT_FALSE(shows("fraSortOrder"));
}

TEST_F(AFailingCellEditor, StaysOpenUntilTheGridScrolls) {
    press(left, sortRow, blankColumn);
    stage->clickButton("cmdSetSortOrder");
    ASSERT_TRUE(shows("fraSortOrder"));
    stage->scrollGrid(1, 2);
    EXPECT_FALSE(shows("fraSortOrder"));
}

TEST_F(AFailingCellEditor, LeavesTheCellWhenTheModelRefusesTheSortOrder) {
    press(left, sortRow, 1);
    stage->choose("cobSortOrder", 2);
    model->fail("ZDColumnDefinition.SortOrder=", refusal());
    stage->clickButton("cmdSetSortOrder");
    expectRefused(u"cmdSetSortOrder_Click", refusal(), "fraSortOrder", sortRow, 1, u"");
    EXPECT_EQ(definition->sortOrder, 0);
}

TEST_F(AFailingCellEditor, LeavesTheCellWhenTheModelRefusesTheVisibility) {
    press(left, visibleRow, 1);
    stage->choose("cobVisibility", 1);
    model->fail("ZDColumnDefinition.Visible=", refusal());
    stage->clickButton("cmdSetVisibility");
    expectRefused(u"cmdSetVisibility_Click", refusal(), "fraVisibility", visibleRow, 1, u"Visible");
    EXPECT_TRUE(definition->visible);
}

TEST_F(AFailingCellEditor, LeavesTheCellWhenTheModelRefusesTheSynonym) {
    openText(synonymRow, u"No");
    model->fail("ZDColumnDefinition.Synonym=", refusal());
    stage->clickButton("cmdSetTextValue");
    expectRefused(u"cmdSetTextValue_Click", refusal(), "fraValue", synonymRow, 1, u"");
}

TEST_F(AFailingCellEditor, LeavesTheCellWhenTheModelCannotTellWhetherThereIsACriterion) {
    openText(criteriaRow, u"= 5");
    model->fail("ZDColumnDefinition.HasCriterium", refusal());
    stage->clickButton("cmdSetTextValue");
    expectRefused(u"cmdSetTextValue_Click", refusal(), "fraValue", criteriaRow, 1, u"> 1");
}

TEST_F(AFailingCellEditor, LeavesTheCellWhenTheModelRefusesToChangeACriterion) {
    openText(criteriaRow, u"= 5");
    model->fail("ZDCriterium.Criterium=", refusal());
    stage->clickButton("cmdSetTextValue");
    expectRefused(u"cmdSetTextValue_Click", refusal(), "fraValue", criteriaRow, 1, u"> 1");
    EXPECT_EQ(definition->criterion(u"4"), u"> 1");
}

TEST_F(AFailingCellEditor, LeavesTheCellWhenTheModelRefusesToRemoveACriterion) {
    openText(criteriaRow, u"");
    model->fail("Criteria.Remove", refusal());
    stage->clickButton("cmdSetTextValue");
    expectRefused(u"cmdSetTextValue_Click", refusal(), "fraValue", criteriaRow, 1, u"> 1");
    EXPECT_EQ(definition->criterion(u"4"), u"> 1");
}

TEST_F(AFailingCellEditor, LeavesTheCellWhenTheModelRefusesToAddACriterion) {
    openText(6, u"= 5");
    model->fail("ZDColumnDefinition.AddCriterium", refusal());
    stage->clickButton("cmdSetTextValue");
    expectRefused(u"cmdSetTextValue_Click", refusal(), "fraValue", 6, 1, u"");
    EXPECT_EQ(definition->criteria.items.Count(), 1);
}

TEST_F(AFailingCellEditor, ReportsAModelThatCannotTellItsDefinitions) {
    press(left, sortRow, 1);
    model->fail("ColumnDefinitions.Count", refusal());
    stage->clickButton("cmdSetSortOrder");
    expectRefused(u"cmdSetSortOrder_Click", refusal(), "fraSortOrder", sortRow, 1, u"");
}

TEST_F(AFailingCellEditor, ReportsAnExceptionOfTheHostsOwnWithItsText) {
    openText(synonymRow, u"No");
    model->fail("ZDColumnDefinition.Synonym=", std::runtime_error("read-only query"));
    stage->clickButton("cmdSetTextValue");
    expectRefused(u"cmdSetTextValue_Click", {440, u"read-only query"}, "fraValue", synonymRow, 1,
                  u"");
}

} // namespace gridstage
