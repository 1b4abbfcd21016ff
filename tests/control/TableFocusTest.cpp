#include "CanvasTest.h"

namespace {

using GettingTheFocus = CanvasTest;

TEST_F(GettingTheFocus, MakesTheTableTheCurrentAndActiveOne) {
    const auto a = table(u"A", {}, 600);
    const auto b = table(u"B", {}, 3000);
    bind();

    stage->focus("lstTable(2)");
    EXPECT_EQ(a->selected, 0);
    EXPECT_EQ(b->selected, 1);
    EXPECT_EQ(Back::mActiveTableIndex(control()), 2);
}

TEST_F(GettingTheFocus, ClosesAnOpenCellEditor) {
    table(u"A", {}, 600);
    table(u"B", {}, 3000);
    bind();
    control().OnlyJoin(false);
    stage->pressCell(1, 1, 1);
    ASSERT_TRUE(stage->look("fraValue").visible);

    Back::lstTable_GotFocus(control(), std::int16_t{2});
    EXPECT_FALSE(stage->look("fraValue").visible);
}

TEST_F(GettingTheFocus, ReportsASlotWithoutATableAndKeepsTheActiveOne) {
    table(u"A", {}, 600);
    bind();
    Back::mActiveTableIndex(control()) = 1;

    Back::lstTable_GotFocus(control(), std::int16_t{9});
    EXPECT_EQ(told(), Texts{noElement("lstTable_GotFOcus", 9)});
    EXPECT_EQ(Back::mActiveTableIndex(control()), 1);
}

/// Three tables, of which the first is active and in reach.
class SettingTheFocusBack : public CanvasTest {
protected:
    SettingTheFocusBack() {
        table(u"A", {}, 600);
        table(u"B", {}, 3000);
        table(u"C", {}, 6000);
        bind();
        activate(1);
    }

    void activate(int index) {
        Back::mActiveTableIndex(control()) = static_cast<std::int16_t>(index);
    }
    int activeAfterwards() {
        Back::SetFocusBack(control());
        EXPECT_EQ(told(), Texts{});
        return Back::mActiveTableIndex(control());
    }
};

TEST_F(SettingTheFocusBack, KeepsAnActiveTableInReach) {
    activate(2);
    EXPECT_EQ(activeAfterwards(), 2);
}

TEST_F(SettingTheFocusBack, KeepsAnActiveTableAtTheOrigin) {
    element(2)->setBounds({0, 0, 1500, 1500});
    activate(2);
    EXPECT_EQ(activeAfterwards(), 2);
}

TEST_F(SettingTheFocusBack, LeavesATableAboveTheCanvasForTheFirstOneInReach) {
    element(2)->Top(-15);
    activate(2);
    EXPECT_EQ(activeAfterwards(), 1);
}

TEST_F(SettingTheFocusBack, LeavesATableLeftOfTheCanvasForTheFirstOneInReach) {
    element(1)->Left(-15);
    EXPECT_EQ(activeAfterwards(), 2);
}

TEST_F(SettingTheFocusBack, PassesOverTablesAtTheEdges) {
    element(1)->Left(0);
    element(2)->Top(0);
    activate(0);
    EXPECT_EQ(activeAfterwards(), 3);
}

TEST_F(SettingTheFocusBack, PassesOverFreeSlots) {
    Back::RemoveTable(control(), std::int16_t{1});
    activate(0);
    EXPECT_EQ(activeAfterwards(), 2);
}

TEST_F(SettingTheFocusBack, KeepsATableOutOfReachWhenThereIsNoBetterOne) {
    for (const std::int16_t i : {1, 2, 3}) element(i)->Left(-15);
    activate(2);
    EXPECT_EQ(activeAfterwards(), 2);
}

TEST_F(SettingTheFocusBack, ForgetsTheActiveTableOfAFreeSlot) {
    for (const std::int16_t i : {1, 2, 3}) element(i)->Left(0);
    activate(4);
    EXPECT_EQ(activeAfterwards(), 0);
}

TEST_F(SettingTheFocusBack, GivesTheFocusToAShownGridAndKeepsTheActiveTable) {
    control().OnlyJoin(false);
    element(2)->Top(-15);
    activate(2);
    EXPECT_EQ(activeAfterwards(), 2);
    EXPECT_TRUE(stage->look("sprColumn").focused);
}

TEST_F(SettingTheFocusBack, ReportsAGridThatCannotTakeTheFocus) {
    control().OnlyJoin(false);
    Back::sprColumn(control())->Visible(false);
    activate(0);
    Back::SetFocusBack(control());
    EXPECT_EQ(told(), Texts{noKey("SetFocusBack")});
    EXPECT_EQ(Back::mActiveTableIndex(control()), 0);
    EXPECT_FALSE(stage->look("sprColumn").focused);
}

TEST_F(SettingTheFocusBack, LeavesTheFocusWithATableInReachThoughTheGridIsShown) {
    control().OnlyJoin(false);
    activate(2);
    EXPECT_EQ(activeAfterwards(), 2);
    EXPECT_FALSE(stage->look("sprColumn").focused);
}

TEST_F(SettingTheFocusBack, ReportsAFailureUnderItsName) {
    std::int32_t slot = 0;
    Back::mTableFreeList(control())->GetNextFreeIndex(slot);
    activate(slot);

    Back::SetFocusBack(control());
    EXPECT_EQ(told(), Texts{noElement("SetFocusBack", 4)});
}

} // namespace
