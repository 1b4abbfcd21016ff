#include "GridStage.h"

namespace gridstage {

class ACellEditor : public GridTest {
protected:
    ACellEditor() {
        definition = model->definition(orders, u"ID", {u"> 1"});
        definition->sortOrder = 1;
        definition->synonym = u"Number";
        bind();
    }

    void setSortOrder(std::int16_t item) {
        press(left, sortRow, 1);
        stage->choose("cobSortOrder", item);
        stage->clickButton("cmdSetSortOrder");
    }

    void setVisibility(std::int16_t item) {
        press(left, visibleRow, 1);
        stage->choose("cobVisibility", item);
        stage->clickButton("cmdSetVisibility");
    }

    void setText(std::int32_t row, const String& text) {
        press(left, row, 1);
        stage->type("txtValue", text);
        stage->clickButton("cmdSetTextValue");
    }

    void expectModified() {
        ASSERT_EQ(events(), Names{"ColumnModified"});
        EXPECT_EQ(stage->raised[0].arguments.Definition.get(), definition.get());
        EXPECT_EQ(stage->boxes, Boxes{});
    }

    bool anyOpen() { return shows("fraSortOrder") || shows("fraVisibility") || shows("fraValue"); }

    Ref<fake::Definition> definition;
};

TEST_F(ACellEditor, DoesNotOpenOnTheFieldRowButALeftClickThereClosesTheOpenOne) {
    press(left, sortRow, 1);
    ASSERT_TRUE(anyOpen());
    press(left, fieldRow, 1);
    EXPECT_FALSE(anyOpen());
}

TEST_F(ACellEditor, DoesNotOpenOnTheLabelColumnButALeftClickThereClosesTheOpenOne) {
    press(left, sortRow, 1);
    ASSERT_TRUE(anyOpen());
    press(left, sortRow, 0);
    EXPECT_FALSE(anyOpen());
}

TEST_F(ACellEditor, ClosesOnARightPressAndTheMenuOpensOnTheRelease) {
    press(left, sortRow, 1);
    bool menuOpened = false;
    stage->onMenu = [&](const auto&) {
        menuOpened = true;
        return String();
    };
    press(right, sortRow, 1);
    EXPECT_FALSE(anyOpen());
    EXPECT_FALSE(menuOpened);
    stage->releaseCell(right, sortRow, 1);
    EXPECT_TRUE(menuOpened);
    EXPECT_FALSE(anyOpen());
}

TEST_F(ACellEditor, OpensNoMenuOnALeftRelease) {
    bool menuOpened = false;
    stage->onMenu = [&](const auto&) {
        menuOpened = true;
        return String();
    };
    press(left, fieldRow, 1);
    stage->releaseCell(left, fieldRow, 1);
    EXPECT_FALSE(menuOpened);
}

TEST_F(ACellEditor, ClosesWhenTheGridScrolls) {
    press(left, criteriaRow, 1);
    ASSERT_TRUE(anyOpen());
    stage->scrollGrid(1, 3);
    EXPECT_FALSE(anyOpen());
    EXPECT_EQ(events(), Names{});
}

TEST_F(ACellEditor, ClosesWhenTheControlIsPaintedAgain) {
    press(left, criteriaRow, 1);
    control().UserControl_Paint();
    EXPECT_FALSE(anyOpen());
}

TEST_F(ACellEditor, WritesTheSortOrderToModelAndCellAndCloses) {
    setSortOrder(2);
    EXPECT_EQ(definition->sortOrder, 2);
    EXPECT_EQ(stage->cell(sortRow, 1), u"Descending");
    EXPECT_FALSE(anyOpen());
    expectModified();
}

TEST_F(ACellEditor, WritesNoneIntoTheCellAndZeroIntoTheModel) {
    setSortOrder(0);
    EXPECT_EQ(definition->sortOrder, 0);
    EXPECT_EQ(stage->cell(sortRow, 1), u"(None)");
    expectModified();
}

TEST_F(ACellEditor, WritesNotVisibleWhereBindingShowedInvisible) {
    definition->visible = false;
    bind();
    EXPECT_EQ(stage->cell(visibleRow, 1), u"Invisible");
    setVisibility(1);
    EXPECT_FALSE(definition->visible);
    EXPECT_EQ(stage->cell(visibleRow, 1), u"Not Visible");
    EXPECT_FALSE(anyOpen());
    expectModified();
}

TEST_F(ACellEditor, WritesVisibleForTheFirstItem) {
    definition->visible = false;
    setVisibility(0);
    EXPECT_TRUE(definition->visible);
    EXPECT_EQ(stage->cell(visibleRow, 1), u"Visible");
    expectModified();
}

TEST_F(ACellEditor, WritesTheSynonymAsTyped) {
    setText(synonymRow, u"  Order No ");
    EXPECT_EQ(definition->synonym, u"  Order No ");
    EXPECT_EQ(stage->cell(synonymRow, 1), u"  Order No ");
    EXPECT_FALSE(anyOpen());
    expectModified();
}

TEST_F(ACellEditor, StoresAnEmptySynonymAndTellsTheHost) {
    setText(synonymRow, u"");
    EXPECT_EQ(definition->synonym, u"");
    EXPECT_EQ(stage->cell(synonymRow, 1), u"");
    expectModified();
}

TEST_F(ACellEditor, ChangesTheCriterionUnderTheNumberOfItsRow) {
    setText(criteriaRow, u"> 7");
    EXPECT_EQ(definition->criteria.items.Count(), 1);
    EXPECT_EQ(definition->criterion(u"4"), u"> 7");
    EXPECT_EQ(stage->cell(criteriaRow, 1), u"> 7");
    EXPECT_FALSE(anyOpen());
    expectModified();
}

TEST_F(ACellEditor, AddsACriterionUnderTheNumberOfItsRow) {
    setText(11, u"= 3");
    EXPECT_EQ(definition->criteria.items.Count(), 2);
    EXPECT_EQ(definition->criterion(u"11"), u"= 3");
    EXPECT_EQ(stage->cell(11, 1), u"= 3");
    expectModified();
}

TEST_F(ACellEditor, RemovesACriterionWhoseTextIsCleared) {
    setText(criteriaRow, u"");
    EXPECT_EQ(definition->criteria.items.Count(), 0);
    EXPECT_EQ(stage->cell(criteriaRow, 1), u"");
    expectModified();
}

TEST_F(ACellEditor, ChangesNothingWhenARowWithoutCriterionIsClearedButStillWritesTheCell) {
    grid().TextMatrix(6, 1, u"left over");
    setText(6, u"");
    EXPECT_EQ(definition->criteria.items.Count(), 1);
    EXPECT_EQ(stage->cell(6, 1), u"");
    EXPECT_FALSE(anyOpen());
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(ACellEditor, IsSetByEnterAsByItsButton) {
    press(left, sortRow, 1);
    stage->choose("cobSortOrder", 2);
    stage->key("cobSortOrder", enter);
    EXPECT_EQ(definition->sortOrder, 2);
    press(left, visibleRow, 1);
    stage->choose("cobVisibility", 1);
    stage->key("cobVisibility", enter);
    EXPECT_FALSE(definition->visible);
    press(left, synonymRow, 1);
    stage->type("txtValue", u"No");
    stage->key("txtValue", enter);
    EXPECT_EQ(definition->synonym, u"No");
    EXPECT_FALSE(anyOpen());
}

TEST_F(ACellEditor, IsResetToNoneAndClosedByEscapeInTheSortCombo) {
    press(left, sortRow, 1);
    stage->choose("cobSortOrder", 2);
    stage->key("cobSortOrder", escape);
    EXPECT_FALSE(anyOpen());
    EXPECT_EQ(stage->look("cobSortOrder").listIndex, 0);
    EXPECT_EQ(stage->cell(sortRow, 1), u"Ascending");
    EXPECT_EQ(definition->sortOrder, 1);
    EXPECT_EQ(events(), Names{});
}

TEST_F(ACellEditor, IsResetToVisibleAndClosedByEscapeInTheVisibilityCombo) {
    press(left, visibleRow, 1);
    stage->choose("cobVisibility", 1);
    stage->key("cobVisibility", escape);
    EXPECT_FALSE(anyOpen());
    EXPECT_EQ(stage->look("cobVisibility").listIndex, 0);
    EXPECT_EQ(stage->cell(visibleRow, 1), u"Visible");
    EXPECT_TRUE(definition->visible);
    EXPECT_EQ(events(), Names{});
}

TEST_F(ACellEditor, IsEmptiedAndClosedByEscapeInTheText) {
    press(left, criteriaRow, 1);
    stage->type("txtValue", u"= 5");
    stage->key("txtValue", escape);
    EXPECT_FALSE(anyOpen());
    EXPECT_EQ(stage->look("txtValue").text, u"");
    EXPECT_EQ(stage->cell(criteriaRow, 1), u"> 1");
    EXPECT_EQ(definition->criterion(u"4"), u"> 1");
    EXPECT_EQ(events(), Names{});
}

TEST_F(ACellEditor, LeavesOtherKeysToItsInput) {
    press(left, sortRow, 1);
    Backstage::cobSortOrder_KeyDown(control(), 65, 0);
    EXPECT_TRUE(anyOpen());
    press(left, visibleRow, 1);
    Backstage::cobVisibility_KeyDown(control(), 65, 0);
    EXPECT_TRUE(anyOpen());
    press(left, synonymRow, 1);
    Backstage::txtValue_KeyDown(control(), 65, 0);
    EXPECT_TRUE(anyOpen());
    EXPECT_EQ(stage->look("txtValue").text, u"Number");
}

TEST_F(ACellEditor, WritesTheCellThatIsCurrentWhenSetIsPressed) {
    auto second = model->definition(orders, u"TOTAL");
    bind();
    press(left, synonymRow, 1);
    stage->type("txtValue", u"Sum");
    grid().Col(2);
    stage->clickButton("cmdSetTextValue");
    EXPECT_EQ(second->synonym, u"Sum");
    EXPECT_EQ(definition->synonym, u"Number");
    EXPECT_EQ(stage->cell(synonymRow, 2), u"Sum");
}

TEST_F(ACellEditor, WritesNothingIntoAFieldThatADropMadeCurrent) {
    press(left, criteriaRow, 1);
    stage->type("txtValue", u"= 5");
    grid().Row(fieldRow);
    Backstage::cmdSetTextValue_Click(control());
    EXPECT_EQ(stage->cell(fieldRow, 1), u"ID");
    EXPECT_EQ(definition->criteria.items.Count(), 1);
    EXPECT_EQ(events(), Names{});
    EXPECT_FALSE(anyOpen());
}

TEST_F(ACellEditor, OnlyClosesWhenTheModelHasNoDefinitions) {
    model->definitions.items.Remove(definition->key);
    setSortOrder(2);
    EXPECT_FALSE(anyOpen());
    setVisibility(1);
    EXPECT_FALSE(anyOpen());
    setText(synonymRow, u"other");
    EXPECT_FALSE(anyOpen());
    EXPECT_EQ(stage->cell(sortRow, 1), u"Ascending");
    EXPECT_EQ(stage->cell(visibleRow, 1), u"Visible");
    EXPECT_EQ(stage->cell(synonymRow, 1), u"Number");
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(ACellEditor, TakesTheHighlightOfAJoinBackWhenTheGridIsPressed) {
    model->join(orders, u"ID", customers, u"ID");
    bind();
    const auto line = stage->look("linJoin(1)");
    stage->pressCanvas(left, (line.X1 + line.X2) / 2, (line.Y1 + line.Y2) / 2);
    ASSERT_EQ(stage->look("linJoin(1)").borderWidth, 2);
    press(left, fieldRow, 1);
    EXPECT_EQ(stage->look("linJoin(1)").borderWidth, 1);
}

} // namespace gridstage
