#include "GridStage.h"

using namespace zandor;

namespace gridstage {

class AnOpeningEditor : public GridTest {
protected:
    AnOpeningEditor() {
        model->definition(orders, u"ID");
        bind();
    }

    std::int16_t sortEditorOn(const String& cellText) {
        grid().TextMatrix(sortRow, 1, cellText);
        press(left, sortRow, 1);
        return stage->look("cobSortOrder").listIndex;
    }

    std::int16_t visibilityEditorOn(const String& cellText) {
        grid().TextMatrix(visibleRow, 1, cellText);
        press(left, visibleRow, 1);
        return stage->look("cobVisibility").listIndex;
    }

    /// Where the text editor stands when it has a size and opens over a cell.
    platform::Bounds placed(float width, float height, std::int32_t row, std::int32_t col) {
        Backstage::fraValue(control())->setBounds({0, 0, width, height});
        grid().Row(row);
        grid().Col(col);
        Backstage::GetTextValue(control(), String());
        return stage->look("fraValue").bounds;
    }

    /// A column whose middle lies right of the control's.
    std::int32_t columnPastTheMiddle() {
        grid().Row(criteriaRow);
        std::int32_t col = 1;
        do grid().Col(++col);
        while (2 * cellMiddleX() <= stage->toolkit().ScaleWidth() + 60);
        return col;
    }

    /// The height at which an editor in the criteria row just reaches the control's bottom.
    float heightToTheBottom() {
        grid().Row(criteriaRow);
        return 2 * (stage->toolkit().ScaleHeight() - grid().Top() - cellMiddleY());
    }

