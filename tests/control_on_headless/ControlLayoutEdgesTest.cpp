#include "control/ShellFixture.h"

#include <Zandor/headless/Toolkit.h>

namespace {

/// Sizes that are no whole number of pixels, which only a toolkit without a screen has.
class TheLayoutBetweenPixels : public AControl {};

} // namespace

TEST_F(TheLayoutBetweenPixels, ConvertsTheRangesToTheNearestHalvesToEven) {
    stage->resizeControl(12000.5F, 8999.5F);
    EXPECT_EQ(look("hsbTable").max, 4000) << "3999.5";
    EXPECT_EQ(look("vsbTable").max, 7000) << "7000.5";
    stage->resizeControl(11999.5F, 9000.5F);
    EXPECT_EQ(look("hsbTable").max, 4000) << "4000.5";
    EXPECT_EQ(look("vsbTable").max, 7000) << "6999.5";
}

TEST_F(TheLayoutBetweenPixels, ScrollsFromAWholeHiddenTwipOn) {
    stage->resizeControl(15999, 15999);
    EXPECT_EQ(look("hsbTable").max, 1);
    EXPECT_EQ(look("vsbTable").max, 1);
    for (const float rest : {0.25F, 0.5F}) {
        stage->resizeControl(15999 + rest, 15999 + rest);
        EXPECT_EQ(look("hsbTable").max, 0) << rest;
        EXPECT_EQ(look("vsbTable").max, 0) << rest;
    }
}

TEST_F(TheLayoutBetweenPixels, TestsTheWholeHeightForWhatTheUpperPaneHides) {
    zandor().OnlyJoin(false);
    stage->resizeControl(9000, 20000);
    EXPECT_EQ(look("vsbTable").max, 0) << "the upper pane is 10000 high";
    stage->resizeControl(9000, 15999.5F);
    EXPECT_EQ(look("vsbTable").max, 0);
    stage->resizeControl(9000, 15999);
    EXPECT_EQ(look("vsbTable").max, 8000) << "8000.5";
}

TEST_F(TheLayoutBetweenPixels, HasItsLimitsStrictlyBeyondOneHundredAndTwentyAndThreeHundredTwips) {
    stage->resizeControl(9000, 7500);
    stage->resizeControl(120, 300);
    EXPECT_EQ(look("sprColumn").bounds.Width, 9000);
    EXPECT_EQ(look("vsbTable").max, 8500);
    stage->resizeControl(120.5F, 300.5F);
    EXPECT_EQ(look("sprColumn").bounds.Width, 120.5F);
    EXPECT_EQ(look("vsbTable").max, 15700) << "15699.5";
}

TEST_F(TheLayoutBetweenPixels, GivesTheGridExactlyHalf) {
    zandor().OnlyJoin(false);
    stage->resizeControl(9000, 7501);
    EXPECT_EQ(look("sprColumn").bounds.Top, 3750.5F);
    EXPECT_EQ(look("sprColumn").bounds.Height, 3750.5F);
}
