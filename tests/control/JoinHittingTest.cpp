#include "control/JoinScene.h"

namespace {

struct TheDistanceFromAJoinLine : JoinScene {
    float delta(float x, float y, float x1, float y1, float x2, float y2) {
        return Back::DeltaJoinLine(control, x, y, x1, y1, x2, y2);
    }
};

TEST_F(TheDistanceFromAJoinLine, IsPositiveOnOneSideAndNegativeOnTheOther) {
    EXPECT_FLOAT_EQ(delta(20, 10, 0, 0, 100, 0), 10);
    EXPECT_FLOAT_EQ(delta(20, -10, 0, 0, 100, 0), -10);
    EXPECT_FLOAT_EQ(delta(20, 10, 100, 0, 0, 0), -10);
}

TEST_F(TheDistanceFromAJoinLine, IsZeroOnTheLine) {
    EXPECT_EQ(delta(20, 0, 0, 0, 100, 0), 0);
    EXPECT_NEAR(delta(6, 8, 0, 0, 3, 4), 0, 1e-5);
}

TEST_F(TheDistanceFromAJoinLine, IsPerpendicular) {
    EXPECT_FLOAT_EQ(delta(4, -3, 0, 0, 3, 4), -5);
    EXPECT_NEAR(delta(1000 - 4, 1000 + 3, 1000, 1000, 1003, 1004), 5, 1e-3);
}

TEST_F(TheDistanceFromAJoinLine, IsThatFromTheInfiniteLine) {
    EXPECT_FLOAT_EQ(delta(-5000, 10, 0, 0, 100, 0), 10);
}

TEST_F(TheDistanceFromAJoinLine, IsThatOfSinglesAtEachStep) {
    // To the last digit: length, both directions and the line's own distance are rounded.
    EXPECT_EQ(delta(5387, 6482, 3645, 9090, 8355, 1995), 8.902226448059082F);
    EXPECT_EQ(delta(8265, 4450, 7275, 9600, 8910, 1005), 10.149930000305176F);
    EXPECT_EQ(delta(7441, 3931, 7200, 3975, 8460, 3585), 29.227083206176758F);
}

TEST_F(TheDistanceFromAJoinLine, IsZeroAndReportedWhenBothEndsCoincide) {
    EXPECT_EQ(delta(20, 10, 5, 5, 5, 5), 0);
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"DeltaJoinLine", 11, u"Division by zero")});
}

/// Three joins; the tests put their lines where they need them.
struct TheJoinUnderAPoint : JoinScene {
    TheJoinUnderAPoint() {
        join();
        join();
        join();
        bind();
        for (const std::int16_t n : {1, 2, 3}) put(n, -9000, -9000, -8000, -9000);
    }

    /// A record that names a line which there is not, and so cannot be drawn.
    void loseLine(const String& key) {
        record(key)->JoinLineIndex(99);
        Back::DrawJoin(control, *record(key));
        forget();
    }

    Record hit;
    bool at(float x, float y) { return Back::JoinHitTest(control, hit, x, y); }
    bool isHit(float x, float y) {
        hit = nullptr;
        return at(x, y);
    }
};

TEST_F(TheJoinUnderAPoint, IsOneCloserThan50) {
    put(1, 1000, 1000, 3000, 1000);
    EXPECT_TRUE(isHit(2000, 1049.9F));
    EXPECT_EQ(hit, record(u"1"));
    EXPECT_FALSE(isHit(2000, 1050));
    EXPECT_EQ(hit, nullptr);
    EXPECT_TRUE(isHit(2000, 950.1F));
    EXPECT_FALSE(isHit(2000, 950));
}

TEST_F(TheJoinUnderAPoint, IsOneThatSinglesPutWithinItsReach) {
    put(1, 8085, 11815, 9105, 2745);
    EXPECT_TRUE(isHit(8984, 4268.359375F)) << "49.9995 twips away, and more in doubles";
}

TEST_F(TheJoinUnderAPoint, IsOneWhoseRangeOfXHoldsThePointEndsIncluded) {
    put(1, 1000, 1000, 3000, 1000);
    EXPECT_TRUE(isHit(1000, 1000));
    EXPECT_TRUE(isHit(3000, 1000));
    EXPECT_FALSE(isHit(999.9F, 1000));
    EXPECT_FALSE(isHit(3000.1F, 1000));
}

TEST_F(TheJoinUnderAPoint, IsNeverBeyondTheRangeOfXOfASteepLineHoweverClose) {
    put(1, 1000, 1000, 1010, 5000);
    EXPECT_TRUE(isHit(1005, 3000));
    EXPECT_FALSE(isHit(999, 1001));
    EXPECT_FALSE(isHit(1011, 4999));
}