    float cellMiddleX() { return grid().CellLeft() + grid().CellWidth() / 2; }
    float cellMiddleY() { return grid().CellTop() + grid().CellHeight() / 2; }
};

TEST_F(AnOpeningEditor, ShowsTheCellsSortOrder) {
    EXPECT_EQ(sortEditorOn(u"Ascending"), 1);
    EXPECT_EQ(sortEditorOn(u"Descending"), 2);
}

TEST_F(AnOpeningEditor, ShowsNoneForASortCellThatReadsNoneOrIsEmpty) {
    sortEditorOn(u"Descending");
    EXPECT_EQ(sortEditorOn(u"(None)"), 0);
    EXPECT_EQ(sortEditorOn(u""), 0);
}

TEST_F(AnOpeningEditor, ComparesTheCellsTextExactly) {
    EXPECT_EQ(sortEditorOn(u"ascending"), 0);
    EXPECT_EQ(sortEditorOn(u"Descending "), 0);
    EXPECT_EQ(visibilityEditorOn(u"not visible"), 0);
}

TEST_F(AnOpeningEditor, ShowsVisibleForACellThatReadsInvisible) {
    EXPECT_EQ(visibilityEditorOn(u"Not Visible"), 1);
    EXPECT_EQ(visibilityEditorOn(u"Invisible"), 0);
    EXPECT_EQ(visibilityEditorOn(u"Visible"), 0);
}

TEST_F(AnOpeningEditor, ShowsTheTextOfASynonymOrCriteriaCell) {
    grid().TextMatrix(synonymRow, 1, u" as typed ");
    grid().TextMatrix(11, 1, u"last");
    press(left, synonymRow, 1);
    EXPECT_EQ(stage->look("txtValue").text, u" as typed ");
    press(left, 11, 1);
    EXPECT_EQ(stage->look("txtValue").text, u"last");
}

TEST_F(AnOpeningEditor, TakesTheFocusToItsInput) {
    press(left, sortRow, 1);
    EXPECT_TRUE(stage->look("cobSortOrder").focused);
    press(left, visibleRow, 1);
    EXPECT_TRUE(stage->look("cobVisibility").focused);
    press(left, synonymRow, 1);
    EXPECT_TRUE(stage->look("txtValue").focused);
}

TEST_F(AnOpeningEditor, MakesTheCellHitTheCurrentOne) {
    press(left, 5, 1);
    EXPECT_EQ(grid().Row(), 5);
    EXPECT_EQ(grid().Col(), 1);
}

TEST_F(AnOpeningEditor, IsTheOnlyOneOpen) {
    press(left, sortRow, 1);
    press(left, visibleRow, 1);
    EXPECT_FALSE(shows("fraSortOrder"));
    EXPECT_TRUE(shows("fraVisibility"));
    press(left, criteriaRow, 1);
    EXPECT_FALSE(shows("fraVisibility"));
    EXPECT_TRUE(shows("fraValue"));
}

TEST_F(AnOpeningEditor, StandsCentredOnItsCell) {
    const auto at = placed(1500, 450, criteriaRow, 4);
    EXPECT_FLOAT_EQ(at.Left, cellMiddleX() - 750);
    EXPECT_FLOAT_EQ(at.Top, grid().Top() + cellMiddleY() - 225);
    EXPECT_EQ(at.Width, 1500);
    EXPECT_EQ(at.Height, 450);
}

TEST_F(AnOpeningEditor, ReckonsWithTheTopOfTheGridButNotWithItsLeft) {
    auto moved = grid().bounds();
    moved.Left += 600;
    moved.Top -= 600;
    grid().setBounds(moved);
    const auto at = placed(1500, 450, criteriaRow, 4);
    EXPECT_FLOAT_EQ(at.Left, cellMiddleX() - 750);
    EXPECT_FLOAT_EQ(at.Top, moved.Top + cellMiddleY() - 225);
}

TEST_F(AnOpeningEditor, StandsAt30OverACellNearTheLeftEdge) {
    EXPECT_EQ(placed(9000, 450, criteriaRow, 1).Left, 30);
}

TEST_F(AnOpeningEditor, StandsAt30WhereCentringWouldLeaveLess) {
    grid().Row(criteriaRow);
    grid().Col(2);
    const float width = 2 * (cellMiddleX() - 15);
    EXPECT_EQ(placed(width, 450, criteriaRow, 2).Left, 30);
}

TEST_F(AnOpeningEditor, Stands30InsideTheRightBorderOverACellAtTheRightEdge) {
    EXPECT_FLOAT_EQ(placed(1500, 450, criteriaRow, 30).Left,
                    stage->toolkit().ScaleWidth() - 1500 - 30);
}

TEST_F(AnOpeningEditor, MayTouchTheRightBorderExactly) {
    const std::int32_t col = columnPastTheMiddle();
    const float width = 2 * (stage->toolkit().ScaleWidth() - cellMiddleX());
    EXPECT_FLOAT_EQ(placed(width, 450, criteriaRow, col).Left, cellMiddleX() - width / 2);
}

TEST_F(AnOpeningEditor, StandsLeftOfTheBorderWhenItIsWiderThanTheControl) {
    const float width = stage->toolkit().ScaleWidth() + 300;
    EXPECT_FLOAT_EQ(placed(width, 450, criteriaRow, columnPastTheMiddle()).Left, -330);
}

TEST_F(AnOpeningEditor, Stands30AboveTheBottomBorderOverACellNearTheBottom) {
    const float height = heightToTheBottom() + 30;
    EXPECT_FLOAT_EQ(placed(1500, height, criteriaRow, 4).Top,
                    stage->toolkit().ScaleHeight() - height - 30);
}

TEST_F(AnOpeningEditor, MayTouchTheBottomBorderExactly) {
    const float height = heightToTheBottom();
    EXPECT_FLOAT_EQ(placed(1500, height, criteriaRow, 4).Top,
                    stage->toolkit().ScaleHeight() - height);
}

TEST_F(AnOpeningEditor, MayExtendAboveTheGridAndTheControl) {
    EXPECT_LT(placed(1500, 3000, synonymRow, 4).Top, grid().Top());
    EXPECT_FLOAT_EQ(placed(1500, 12000, synonymRow, 4).Top,
                    stage->toolkit().ScaleHeight() - 12000 - 30);
}

} // namespace gridstage
