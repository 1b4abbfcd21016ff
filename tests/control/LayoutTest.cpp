#include "control/ShellFixture.h"

using namespace zandor;

namespace {

class TheLayout : public AControl {
protected:
    float width() { return toolkit().ScaleWidth(); }
    float height() { return toolkit().ScaleHeight(); }
};

} // namespace

TEST_F(TheLayout, RunsTheHorizontalBarAlongTheBottomAndTheVerticalOneAlongTheRight) {
    stage->resizeControl(9000, 7500);
    const auto across = look("hsbTable").bounds;
    const auto down = look("vsbTable").bounds;
    EXPECT_EQ(down.Left, width() - down.Width);
    EXPECT_EQ(across.Width, down.Left);
    EXPECT_EQ(down.Height, height() - across.Height);
    EXPECT_EQ(across.Top, down.Height);
}

TEST_F(TheLayout, PutsTheHomeButtonInTheSquareWhereTheBarsMeet) {
    stage->resizeControl(9000, 7500);
    const auto across = look("hsbTable").bounds;
    const auto down = look("vsbTable").bounds;
    EXPECT_EQ(look("cmdHome").bounds,
              (platform::Bounds{down.Left, down.Height, down.Width, across.Height}));
}

TEST_F(TheLayout, ScrollsAsFarAsTheCanvasIsHidden) {
    stage->resizeControl(9000, 7500);
    EXPECT_EQ(look("hsbTable").max, 16000 - 9000);
    EXPECT_EQ(look("vsbTable").max, 16000 - 7500);
}

TEST_F(TheLayout, GivesTheCanvasTheSizesOfTheHost) {
    zandor().MXHorzFrameSize = 20000;
    zandor().MXVertFrameSize = 18000;
    stage->resizeControl(9000, 7500);
    EXPECT_EQ(look("fraTable").bounds.Width, 20000);
    EXPECT_EQ(look("fraTable").bounds.Height, 18000);
    EXPECT_EQ(look("hsbTable").max, 20000 - 9000);
    EXPECT_EQ(look("vsbTable").max, 18000 - 7500);
}

TEST_F(TheLayout, TakesNoNoticeOfANewCanvasSizeBeforeItRunsAgain) {
    stage->resizeControl(9000, 7500);
    zandor().MXHorzFrameSize = 20000;
    EXPECT_EQ(look("fraTable").bounds.Width, 16000);
    zandor().UserControl_Resize();
    EXPECT_EQ(look("fraTable").bounds.Width, 20000);
}

TEST_F(TheLayout, LeavesNothingToScrollWhenTheWholeCanvasIsInView) {
    stage->resizeControl(18000, 18000);
    EXPECT_EQ(look("hsbTable").max, 0);
    EXPECT_EQ(look("vsbTable").max, 0);
}

TEST_F(TheLayout, GivesTheGridTheLowerHalf) {
    zandor().OnlyJoin(false);
    stage->resizeControl(9000, 7500);
    const float half = height() / 2;
    EXPECT_EQ(look("sprColumn").bounds.Top, half);
    EXPECT_EQ(look("sprColumn").bounds.Height, half);
    EXPECT_EQ(look("sprColumn").bounds.Width, width());
    EXPECT_EQ(look("vsbTable").bounds.Height, half - look("hsbTable").bounds.Height);
    EXPECT_EQ(look("vsbTable").max, 16000 - 3750);
}

TEST_F(TheLayout, NeitherMovesNorHeightensAHiddenGrid) {
    zandor().OnlyJoin(false);
    stage->resizeControl(9000, 7500);
    const auto before = look("sprColumn").bounds;
    zandor().OnlyJoin(true);
    stage->resizeControl(6000, 4500);
    const auto after = look("sprColumn").bounds;
    EXPECT_EQ(after.Top, before.Top);
    EXPECT_EQ(after.Height, before.Height);
    EXPECT_EQ(after.Width, 6000) << "its width follows all the same";
}

TEST_F(TheLayout, LeavesTheOriginsOfTheBarsAlone) {
    Backstage::vsbTable(zandor())->Top(45);
    Backstage::hsbTable(zandor())->Left(30);
    stage->resizeControl(9000, 7500);
    EXPECT_EQ(look("vsbTable").bounds.Top, 45);
    EXPECT_EQ(look("hsbTable").bounds.Left, 30);
}

