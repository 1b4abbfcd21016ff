#include "control/JoinScene.h"

using namespace zandor;

namespace {

constexpr float markSize = 140;

/// The first join of a scene: mark 2 is at the western end of its line, mark 1 at the eastern.
struct ADrawnJoin : JoinScene {
    Stage::Seen west() { return stage->look("shpJoin(2)"); }
    Stage::Seen east() { return stage->look("shpJoin(1)"); }
    Stage::Seen drawnLine() { return stage->look("linJoin(1)"); }

    void expectLineBetweenMarks() {
        EXPECT_FLOAT_EQ(drawnLine().X1, west().bounds.Left + markSize);
        EXPECT_FLOAT_EQ(drawnLine().Y1, west().bounds.Top + markSize / 2);
        EXPECT_FLOAT_EQ(drawnLine().X2, east().bounds.Left);
        EXPECT_FLOAT_EQ(drawnLine().Y2, east().bounds.Top + markSize / 2);
    }
    void expectRightOf(std::int16_t index, std::int32_t position) {
        const auto row = entry(index, position)->RightEdgePoint();
        EXPECT_FLOAT_EQ(west().bounds.Left, row.X);
        EXPECT_FLOAT_EQ(west().bounds.Top, row.Y - markSize / 2);
    }
    void expectLeftOf(std::int16_t index, std::int32_t position) {
        const auto row = entry(index, position)->LeftEdgePoint();
        EXPECT_FLOAT_EQ(east().bounds.Left, row.X - markSize);
        EXPECT_FLOAT_EQ(east().bounds.Top, row.Y - markSize / 2);
    }
    float bottomOf(std::int16_t index) { return table(index).Top() + table(index).Height(); }
};

TEST_F(ADrawnJoin, HasItsMarksBetweenTheTablesLevelWithTheRows) {
    join();
    bind();
    expectRightOf(1, 2);
    expectLeftOf(2, 1);
    expectLineBetweenMarks();
    EXPECT_LT(drawnLine().X1, drawnLine().X2);
}

TEST_F(ADrawnJoin, HasMarksOf140By140) {
    join();
    bind();
    EXPECT_EQ(west().bounds.Width, markSize);
    EXPECT_EQ(west().bounds.Height, markSize);
    EXPECT_EQ(east().bounds.Width, markSize);
    EXPECT_EQ(east().bounds.Height, markSize);
}

TEST_F(ADrawnJoin, IsShownWithLineAndBothMarks) {
    join();
    bind();
    line().Visible(false);
    Back::shpJoin(control)(1)->Visible(false);
    Back::shpJoin(control)(2)->Visible(false);
    EXPECT_TRUE(Back::DrawJoin(control, *record()));
    EXPECT_TRUE(drawnLine().visible);
    EXPECT_TRUE(west().visible);
    EXPECT_TRUE(east().visible);
}

TEST_F(ADrawnJoin, ShowsTheCircleOfALeftOuterJoinAtItsEasternEnd) {
    join(1);
    bind();
    EXPECT_EQ(west().shape, square);
    EXPECT_EQ(east().shape, circle);
}

TEST_F(ADrawnJoin, ChangesEndsWhenTheRightTableIsDraggedToTheWest) {
    orders->place(4000, 500, 2000, 2000);
    customers->place(7000, 1500, 2000, 2000);
    join(1);
    bind();
    stage->moveTable(2, 200, 1500);
    ASSERT_LT(table(2).Left(), table(1).Left());
    expectRightOf(2, 1);
    expectLeftOf(1, 2);
    expectLineBetweenMarks();
    // The circle stays in the east, which is now the left table's side.
    EXPECT_EQ(west().shape, square);
    EXPECT_EQ(east().shape, circle);
}

TEST_F(ADrawnJoin, TakesTheRightTableForTheWesternOneWhenBothBeginAtTheSameLeft) {
    customers->place(1000, 4000, 2000, 2000);
    join(1);
    bind();
    expectRightOf(2, 1);
    expectLeftOf(1, 2);
    expectLineBetweenMarks();
    EXPECT_EQ(west().shape, circle);
    EXPECT_EQ(east().shape, square);
}

TEST_F(ADrawnJoin, HasTwoSquaresUnlessItIsALeftOuterOne) {
    join();
    bind();
    for (const std::int32_t type : {0, 2, 3, 7, -1}) {
        record()->JoinType(type);
        EXPECT_TRUE(Back::DrawJoin(control, *record()));
        EXPECT_EQ(west().shape, square) << type;
        EXPECT_EQ(east().shape, square) << type;
    }
}

TEST_F(ADrawnJoin, HasTwoSquaresAtTheSameLeftUnlessItIsALeftOuterOne) {
    customers->place(1000, 4000, 2000, 2000);
    join(2);
    bind();
    EXPECT_EQ(west().shape, square);
    EXPECT_EQ(east().shape, square);
}

TEST_F(ADrawnJoin, LosesTheCircleOfAnEarlierType) {
    join(1);
    bind();
    record()->JoinType(0);
    EXPECT_TRUE(Back::DrawJoin(control, *record()));
    EXPECT_EQ(east().shape, square);
}

TEST_F(ADrawnJoin, LosesTheCircleOfAnEarlierTypeAtItsWesternEndToo) {
    customers->place(1000, 4000, 2000, 2000);
    join(1);
    bind();
    ASSERT_EQ(west().shape, circle);
    record()->JoinType(0);
    EXPECT_TRUE(Back::DrawJoin(control, *record()));
    EXPECT_EQ(west().shape, square);
}

/// Orders has more columns than its list shows; the join is at a row of it.
struct ADrawnJoinOfALongList : ADrawnJoin {
    ADrawnJoinOfALongList() {
        for (int n = 4; n <= 30; ++n) orders->addColumn(u"Column" + platform::decimal(n));
    }
};

TEST_F(ADrawnJoinOfALongList, KeepsTheMarkAtTheTopEdgeWhenTheRowIsScrolledOutAbove) {
    join();
    bind();
    stage->scrollList(1, 10);
    ASSERT_LT(entry(1, 2)->RightEdgePoint().Y, table(1).Top());
    EXPECT_FLOAT_EQ(west().bounds.Top, table(1).Top());
    expectLineBetweenMarks();
}

TEST_F(ADrawnJoinOfALongList, KeepsTheMarkAtTheBottomEdgeWhenTheRowIsScrolledOutBelow) {
    model->join(orders, u"Column30", customers, u"Number");
    bind();
    ASSERT_GT(entry(1, 30)->RightEdgePoint().Y, bottomOf(1));
    EXPECT_FLOAT_EQ(west().bounds.Top + markSize, bottomOf(1));
    expectLineBetweenMarks();
}

TEST_F(ADrawnJoinOfALongList, KeepsTheEasternMarkAtTheEdgesToo) {
    orders->place(7000, 500, 2000, 2000);
    customers->place(1000, 500, 2000, 2000);
    model->join(orders, u"Column4", customers, u"Number");
    model->join(orders, u"Column30", customers, u"Number");
    bind();
    EXPECT_FLOAT_EQ(stage->look("shpJoin(3)").bounds.Top + markSize, bottomOf(1));
    stage->scrollList(1, 15);
    ASSERT_LT(entry(1, 4)->LeftEdgePoint().Y, table(1).Top());
    EXPECT_FLOAT_EQ(east().bounds.Top, table(1).Top());
    expectLineBetweenMarks();
}

TEST_F(ADrawnJoinOfALongList, FollowsTheRowWhileTheListIsScrolled) {
    join();
    bind();
    const float before = west().bounds.Top;
    stage->scrollList(1, 2);
    EXPECT_LT(west().bounds.Top, before);
    expectRightOf(1, 2);
}

TEST_F(ADrawnJoin, TakesTheLastOfSeveralColumnsOfTheName) {
    orders->addColumn(u"Customer", u"kSecond");
    join();
    bind();
    expectRightOf(1, 4);
}

TEST_F(ADrawnJoin, FollowsATableThatIsMoved) {
    join();
    bind();
    stage->moveTable(1, 1500, 2500);
    expectRightOf(1, 2);
    expectLeftOf(2, 1);
    expectLineBetweenMarks();
}

TEST_F(ADrawnJoin, KeepsTheHighlightOfItsLineWhenDrawnAgain) {
    join();
    bind();
    line().BorderWidth(2);
    Back::DrawJoins(control);
    EXPECT_EQ(drawnLine().borderWidth, 2);
}

} // namespace
