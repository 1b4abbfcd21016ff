#include <Zandor/control/clsFreeList.h>

#include "RecordingBoxes.h"

#include <gtest/gtest.h>

#include <limits>

using namespace zandor;

using TalvikDBxZandor::clsFreeList;

namespace {

class TheSlotFreeList : public testing::Test {
protected:
    static RecordingBoxes::Box report(platform::StringView function, platform::StringView number,
                                      platform::StringView description) {
        return unexpectedError(u"TalvikZandor.clsFreeList", function, number, description);
    }
    static RecordingBoxes::Box outOfRange(platform::StringView function) {
        return report(function, u"9", u"Subscript out of range");
    }

    std::int32_t take() {
        std::int32_t index = -1;
        EXPECT_TRUE(list.GetNextFreeIndex(index));
        return index;
    }

    RecordingBoxes boxes;
    clsFreeList list{boxes};
};

constexpr std::int32_t lowest = std::numeric_limits<std::int32_t>::min();
constexpr std::int32_t highest = std::numeric_limits<std::int32_t>::max();

} // namespace

TEST_F(TheSlotFreeList, HasNoRangeBeforeItIsCreated) {
    EXPECT_EQ(list.FreeCount(), 0);
    EXPECT_EQ(list.RangeFrom(), 0);
    EXPECT_EQ(list.RangeTo(), 0);
    EXPECT_TRUE(boxes.shown.empty());
}

TEST_F(TheSlotFreeList, CountsTheWholeRangeFreeOnceCreated) {
    EXPECT_TRUE(list.CreateList(1, 16));
    EXPECT_EQ(list.FreeCount(), 16);
    EXPECT_EQ(list.RangeFrom(), 1);
    EXPECT_EQ(list.RangeTo(), 16);
}

TEST_F(TheSlotFreeList, HandsOutTheLowestFreeIndexFirst) {
    list.CreateList(1, 16);
    for (std::int32_t n = 1; n <= 16; ++n) EXPECT_EQ(take(), n);
    EXPECT_EQ(list.FreeCount(), 0);
}

TEST_F(TheSlotFreeList, RefusesWithoutAWordWhenEveryIndexIsInUse) {
    list.CreateList(1, 16);
    for (int n = 0; n < 16; ++n) take();
    std::int32_t index = 77;
    EXPECT_FALSE(list.GetNextFreeIndex(index));
    EXPECT_EQ(index, 77);
    EXPECT_EQ(list.FreeCount(), 0);
    EXPECT_TRUE(boxes.shown.empty());
}

TEST_F(TheSlotFreeList, HandsOutAnIndexGivenBackBeforeAHigherOne) {
    list.CreateList(1, 16);
    for (int n = 0; n < 5; ++n) take();
    EXPECT_TRUE(list.FreeIndex(3));
    EXPECT_EQ(list.FreeCount(), 12);
    EXPECT_EQ(take(), 3);
    EXPECT_EQ(take(), 6);
}

TEST_F(TheSlotFreeList, RefusesARangeOfFewerThanTwoIndexes) {
    EXPECT_FALSE(list.CreateList(5, 5));
    EXPECT_FALSE(list.CreateList(5, 4));
    EXPECT_EQ(list.FreeCount(), 0);
    EXPECT_EQ(list.RangeFrom(), 0);
    EXPECT_TRUE(boxes.shown.empty());
    EXPECT_TRUE(list.CreateList(5, 6));
    EXPECT_EQ(list.FreeCount(), 2);
}

TEST_F(TheSlotFreeList, KeepsItsRangeWhenAnotherIsRefused) {
    list.CreateList(1, 16);
    take();
    EXPECT_FALSE(list.CreateList(5, 5));
    EXPECT_EQ(list.RangeTo(), 16);
    EXPECT_EQ(list.FreeCount(), 15);
    EXPECT_FALSE(list.IsFree(1));
}

TEST_F(TheSlotFreeList, IsMadeByTheFactoryOverItsRange) {
    const auto made = list.CreateFreeList(1, 64);
    ASSERT_TRUE(made);
    EXPECT_EQ(made->FreeCount(), 64);
    EXPECT_EQ(list.FreeCount(), 0) << "the list that was asked stays as it was";
}

TEST_F(TheSlotFreeList, ComesAsNothingFromTheFactoryForARangeOfOne) {
    EXPECT_FALSE(list.CreateFreeList(5, 5));
    EXPECT_TRUE(boxes.shown.empty());
}

TEST_F(TheSlotFreeList, ReadsFreeAndInUseByIndex) {
    list.CreateList(3, 5);
    take();
    EXPECT_FALSE(list.IsFree(3));
    EXPECT_TRUE(list.IsFree(4));
    list.FreeIndex(3);
    EXPECT_TRUE(list.IsFree(3));
}

TEST_F(TheSlotFreeList, ReadsFreeOutsideItsRange) {
    list.CreateList(1, 16);
    for (int n = 0; n < 16; ++n) take();
    for (const std::int32_t index : {lowest, -1, 0, 17, 18, highest})
        EXPECT_TRUE(list.IsFree(index)) << index;
    EXPECT_TRUE(boxes.shown.empty());
}

TEST_F(TheSlotFreeList, ReadsFreeEverywhereBeforeItIsCreated) {
    for (const std::int32_t index : {-1, 0, 1, 16}) EXPECT_TRUE(list.IsFree(index)) << index;
    EXPECT_TRUE(boxes.shown.empty());
}

