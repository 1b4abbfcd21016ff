#include "CanvasTest.h"

namespace {

using FindingTables = CanvasTest;
using FindingColumns = CanvasTest;
using SelectingATable = CanvasTest;
using ShowingTheSelectedTable = CanvasTest;

TEST_F(FindingTables, YieldsTheShownTableOfTheName) {
    table(u"A", {}, 600);
    table(u"B", {}, 3000);
    bind();

    Ref<Tabulet> found;
    EXPECT_TRUE(Back::FindTable(control(), u"B", found));
    EXPECT_EQ(found, element(2));
}

TEST_F(FindingTables, YieldsNothingForANameThatNoShownTableHasAndIsTrueAllTheSame) {
    table(u"A", {}, 600);
    bind();

    Ref<Tabulet> found = element(1);
    EXPECT_TRUE(Back::FindTable(control(), u"B", found));
    EXPECT_FALSE(found);
    EXPECT_EQ(told(), Texts{});
}

TEST_F(FindingTables, ComparesCase) {
    table(u"ORDERS", {}, 600);
    bind();

    Ref<Tabulet> found;
    EXPECT_TRUE(Back::FindTable(control(), u"Orders", found));
    EXPECT_FALSE(found);
}

TEST_F(FindingTables, YieldsTheLowerSlotOfTwoTablesOfOneName) {
    model->table(u"A", {}, u"k1");
    model->table(u"SAME", {}, u"k2");
    model->table(u"SAME", {}, u"k3");
    bind();

    Ref<Tabulet> found;
    EXPECT_TRUE(Back::FindTable(control(), u"SAME", found));
    EXPECT_EQ(found, element(2));
}

TEST_F(FindingTables, PassesOverFreeSlots) {
    for (const char16_t* name : {u"A", u"B", u"C"}) model->table(name);
    bind();
    Back::RemoveTable(control(), std::int16_t{1});

    Ref<Tabulet> found;
    EXPECT_TRUE(Back::FindTable(control(), u"C", found));
    EXPECT_EQ(found, element(3));
    EXPECT_EQ(told(), Texts{});
}

TEST_F(FindingTables, NeverYieldsTheTemplate) {
    Ref<Tabulet> found;
    EXPECT_TRUE(Back::FindTable(control(), element(0)->Text(), found));
    EXPECT_FALSE(found);
}

TEST_F(FindingTables, ReportsASlotThatIsTakenButNotLoaded) {
    std::int32_t slot = 0;
    Back::mTableFreeList(control())->GetNextFreeIndex(slot);

    Ref<Tabulet> found = element(0);
    Back::FindTable(control(), u"A", found);
    EXPECT_EQ(told(), Texts{noElement("FindTable", 1)});
    EXPECT_FALSE(found);
}

TEST_F(FindingColumns, YieldsTheFirstEntryOfTheName) {
    const auto shown = model->table(u"A");
    for (const char16_t* key : {u"c1", u"c2", u"c3"})
        shown->addColumn(String(key) == u"c1" ? u"ID" : u"NAME", key);
    bind();

    Ref<ColumnItem> found;
    EXPECT_TRUE(Back::FindColumn(control(), element(1), u"NAME", found));
    ASSERT_TRUE(found);
    EXPECT_EQ(found->Key(), u"c2");
}

TEST_F(FindingColumns, ComparesCase) {
    model->table(u"A", {u"ID"});
    bind();

    Ref<ColumnItem> found = element(1)->ColumnItems().Item(1);
    EXPECT_TRUE(Back::FindColumn(control(), element(1), u"id", found));
    EXPECT_FALSE(found);
    EXPECT_EQ(told(), Texts{});
}

TEST_F(FindingColumns, ReportsATableThatIsNothing) {
    model->table(u"A", {u"ID"});
    bind();

    Ref<ColumnItem> found = element(1)->ColumnItems().Item(1);
    Back::FindColumn(control(), Ref<Tabulet>(), u"ID", found);
    EXPECT_EQ(told(), Texts{notSet("FindColumn")});
    EXPECT_FALSE(found);
}

TEST_F(SelectingATable, MarksTheTableOfTheKeyAndNoOther) {
    const auto a = model->table(u"A", {}, u"k1");
    const auto b = model->table(u"B", {}, u"k2");
    bind();
    a->selected = 1;

    EXPECT_TRUE(Back::SetSelectedTable(control(), u"k2"));
    EXPECT_EQ(a->selected, 0);
    EXPECT_EQ(b->selected, 1);
}

TEST_F(SelectingATable, MarksOnlyTheFirstOfTwoTablesOfOneKey) {
    const auto a = model->table(u"A", {}, u"k1");
    const auto b = model->table(u"B", {}, u"k2");
    const auto c = model->table(u"C", {}, u"k3");
    bind();
    c->key = u"k2";
    c->selected = 1;

    EXPECT_TRUE(Back::SetSelectedTable(control(), u"k2"));
    EXPECT_EQ(a->selected, 0);
    EXPECT_EQ(b->selected, 1);
    EXPECT_EQ(c->selected, 0);
}

TEST_F(SelectingATable, ClearsEveryFlagForAnUnknownKey) {
    const auto a = model->table(u"A");
    const auto b = model->table(u"B");
    bind();
    a->selected = b->selected = 1;

    EXPECT_TRUE(Back::SetSelectedTable(control(), u"no such key"));
    EXPECT_EQ(a->selected, 0);
    EXPECT_EQ(b->selected, 0);
}

TEST_F(SelectingATable, TracesItsNameOnlyWhileTheSwitchIsOn) {
    bind();
    Back::SetSelectedTable(control(), u"k1");
    EXPECT_EQ(told(), Texts{});

    control().DebugSwitch(1);
    Back::SetSelectedTable(control(), u"k1");
    control().DebugSwitch(0);
    EXPECT_EQ(told(), Texts{trace("SetSelectedTable")});
}

TEST_F(SelectingATable, IsFalseAfterAFailureAndLeavesWhatItMarkedBefore) {
    const auto a = model->table(u"A", {}, u"k1");
    const auto b = model->table(u"B", {}, u"k2");
    bind();
    a->selected = 0;
    b->selected = 1;
    model->fail("ZDTable.Selected=", broken(), 2);

    EXPECT_FALSE(Back::SetSelectedTable(control(), u"k1"));
    EXPECT_EQ(told(), Texts{brokenIn("SetSelectedTable")});
    EXPECT_EQ(a->selected, 1);
    EXPECT_EQ(b->selected, 1);
}

TEST_F(ShowingTheSelectedTable, MakesTheFirstSelectedTableCurrent) {
    const auto a = table(u"A", {}, 600);
    const auto b = table(u"B", {}, 3000);
    const auto c = table(u"C", {}, 6000);
    bind();
    a->selected = 0;
    b->selected = 7;
    c->selected = 1;

    EXPECT_TRUE(Back::ShowSelectedTable(control()));
    EXPECT_EQ(a->selected, 0);
    EXPECT_EQ(b->selected, 1);
    EXPECT_EQ(c->selected, 0);
}

TEST_F(ShowingTheSelectedTable, MakesTheFirstTableCurrentWhenNoneIsSelected) {
    const auto a = table(u"A", {}, 600);
    table(u"B", {}, 3000);
    bind();
    a->selected = 0;

    EXPECT_TRUE(Back::ShowSelectedTable(control()));
    EXPECT_EQ(a->selected, 1);
}

TEST_F(ShowingTheSelectedTable, LooksForTheTableByItsDisplayName) {
    table(u"A", {}, 600);
    bind();
    control().DebugSwitch(1);
    Back::ShowSelectedTable(control());
    control().DebugSwitch(0);

    const auto boxes = told();
    ASSERT_GE(boxes.size(), 2U);
    EXPECT_EQ(boxes[0], trace("SetCurrentTable"));
    EXPECT_EQ(boxes[1], trace("Looking for Table: A"));
}

TEST_F(ShowingTheSelectedTable, IsTrueAndDoesNothingForAModelWithoutTables) {
    bind();
    control().DebugSwitch(1);
    EXPECT_TRUE(Back::ShowSelectedTable(control()));
    control().DebugSwitch(0);
    EXPECT_EQ(told(), Texts{});
}

TEST_F(ShowingTheSelectedTable, IsFalseAfterAFailureWhichItReports) {
    table(u"A", {}, 600);
    bind();
    model->fail("ZDTable.Selected", broken());

    EXPECT_FALSE(Back::ShowSelectedTable(control()));
    EXPECT_EQ(told(), Texts{brokenIn("ShowSelectedTable")});
}

} // namespace