TEST_F(TheJoinUnderAPoint, IsNoneThatEndsBeforeItHoweverFarAway) {
    put(1, 1000, 1000, 3000, 1000);
    for (const float away : {-4e5F, -1000.0F, 999.9F, 3000.1F, 9000.0F, 4e5F})
        EXPECT_FALSE(isHit(away, 1000)) << away;
    // Lines and points beyond all screens, where each line is looked at.
    put(2, 3e5F, 1000, 5e5F, 1000);
    EXPECT_TRUE(isHit(4e5F, 1000));
    EXPECT_EQ(hit, record(u"2"));
    EXPECT_FALSE(isHit(6e5F, 1000));
    EXPECT_FALSE(isHit(2e5F, 1000));
}

TEST_F(TheJoinUnderAPoint, IsFoundHoweverFarDownItsLineEnds) {
    put(1, 1000, 0, 1100, 1e38F);
    EXPECT_TRUE(isHit(1020, 500));
    put(1, 1000, 1e38F, 1100, 0);
    EXPECT_TRUE(isHit(1080, 500));
}

TEST_F(TheJoinUnderAPoint, IsNotTestedForTheRangeOfY) {
    // Past the end of the steep line, in line with it and within its range of X.
    put(1, 1000, 1000, 1010, 5000);
    EXPECT_TRUE(isHit(1010, 5030));
}

TEST_F(TheJoinUnderAPoint, IsFoundWhicheverEndOfItsLineIsTheWesternOne) {
    put(1, 3000, 2000, 1000, 1000);
    EXPECT_TRUE(isHit(2000, 1500));
    EXPECT_FALSE(isHit(2000, 1600));
    EXPECT_FALSE(isHit(3001, 2000));
}

TEST_F(TheJoinUnderAPoint, IsTheNearest) {
    put(1, 1000, 1000, 3000, 1000);
    put(2, 1000, 1030, 3000, 1030);
    put(3, 1000, 1060, 3000, 1060);
    EXPECT_TRUE(isHit(2000, 1028));
    EXPECT_EQ(hit, record(u"2"));
    EXPECT_TRUE(isHit(2000, 1058));
    EXPECT_EQ(hit, record(u"3"));
    EXPECT_TRUE(isHit(2000, 1002));
    EXPECT_EQ(hit, record(u"1"));
}

TEST_F(TheJoinUnderAPoint, IsTheEarlierOfTwoAtTheSameDistance) {
    put(2, 1000, 1040, 3000, 1040);
    put(3, 1000, 1000, 3000, 1000);
    EXPECT_TRUE(isHit(2000, 1020));
    EXPECT_EQ(hit, record(u"2"));
}

TEST_F(TheJoinUnderAPoint, IsAVerticalOneOnlyAtExactlyItsX) {
    put(1, 2000, 1000, 2000, 3000);
    EXPECT_TRUE(isHit(2000, 2000));
    EXPECT_FALSE(isHit(2000.5F, 2000));
    EXPECT_FALSE(isHit(1999.5F, 2000));
}

TEST_F(TheJoinUnderAPoint, IsTheOneHandedInWhenNoLineIsNear) {
    hit = record(u"2");
    EXPECT_TRUE(at(11000, 8000));
    EXPECT_EQ(hit, record(u"2"));
}

TEST_F(TheJoinUnderAPoint, ReplacesTheOneHandedIn) {
    put(1, 1000, 1000, 3000, 1000);
    hit = record(u"2");
    EXPECT_TRUE(at(2000, 1000));
    EXPECT_EQ(hit, record(u"1"));
}

TEST_F(TheJoinUnderAPoint, IsNothingWhereNoLineIs) {
    EXPECT_FALSE(isHit(11000, 8000));
    EXPECT_EQ(hit, nullptr);
    EXPECT_EQ(stage->boxes, Boxes());
}

const Stage::Box noLine =
    controlErrorBox(u"JoinHitTest", 340, u"Control array element '99' doesn't exist");

TEST_F(TheJoinUnderAPoint, IsAnsweredWithYesWhenTheSearchFails) {
    loseLine(u"1");
    EXPECT_TRUE(isHit(2000, 1000));
    EXPECT_EQ(hit, nullptr);
    EXPECT_EQ(stage->boxes, Boxes{noLine});
}

TEST_F(TheJoinUnderAPoint, IsTheOneFoundBeforeAFailureEndsTheSearch) {
    put(1, 1000, 1030, 3000, 1030);
    loseLine(u"2");
    put(3, 1000, 1000, 3000, 1000);
    EXPECT_TRUE(isHit(2000, 1000));
    EXPECT_EQ(hit, record(u"1"));
    EXPECT_EQ(stage->boxes, Boxes{noLine});
}

TEST_F(TheJoinUnderAPoint, IsOneOfNoLengthAtItsXBecauseTheFailedDistanceIsZero) {
    put(1, 2000, 1000, 2000, 1000);
    EXPECT_TRUE(isHit(2000, 7000));
    EXPECT_EQ(hit, record(u"1"));
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"DeltaJoinLine", 11, u"Division by zero")});
}

} // namespace
