#include "CanvasTest.h"

using namespace zandor;

namespace {

using platform::Bounds;

/// One table, of 1800 by 2400, on a control of 12000 by 9000.
class MovingTables : public CanvasTest {
protected:
    MovingTables() {
        moved = table(u"A", {u"ID"}, 3000, 3000);
        bind();
    }

    /// The place at which a table dropped somewhere ends.
    std::pair<float, float> dropped(float left, float top) {
        element(1)->setBounds({left, top, 1800, 2400});
        Back::lstTable_Moved(control(), std::int16_t{1});
        const Bounds at = boundsOf("lstTable(1)");
        EXPECT_EQ(moved->left, at.Left);
        EXPECT_EQ(moved->top, at.Top);
        return {at.Left, at.Top};
    }
    using Place = std::pair<float, float>;

    float lowest() { return 9000 - boundsOf("sprColumn").Top - boundsOf("fraTable").Top - 600; }

    Ref<fake::Table> moved;
};

TEST_F(MovingTables, StoresThePlaceAndTellsTheHost) {
    stage->moveTable(1, 4500, 1500);
    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{4500, 1500, 1800, 2400}));
    EXPECT_EQ(moved->left, 4500);
    EXPECT_EQ(moved->top, 1500);
    EXPECT_EQ(events(), Texts{"TableMoved"});
    EXPECT_EQ(told(), Texts{});
}

TEST_F(MovingTables, KeepsATableBelowTheVisibleTopEdge) {
    EXPECT_EQ(dropped(3000, -15), (Place{3000, 0}));
    EXPECT_EQ(dropped(3000, 0), (Place{3000, 0}));
}

TEST_F(MovingTables, KeepsATableRightOfTheVisibleLeftEdge) {
    EXPECT_EQ(dropped(-15, 3000), (Place{0, 3000}));
    EXPECT_EQ(dropped(0, 3000), (Place{0, 3000}));
}

TEST_F(MovingTables, ReckonsTheEdgesWithTheScrolling) {
    stage->scrollBarTo("hsbTable", 300);
    stage->scrollBarTo("vsbTable", 450);
    ASSERT_EQ(boundsOf("fraTable").Left, -300);

    EXPECT_EQ(dropped(-600, 3000), (Place{300, 3000}));
    EXPECT_EQ(dropped(3000, 435), (Place{3000, 450}));
    EXPECT_EQ(dropped(15000, 3000), (Place{12000 + 300 - 600, 3000}));
}

TEST_F(MovingTables, BringsATableDraggedLeftOfTheScrolledCanvasToItsVisibleEdge) {
    stage->scrollBarTo("hsbTable", 300);
    stage->moveTable(1, -150, 3000);
    EXPECT_EQ(boundsOf("lstTable(1)").Left, 300);
    EXPECT_EQ(moved->left, 300);
}

TEST_F(MovingTables, KeepsATableAboveTheLowerLimitThatReckonsWithTheTopOfTheGrid) {
    control().OnlyJoin(false);
    ASSERT_EQ(boundsOf("sprColumn").Top, 4500);
    Back::sprColumn(control())->Height(1500);
    EXPECT_EQ(dropped(3000, 8700), (Place{3000, 3900}));
    EXPECT_EQ(dropped(3000, 3900), (Place{3000, 3900}));
}

TEST_F(MovingTables, ReckonsWithTheTopOfAHiddenGridAsItStands) {
    control().OnlyJoin(false);
    control().OnlyJoin(true);
    EXPECT_EQ(dropped(3000, 12000), (Place{3000, lowest()}));
}

TEST_F(MovingTables, LetsTheLowerLimitReachFurtherDownTheScrolledCanvas) {
    control().OnlyJoin(false);
    stage->scrollBarTo("vsbTable", 450);
    EXPECT_EQ(dropped(3000, 8700), (Place{3000, 3900 + 450}));
}

TEST_F(MovingTables, KeepsATableLeftOfTheRightLimit) {
    EXPECT_EQ(dropped(11415, 3000), (Place{11400, 3000}));
    EXPECT_EQ(dropped(11400, 3000), (Place{11400, 3000}));
}

TEST_F(MovingTables, LetsTheLowerAndTheRightLimitWinInASmallControl) {
    stage->resizeControl(450, 300);
    EXPECT_EQ(dropped(-600, -900), (Place{450 - 600, 300 - boundsOf("sprColumn").Top - 600}));
}

TEST_F(MovingTables, RedrawsTheJoinsWhenTheMoveIsOver) {
    model->join(moved, u"ID", table(u"B", {u"ID"}, 6000), u"ID");
    bind();
    const float before = stage->look("linJoin(1)").X1;

    stage->moveTable(1, 1500, 3000);
    EXPECT_EQ(stage->look("linJoin(1)").X1, before - 1500);
}

TEST_F(MovingTables, KeepsTheLimitedPlaceOfATableThatTheModelLacksAndTellsTheHostNothing) {
    model->tables.items.Remove(u"tA");
    element(1)->setBounds({-600, 3000, 1800, 2400});
    Back::lstTable_Moved(control(), std::int16_t{1});

    EXPECT_EQ(told(), Texts{noKey("lstTable_Moved")});
    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{0, 3000, 1800, 2400}));
    EXPECT_EQ(moved->left, 3000);
    EXPECT_EQ(events(), Texts{});
}

