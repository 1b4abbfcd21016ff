#include "CanvasTest.h"

using namespace zandor;

namespace {

using platform::Bounds;
using ShowingTables = CanvasTest;

TEST_F(ShowingTables, GivesEachTableTheNextSlotWithItsNameAndKey) {
    model->table(u"ORDERS", {}, u"k1");
    model->table(u"CUSTOMERS", {}, u"k2");
    bind();

    EXPECT_EQ(look(1).text, u"ORDERS");
    EXPECT_EQ(element(1)->Tag(), u"k1");
    EXPECT_EQ(look(2).text, u"CUSTOMERS");
    EXPECT_EQ(element(2)->Tag(), u"k2");
    EXPECT_TRUE(look(1).visible);
    EXPECT_TRUE(look(2).visible);
    EXPECT_FALSE(slotIsFree(2));
    EXPECT_TRUE(slotIsFree(3));
}

TEST_F(ShowingTables, ShowsTheFirstImageBesideMarkedColumns) {
    const auto orders = model->table(u"ORDERS", {u"ID", u"LINE", u"TOTAL"});
    orders->column(u"ID").marker = true;
    orders->column(u"LINE").marker = true;
    model->table(u"NOTES", {u"TEXT"});
    bind();

    using Names = std::vector<String>;
    EXPECT_EQ(look(1).keys, (Names{u"ID", u"LINE"}));
    EXPECT_EQ(look(2).keys, Names{});
}

TEST_F(ShowingTables, HasImagesForNumbersInItsListAlone) {
    model->table(u"ORDERS", {u"ID"});
    bind();

    const auto entry = element(1)->ColumnItems().Item(1);
    for (const int number : {1, 0, 1, 2, 1, -1}) {
        entry->Image(static_cast<std::int16_t>(number));
        EXPECT_EQ(look(1).keys.size(), number == 1 ? 1U : 0U) << number;
    }
}

TEST_F(ShowingTables, PutsATableWhereTheModelSays) {
    model->table(u"A")->place(300, 450, 1500, 1200);
    bind();

    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{300, 450, 1500, 1200}));
}

TEST_F(ShowingTables, TakesAPlaceAtTheOriginAsAPlace) {
    model->table(u"A")->place(0, 0, 1500, 1200);
    bind();

    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{0, 0, 1500, 1200}));
}

TEST_F(ShowingTables, CascadesATableAtANegativeLeftThoughItsTopIsValid) {
    model->table(u"A")->place(-1, 600, 1500, 1200);
    bind();

    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{120, 120, 1500, 1200}));
}

TEST_F(ShowingTables, CascadesATableAtANegativeTopThoughItsLeftIsValid) {
    model->table(u"A")->place(600, -1, 1500, 1200);
    bind();

    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{120, 120, 1500, 1200}));
}

TEST_F(ShowingTables, GivesTheDefaultSizeWhenOnlyTheWidthIsMissing) {
    model->table(u"A")->place(300, 450, 0, 500);
    bind();

    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{300, 450, 2000, 2000}));
}

TEST_F(ShowingTables, GivesTheDefaultSizeWhenOnlyTheHeightIsMissing) {
    model->table(u"A")->place(300, 450, 500, 0);
    bind();

    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{300, 450, 2000, 2000}));
}

TEST_F(ShowingTables, TakesTwoStepsOfTheCascadeForATableWithNeitherPlaceNorSize) {
    model->table(u"A");
    model->table(u"B");
    model->table(u"C");
    bind();

    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{120, 120, 2000, 2000}));
    EXPECT_EQ(boundsOf("lstTable(2)"), (Bounds{360, 360, 2000, 2000}));
    EXPECT_EQ(boundsOf("lstTable(3)"), (Bounds{600, 600, 2000, 2000}));
}

TEST_F(ShowingTables, TakesOneStepOfTheCascadeForATableThatOnlyLacksItsSize) {
    model->table(u"A")->place(0, 0, 0, 0);
    model->table(u"B")->place(-1, -1, 1500, 1500);
    bind();

    EXPECT_EQ(boundsOf("lstTable(2)"), (Bounds{240, 240, 1500, 1500}));
}

TEST_F(ShowingTables, StartsTheCascadeAfreshAtEachBinding) {
    model->table(u"A");
    bind();
    bind();

    EXPECT_EQ(boundsOf("lstTable(1)"), (Bounds{120, 120, 2000, 2000}));
}

