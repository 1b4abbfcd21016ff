#include "control/JoinScene.h"

using namespace zandor;

namespace {

const Stage::Box notFound = controlErrorBox(u"DrawJoin", 91, objectNotSet);

Stage::Box noElement(const Stage::String& index) {
    return controlErrorBox(u"DrawJoin", 340,
                           u"Control array element '" + index + u"' doesn't exist");
}

struct AJoinThatCannotBeDrawn : JoinScene {
    AJoinThatCannotBeDrawn() {
        join(1);
        bind();
        line().setEnds(1, 2, 3, 4);
    }

    void expectRefused(const Stage::Box& box) {
        EXPECT_FALSE(Back::DrawJoin(control, *record()));
        EXPECT_EQ(stage->boxes, Boxes{box});
    }
    void expectLineUntouched() {
        const Stage::Seen seen = stage->look("linJoin(1)");
        EXPECT_EQ(seen.X1, 1);
        EXPECT_EQ(seen.Y1, 2);
        EXPECT_EQ(seen.X2, 3);
        EXPECT_EQ(seen.Y2, 4);
        EXPECT_TRUE(seen.visible);
    }
};

TEST_F(AJoinThatCannotBeDrawn, IsOneWhoseLeftTableHasGone) {
    record()->LeftTablehwnd(0);
    expectRefused(notFound);
    expectLineUntouched();
}

TEST_F(AJoinThatCannotBeDrawn, IsOneWhoseRightTableHasGone) {
    record()->RightTablehwnd(0);
    expectRefused(notFound);
    expectLineUntouched();
}

TEST_F(AJoinThatCannotBeDrawn, IsOneWhoseLeftColumnIsNotInTheList) {
    record()->LeftColumnName(u"customer");
    expectRefused(notFound);
    expectLineUntouched();
}

TEST_F(AJoinThatCannotBeDrawn, IsOneWhoseRightColumnIsNotInTheList) {
    record()->RightColumnName(u"number");
    expectRefused(notFound);
    expectLineUntouched();
}

TEST_F(AJoinThatCannotBeDrawn, IsOneOfTheTemplate) {
    record()->LeftTablehwnd(Back::lstTable(control)(0)->TableHandle());
    expectRefused(notFound);
}

TEST_F(AJoinThatCannotBeDrawn, IsOneWithBothSidesInTheSameTable) {
    record()->RightTablehwnd(record()->LeftTablehwnd());
    record()->RightColumnName(u"Id");
    expectRefused(notFound);
    expectLineUntouched();
}

TEST_F(AJoinThatCannotBeDrawn, KeepsWhatWasChangedBeforeAndStaysVisible) {
    ASSERT_EQ(stage->look("shpJoin(1)").shape, 3);
    const platform::Bounds before = stage->look("shpJoin(1)").bounds;
    record()->LeftTablehwnd(0);
    expectRefused(notFound);
    EXPECT_EQ(stage->look("shpJoin(1)").shape, square);
    EXPECT_EQ(stage->look("shpJoin(1)").bounds, before);
    EXPECT_TRUE(stage->look("shpJoin(1)").visible);
    EXPECT_TRUE(stage->look("shpJoin(2)").visible);
}

TEST_F(AJoinThatCannotBeDrawn, IsOneWithoutAWesternMark) {
    record()->LeftConnectorIndex(-1);
    expectRefused(noElement(u"-1"));
    EXPECT_EQ(stage->look("shpJoin(1)").shape, 3);
    expectLineUntouched();
}

TEST_F(AJoinThatCannotBeDrawn, IsOneWithoutAnEasternMark) {
    record()->RightConnectorIndex(77);
    expectRefused(noElement(u"77"));
    expectLineUntouched();
}

TEST_F(AJoinThatCannotBeDrawn, IsOneWithoutALineWhichHasItsMarksPlacedAllTheSame) {
    Back::shpJoin(control)(2)->setBounds({0, 0, 10, 10});
    const platform::Bounds mark = {entry(1, 2)->RightEdgePoint().X,
                                   entry(1, 2)->RightEdgePoint().Y - 70, 140, 140};
    record()->JoinLineIndex(-1);
    expectRefused(noElement(u"-1"));
    EXPECT_EQ(stage->look("shpJoin(2)").bounds, mark);
    expectLineUntouched();
}

TEST_F(AJoinThatCannotBeDrawn, HasAnIndexThatDoesNotFitItsArray) {
    record()->JoinLineIndex(65537); // 1 in its lower 16 bits
    expectRefused(noElement(u"65537"));
    expectLineUntouched();
}

TEST_F(AJoinThatCannotBeDrawn, DoesNotStopTheOthers) {
    const Record second = draw(entry(1, 1), entry(2, 2));
    const float drawn = line(2).X2();
    line(2).setEnds(0, 0, 0, 0);
    record()->LeftTablehwnd(0);
    Back::DrawJoins(control);
    EXPECT_EQ(stage->boxes, Boxes{notFound});
    EXPECT_EQ(stage->look("linJoin(2)").X2, drawn);
    expectLineUntouched();
}

TEST_F(AJoinThatCannotBeDrawn, IsReportedInItsTurn) {
    const Record second = draw(entry(1, 1), entry(2, 2));
    record()->LeftTablehwnd(0);
    second->JoinLineIndex(-1);
    Back::DrawJoins(control);
    EXPECT_EQ(stage->boxes, (Boxes{notFound, noElement(u"-1")}));
}

} // namespace