TEST_F(MovingTables, KeepsTheLeftStoredWhenTheModelRefusesTheTop) {
    model->fail("ZDTable.Top=", broken());
    stage->moveTable(1, 1500, 1500);

    EXPECT_EQ(told(), Texts{brokenIn("lstTable_Moved")});
    EXPECT_EQ(moved->left, 1500);
    EXPECT_EQ(moved->top, 3000);
    EXPECT_EQ(events(), Texts{});
}

TEST_F(MovingTables, ReportsASlotWithoutATable) {
    Back::lstTable_Moved(control(), std::int16_t{7});
    EXPECT_EQ(told(), Texts{noElement("lstTable_Moved", 7)});
    EXPECT_EQ(events(), Texts{});
}

/// Two joined tables, of which the first is under the user's mouse.
class FollowingAMove : public CanvasTest {
protected:
    FollowingAMove() {
        moved = table(u"A", {u"ID", u"NAME"}, 600);
        model->join(moved, u"ID", table(u"B", {u"ID"}, 6000), u"ID");
    }

    Ref<fake::Table> moved;
};

TEST_F(FollowingAMove, RedrawsTheJoinsBeforeTheMoveIsOverAndLeavesHostAndModelAlone) {
    bind();
    const float before = stage->look("linJoin(1)").X1;
    model->calls->remember(true);
    element(1)->Left(1500);
    Back::lstTable_Moving(control(), std::int16_t{1});

    EXPECT_EQ(stage->look("linJoin(1)").X1, before + 900);
    EXPECT_EQ(events(), Texts{});
    EXPECT_EQ(model->calls->calls(), Texts{});
    EXPECT_EQ(moved->left, 600);
    EXPECT_EQ(boundsOf("lstTable(1)").Left, 1500);
}

TEST_F(FollowingAMove, LeavesTheTableOutsideTheLimitsUntilTheMoveIsOver) {
    bind();
    element(1)->Left(-900);
    Back::lstTable_Moving(control(), std::int16_t{1});
    EXPECT_EQ(boundsOf("lstTable(1)").Left, -900);
}

TEST_F(FollowingAMove, ReportsAJoinThatCannotBeDrawnOnceWhereTheMoveEndsAndNotAtEveryStep) {
    model->joins.items.Remove(u"j1");
    model->join(moved, u"ID", moved, u"NAME");
    model->join(moved, u"ID", table(u"C", {u"ID"}, 9000), u"ID");
    bind();
    const float before = stage->look("linJoin(2)").X1;

    element(1)->Left(1500);
    Back::lstTable_Moving(control(), std::int16_t{1});
    Back::lstTable_Moving(control(), std::int16_t{1});
    EXPECT_EQ(told(), Texts{});
    EXPECT_EQ(stage->look("linJoin(2)").X1, before + 900) << "the other joins follow";

    Back::lstTable_Moved(control(), std::int16_t{1});
    EXPECT_EQ(told(), Texts{notSet("DrawJoin")});
}

class ResizingTables : public MovingTables {};

TEST_F(ResizingTables, StoresTheSizeAndTellsTheHostNothing) {
    stage->resizeTable(1, 2400, 1500);
    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{3000, 3000, 2400, 1500}));
    EXPECT_EQ(moved->width, 2400);
    EXPECT_EQ(moved->height, 1500);
    EXPECT_EQ(events(), Texts{});
    EXPECT_EQ(told(), Texts{});
}

TEST_F(ResizingTables, StoresANegativeWidthAsNone) {
    element(1)->setBounds({3000, 3000, -15, 1500});
    Back::lstTable_Resized(control(), std::int16_t{1});
    EXPECT_EQ(moved->width, 0);
    EXPECT_EQ(moved->height, 1500);
    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{3000, 3000, 0, 1500}));
}

TEST_F(ResizingTables, StoresANegativeHeightAsNone) {
    element(1)->setBounds({3000, 3000, 1500, -15});
    Back::lstTable_Resized(control(), std::int16_t{1});
    EXPECT_EQ(moved->width, 1500);
    EXPECT_EQ(moved->height, 0);
    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{3000, 3000, 1500, 0}));
}

TEST_F(ResizingTables, RedrawsTheJoins) {
    model->join(moved, u"ID", table(u"B", {u"ID"}, 9000), u"ID");
    bind();
    const float before = stage->look("linJoin(1)").X1;

    stage->resizeTable(1, 2400, 2400);
    EXPECT_EQ(stage->look("linJoin(1)").X1, before + 600);
}

TEST_F(ResizingTables, ReportsATableThatTheModelLacksAfterLimitingTheSize) {
    model->tables.items.Remove(u"tA");
    element(1)->setBounds({3000, 3000, -15, 1500});
    Back::lstTable_Resized(control(), std::int16_t{1});

    EXPECT_EQ(told(), Texts{noKey("lstTable_Resized")});
    EXPECT_EQ(boundsOf("lstTable(1)").Width, 0);
    EXPECT_EQ(moved->width, 1800);
}

} // namespace