TEST_F(ShowingTables, AddsAnEntryForEachColumnInOrderWithItsKey) {
    const auto shown = model->table(u"A");
    shown->addColumn(u"ID", u"c7");
    shown->addColumn(u"NAME", u"c3");
    bind();

    EXPECT_EQ(look(1).items, (std::vector<String>{u"ID", u"NAME"}));
    EXPECT_EQ(element(1)->ColumnItems().Item(1)->Key(), u"c7");
    EXPECT_EQ(element(1)->ColumnItems().Item(2)->Key(), u"c3");
}

TEST_F(ShowingTables, SelectsTheEntriesOfSelectedColumns) {
    const auto shown = table(u"A", {u"ID", u"NAME", u"CITY"}, 600);
    shown->column(u"NAME").selected = true;
    shown->column(u"CITY").selected = true;
    bind();

    EXPECT_EQ(selectedIn(1), (std::vector<String>{u"NAME", u"CITY"}));
}

TEST_F(ShowingTables, TracesEachSelectedColumnAndTheTableUnderTheNameOfTheBinding) {
    const auto shown = table(u"A", {u"ID", u"NAME"}, 600);
    shown->column(u"NAME").selected = true;
    control().DebugSwitch(1);
    bind();
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(library.newModel()));
    forget();
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model));

    auto boxes = told();
    const auto start = std::find(boxes.begin(), boxes.end(), trace("SetZandor"));
    ASSERT_GE(boxes.end() - start, 4);
    EXPECT_EQ(
        Texts(start, start + 4),
        (Texts{trace("SetZandor"), trace("Select column: NAME", "SetZandor"),
               trace("Column selected: NAME", "SetZandor"), trace("Table visible.", "SetZandor")}));
    control().DebugSwitch(0);
}

TEST_F(ShowingTables, MakesTheSelectedTableCurrent) {
    const auto first = table(u"A", {}, 600);
    const auto second = table(u"B", {}, 3000);
    second->selected = 5;
    bind();

    EXPECT_EQ(first->selected, 0);
    EXPECT_EQ(second->selected, 1);
}

TEST_F(ShowingTables, MakesTheLastOfSeveralSelectedTablesCurrent) {
    const auto first = table(u"A", {}, 600);
    const auto second = table(u"B", {}, 3000);
    first->selected = 1;
    second->selected = -1;
    bind();

    EXPECT_EQ(first->selected, 0);
    EXPECT_EQ(second->selected, 1);
}

TEST_F(ShowingTables, MakesTheFirstTableCurrentWhenNoneIsSelected) {
    const auto first = table(u"A", {}, 600);
    const auto second = table(u"B", {}, 3000);
    bind();

    EXPECT_EQ(first->selected, 1);
    EXPECT_EQ(second->selected, 0);
}

TEST_F(ShowingTables, ShowsTheFirstSixteenTablesAndSkipsTheOthersWithoutAMessage) {
    for (int i = 1; i <= 18; ++i)
        model->table(u"T" + platform::decimal(i))->place(15.0F * float(i), 0, 1500, 1500);
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model));

    EXPECT_EQ(look(16).text, u"T16");
    EXPECT_FALSE(stage->exists("lstTable(17)"));
    EXPECT_EQ(Back::mTableFreeList(control())->FreeCount(), 0);
    EXPECT_EQ(told(), Texts{});
}

TEST_F(ShowingTables, LeavesAHalfShownTableWhereItGotStuck) {
    table(u"A", {u"ID", u"NAME"}, 600);
    table(u"B", {}, 3000);
    model->fail("ZDColumn.Marker", broken(), 2);
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model));

    EXPECT_EQ(told(), Texts{brokenIn("SetZandor")});
    EXPECT_EQ(look(1).text, u"A");
    EXPECT_EQ(look(1).items, (std::vector<String>{u"ID", u"NAME"}));
    EXPECT_FALSE(look(1).visible);
    EXPECT_FALSE(slotIsFree(1));
    EXPECT_FALSE(stage->exists("lstTable(2)"));
    EXPECT_TRUE(stage->look("hsbTable").enabled) << "the arranging after the binding still runs";
}

TEST_F(ShowingTables, GivesTheSlotOfARemovedTableToTheNextOne) {
    for (const char16_t* name : {u"A", u"B", u"C", u"D"}) model->table(name);
    bind();
    ASSERT_TRUE(Back::RemoveTable(control(), std::int16_t{3}));
    ASSERT_FALSE(stage->exists("lstTable(3)"));

    const auto more = library.newModel();
    more->table(u"E")->place(600, 600, 1500, 1500);
    Back::mModel(control()) = std::shared_ptr<TalvikZandorLib::Zandor>(more);
    Back::SetZandor(control());

    EXPECT_EQ(look(3).text, u"E");
    EXPECT_FALSE(stage->exists("lstTable(5)"));
}

} // namespace