TEST_F(TheLayout, HasNoHorizontalPartInAControlOfOneHundredAndTwentyTwipsOrLess) {
    stage->resizeControl(9000, 7500);
    const auto across = look("hsbTable");
    const auto down = look("vsbTable").bounds;
    zandor().MXHorzFrameSize = 20000;
    stage->resizeControl(120, 6000);
    EXPECT_EQ(look("hsbTable").max, across.max);
    EXPECT_EQ(look("hsbTable").bounds.Width, across.bounds.Width);
    EXPECT_EQ(look("fraTable").bounds.Width, 16000);
    EXPECT_EQ(look("sprColumn").bounds.Width, 9000);
    EXPECT_EQ(look("vsbTable").bounds.Left, down.Left);
    EXPECT_EQ(look("cmdHome").bounds.Left, down.Left);
    EXPECT_EQ(look("cmdHome").bounds.Width, down.Width);
    // The vertical part runs all the same.
    EXPECT_EQ(look("vsbTable").bounds.Height, 6000 - across.bounds.Height);
    EXPECT_EQ(look("vsbTable").max, 10000);
}

TEST_F(TheLayout, HasItsHorizontalPartInAControlJustWider) {
    stage->resizeControl(135, 6000);
    EXPECT_EQ(look("sprColumn").bounds.Width, 135);
    EXPECT_EQ(look("hsbTable").max, 16000 - 135);
}

TEST_F(TheLayout, HasNoVerticalPartInAnUpperPaneOfThreeHundredTwipsOrLess) {
    stage->resizeControl(9000, 7500);
    const auto down = look("vsbTable");
    zandor().MXVertFrameSize = 20000;
    stage->resizeControl(6000, 300);
    EXPECT_EQ(look("vsbTable").bounds.Height, down.bounds.Height);
    EXPECT_EQ(look("vsbTable").max, down.max);
    EXPECT_EQ(look("hsbTable").bounds.Top, down.bounds.Height);
    EXPECT_EQ(look("cmdHome").bounds.Top, down.bounds.Height);
    EXPECT_EQ(look("fraTable").bounds.Height, 16000);
    EXPECT_EQ(look("sprColumn").bounds.Width, 6000) << "the horizontal part has run";
    stage->resizeControl(6000, 315);
    EXPECT_EQ(look("vsbTable").max, 20000 - 315);
}

TEST_F(TheLayout, HasNoVerticalPartInAControlOfSixHundredTwipsOrLessWithTheGridShown) {
    zandor().OnlyJoin(false);
    stage->resizeControl(9000, 7500);
    const auto before = look("sprColumn").bounds;
    stage->resizeControl(9000, 600);
    EXPECT_EQ(look("sprColumn").bounds, before);
    EXPECT_EQ(look("vsbTable").max, 16000 - 3750);
    stage->resizeControl(9000, 630);
    EXPECT_EQ(look("sprColumn").bounds.Top, 315);
    EXPECT_EQ(look("vsbTable").max, 16000 - 315);
}

TEST_F(TheLayout, TestsTheWholeHeightForWhatTheUpperPaneHides) {
    zandor().OnlyJoin(false);
    stage->resizeControl(9000, 20010);
    EXPECT_EQ(look("vsbTable").max, 0) << "although 5995 twips of the canvas are out of view";
    stage->resizeControl(9000, 15990);
    EXPECT_EQ(look("vsbTable").max, 16000 - 7995);
}

TEST_F(TheLayout, MovesTheCanvasBackWhenTheRangeShrinks) {
    stage->resizeControl(9000, 7500);
    zandor().HorizontalScrollbarPos(7000);
    stage->resizeControl(12000, 7500);
    EXPECT_EQ(look("hsbTable").value, 4000);
    EXPECT_EQ(look("fraTable").bounds.Left, -4000);
}

TEST_F(TheLayout, RunsOnEveryPaintWhichAlsoHidesTheCellEditors) {
    stage->resizeControl(9000, 7500);
    zandor().HorizMaxScrollPos(77);
    Backstage::fraValue(zandor())->Visible(true);
    Backstage::fraSortOrder(zandor())->Visible(true);
    Backstage::fraVisibility(zandor())->Visible(true);
    stage->repaint();
    EXPECT_FALSE(look("fraValue").visible);
    EXPECT_FALSE(look("fraSortOrder").visible);
    EXPECT_FALSE(look("fraVisibility").visible);
    EXPECT_EQ(look("hsbTable").max, 7000);
}

TEST_F(TheLayout, RunsOnEveryResizeWhichLeavesTheCellEditorsOpen) {
    zandor().OnlyJoin(false);
    Backstage::fraValue(zandor())->Visible(true);
    zandor().HorizMaxScrollPos(77);
    zandor().UserControl_Resize();
    EXPECT_TRUE(look("fraValue").visible);
    EXPECT_NE(look("hsbTable").max, 77);
}
