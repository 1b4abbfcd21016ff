#include "control/JoinScene.h"

using namespace zandor;

namespace {

/// A join that has been drawn, and then something happens to what it was drawn between.
struct TheEndsOfAJoin : JoinScene {
    TheEndsOfAJoin() {
        join();
        bind();
    }

    void move(float left = 1200) {
        table(1).Left(left);
        Back::lstTable_Moving(control, std::int16_t{1});
    }
    /// The height that the western mark has its middle at.
    float westRow() { return stage->look("shpJoin(2)").bounds.Top + 70; }
    float row(std::int32_t position) { return entry(1, position)->RightEdgePoint().Y; }
};

TEST_F(TheEndsOfAJoin, FollowEveryStepOfAMove) {
    for (const float left : {1200.0F, 1500.0F, 9000.0F, 1000.0F}) {
        move(left);
        const bool leftIsEast = left > 5000;
        EXPECT_EQ(stage->look("linJoin(1)").X1 < left, leftIsEast) << left;
    }
    EXPECT_FLOAT_EQ(westRow(), row(2));
}

TEST_F(TheEndsOfAJoin, AreAtAnEntryOfTheNameThatCameBehindTheOthers) {
    table(1).ColumnItems().Add(u"kLast", u"Customer");
    move();
    EXPECT_FLOAT_EQ(westRow(), row(4));
}

TEST_F(TheEndsOfAJoin, AreWhereTheEntryStandsInAListThatIsFilledAnew) {
    table(1).Terminate();
    for (const char16_t* name : {u"New", u"Id", u"Customer"})
        table(1).ColumnItems().Add(name, name);
    move();
    EXPECT_FLOAT_EQ(westRow(), row(3));
}

TEST_F(TheEndsOfAJoin, StayWhereTheyWereWhenTheEntryHasGone) {
    table(1).Terminate();
    const float before = stage->look("linJoin(1)").X1;
    move();
    EXPECT_EQ(stage->look("linJoin(1)").X1, before);
    EXPECT_EQ(stage->boxes, Boxes()) << "reported where the move ends";
}

TEST_F(TheEndsOfAJoin, AreThoseOfTheNameThatTheRecordHasNow) {
    record()->LeftColumnName(u"Total");
    move();
    EXPECT_FLOAT_EQ(westRow(), row(3));
}

TEST_F(TheEndsOfAJoin, AreThoseOfTheTableThatTheRecordHasNow) {
    record()->RightColumnName(u"Id");
    record()->LeftColumnName(u"Name");
    const std::int32_t left = record()->LeftTablehwnd();
    record()->LeftTablehwnd(record()->RightTablehwnd());
    record()->RightTablehwnd(left);
    move();
    EXPECT_FLOAT_EQ(westRow(), row(1));
}

TEST_F(TheEndsOfAJoin, AreThoseOfARecordThatTookOverAnother) {
    const Record second = draw(entry(1, 3), entry(2, 2));
    record()->CopyFields(*second);
    move();
    EXPECT_FLOAT_EQ(stage->look("shpJoin(4)").bounds.Top + 70, row(3));
}

TEST_F(TheEndsOfAJoin, AreNoneInASlotThatAnotherTableTook) {
    Back::lstTable(control).Unload(2);
    Back::lstTable(control).Load(2);
    table(2).ColumnItems().Add(u"k", u"Number");
    const float before = stage->look("linJoin(1)").X1;
    move();
    EXPECT_EQ(stage->look("linJoin(1)").X1, before);
}

} // namespace