TEST_F(TheSlotFreeList, CountsAnIndexFreedTwiceTwice) {
    list.CreateList(1, 16);
    EXPECT_TRUE(list.FreeIndex(2));
    EXPECT_TRUE(list.FreeIndex(2));
    EXPECT_EQ(list.FreeCount(), 18);
    EXPECT_EQ(take(), 1);
    EXPECT_EQ(list.FreeCount(), 17);
}

TEST_F(TheSlotFreeList, FreesEveryIndexWhenCreatedAgain) {
    list.CreateList(1, 16);
    for (int n = 0; n < 7; ++n) take();
    EXPECT_TRUE(list.CreateList(1, 4));
    EXPECT_EQ(list.FreeCount(), 4);
    EXPECT_EQ(list.RangeTo(), 4);
    EXPECT_EQ(take(), 1);
}

TEST_F(TheSlotFreeList, ReportsTheMissingFlagsWhenAskedForAnIndexBeforeItIsCreated) {
    std::int32_t index = 77;
    EXPECT_FALSE(list.GetNextFreeIndex(index));
    EXPECT_EQ(index, 77);
    EXPECT_EQ(list.FreeCount(), 0);
    EXPECT_EQ(boxes.shown, std::vector{outOfRange(u"GetNextFreeIndex")});
}

TEST_F(TheSlotFreeList, ReportsTheMissingFlagsWhenGivenAnIndexBeforeItIsCreated) {
    EXPECT_FALSE(list.FreeIndex(0));
    EXPECT_FALSE(list.FreeIndex(1));
    EXPECT_EQ(list.FreeCount(), 0);
    EXPECT_EQ(boxes.shown, (std::vector{outOfRange(u"FreeIndex"), outOfRange(u"FreeIndex")}));
}

TEST_F(TheSlotFreeList, ReportsAnIndexBelowItsStart) {
    list.CreateList(1, 16);
    EXPECT_FALSE(list.FreeIndex(0));
    EXPECT_EQ(list.FreeCount(), 16);
    EXPECT_EQ(boxes.shown, std::vector{outOfRange(u"FreeIndex")});
}

TEST_F(TheSlotFreeList, ReportsAnIndexMoreThanOneBeyondItsEnd) {
    list.CreateList(1, 16);
    EXPECT_FALSE(list.FreeIndex(18));
    EXPECT_EQ(list.FreeCount(), 16);
    EXPECT_EQ(boxes.shown, std::vector{outOfRange(u"FreeIndex")});
}

TEST_F(TheSlotFreeList, TakesTheIndexBehindItsEndInSilenceButNeverHandsItOut) {
    list.CreateList(1, 2);
    EXPECT_TRUE(list.FreeIndex(3));
    EXPECT_EQ(list.FreeCount(), 3);
    EXPECT_TRUE(boxes.shown.empty());
    EXPECT_EQ(take(), 1);
    EXPECT_EQ(take(), 2);
    std::int32_t index = 0;
    EXPECT_FALSE(list.GetNextFreeIndex(index));
    EXPECT_EQ(list.FreeCount(), 1);
}

TEST_F(TheSlotFreeList, ReportsAnOverflowOfTheIndexArithmetic) {
    list.CreateList(1, 16);
    EXPECT_FALSE(list.FreeIndex(lowest));
    EXPECT_EQ(list.FreeCount(), 16);
    EXPECT_EQ(boxes.shown, std::vector{report(u"FreeIndex", u"6", u"Overflow")});
}

TEST_F(TheSlotFreeList, ReportsAnOverflowOfTheRange) {
    EXPECT_FALSE(list.CreateList(lowest, highest));
    EXPECT_FALSE(list.CreateList(0, highest));
    EXPECT_EQ(boxes.shown, (std::vector{report(u"CreateList", u"6", u"Overflow"),
                                        report(u"CreateList", u"6", u"Overflow")}));
    EXPECT_EQ(list.FreeCount(), 0);
    EXPECT_TRUE(list.IsFree(5));
}

TEST_F(TheSlotFreeList, ReportsAnOverflowOfTheCountWithTheIndexFreedAlready) {
    if (sizeof(void*) == 4) GTEST_SKIP() << "32 bits have no room for so many slots";
    ASSERT_TRUE(list.CreateList(0, highest - 1));
    EXPECT_EQ(take(), 0);
    EXPECT_TRUE(list.FreeIndex(1));
    EXPECT_EQ(list.FreeCount(), highest);
    EXPECT_FALSE(list.FreeIndex(0));
    EXPECT_EQ(list.FreeCount(), highest);
    EXPECT_TRUE(list.IsFree(0));
    EXPECT_EQ(boxes.shown, std::vector{report(u"FreeIndex", u"6", u"Overflow")});
}

TEST_F(TheSlotFreeList, MakesNothingWhenTheRangeOverflowsInTheFactory) {
    EXPECT_FALSE(list.CreateFreeList(lowest, highest));
    EXPECT_EQ(boxes.shown, std::vector{report(u"CreateList", u"6", u"Overflow")});
}

TEST_F(TheSlotFreeList, HandsOutNegativeIndexesToo) {
    list.CreateList(-2, 1);
    EXPECT_EQ(list.FreeCount(), 4);
    EXPECT_EQ(take(), -2);
    EXPECT_EQ(take(), -1);
    EXPECT_EQ(take(), 0);
    EXPECT_FALSE(list.IsFree(0));
}
