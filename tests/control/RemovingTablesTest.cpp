#include "CanvasTest.h"

namespace {

class RemovingTables : public CanvasTest {
protected:
    /// Writes field texts into the grid, from its first column on.
    void fields(std::initializer_list<const char16_t*> texts) {
        std::int32_t column = 1;
        for (const char16_t* text : texts)
            Back::sprColumn(control())->TextMatrix(0, column++, text);
    }
    std::int32_t lastColumn() { return Back::sprColumn(control())->Cols() - 1; }
    bool remove(int index) {
        return Back::RemoveTable(control(), static_cast<std::int16_t>(index));
    }
};

TEST_F(RemovingTables, UnloadsTheElementAndFreesItsSlot) {
    table(u"A", {u"ID"}, 600);
    table(u"B", {u"ID"}, 3000);
    bind();

    EXPECT_TRUE(remove(1));
    EXPECT_FALSE(stage->exists("lstTable(1)"));
    EXPECT_TRUE(stage->exists("lstTable(2)"));
    EXPECT_TRUE(slotIsFree(1));
    EXPECT_EQ(Back::mTableFreeList(control())->FreeCount(), 15);
    EXPECT_EQ(told(), Texts{});
}

TEST_F(RemovingTables, KeepsTheNameForTheHostAndTellsItNothing) {
    table(u"ORDERS", {}, 600);
    bind();
    ASSERT_EQ(control().DeletedTable, u"  ");

    remove(1);
    EXPECT_EQ(control().DeletedTable, u"ORDERS");
    EXPECT_EQ(events(), Texts{});
    EXPECT_EQ(model->tableCount(), 1) << "the model is the caller's affair";
}

TEST_F(RemovingTables, TakesTheOutputColumnsOfTablesWhoseNamesBeginWithItsNameButNotTheirJoins) {
    const auto order = table(u"ORDER", {u"ID"}, 600);
    const auto orders = table(u"ORDERS", {u"ID"}, 3000);
    const auto items = table(u"ITEMS", {u"ID"}, 6000);
    model->join(order, u"ID", items, u"ID");
    model->join(orders, u"ID", items, u"ID");
    bind();
    fields({u"ITEMS.ID", u"ORDER.ID", u"ORDERS.ID", u"REORDER.ID", u"ORDERS.NAME", u"order.ID"});

    EXPECT_TRUE(remove(1));
    EXPECT_EQ(stage->cell(0, 1), u"ITEMS.ID");
    EXPECT_EQ(stage->cell(0, 2), u"REORDER.ID");
    EXPECT_EQ(stage->cell(0, 3), u"order.ID");
    EXPECT_EQ(stage->cell(0, 4), u"");
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_TRUE(stage->exists("linJoin(2)"));
}

TEST_F(RemovingTables, TakesTheJoinsOnEitherSide) {
    const auto a = table(u"A", {u"ID"}, 600);
    const auto b = table(u"B", {u"ID"}, 3000);
    const auto c = table(u"C", {u"ID"}, 6000);
    model->join(a, u"ID", b, u"ID");
    model->join(b, u"ID", c, u"ID");
    model->join(a, u"ID", c, u"ID");
    bind();

    EXPECT_TRUE(remove(2));
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_FALSE(stage->exists("linJoin(2)"));
    EXPECT_TRUE(stage->exists("linJoin(3)"));
    EXPECT_EQ(Back::mJoinLines(control()).Count(), 1);
    EXPECT_EQ(Back::mJoinFreeList(control())->FreeCount(), 63);
    EXPECT_EQ(told(), Texts{});
}

TEST_F(RemovingTables, EndsAtAMatchInTheLastGridColumnWhichStays) {
    table(u"A", {}, 600);
    bind();
    Back::sprColumn(control())->TextMatrix(0, lastColumn(), u"A.ID");

    EXPECT_TRUE(remove(1));
    EXPECT_EQ(stage->cell(0, lastColumn()), u"A.ID");
    EXPECT_TRUE(slotIsFree(1));
    EXPECT_EQ(told(), Texts{});
}

TEST_F(RemovingTables, TakesTheLastGridColumnOnceARemovalHasMovedIt) {
    table(u"A", {}, 600);
    bind();
    fields({u"A.ID", u"B.ID"});
    Back::sprColumn(control())->TextMatrix(0, lastColumn(), u"A.NAME");

    EXPECT_TRUE(remove(1));
    EXPECT_EQ(stage->cell(0, 1), u"B.ID");
    EXPECT_EQ(stage->cell(0, lastColumn() - 1), u"");
    EXPECT_EQ(stage->cell(0, lastColumn()), u"");
}

TEST_F(RemovingTables, EndsForATableWithoutANameAndTakesEveryOutputColumn) {
    table(u"", {}, 600);
    bind();
    fields({u"A.ID", u"B.ID"});

    EXPECT_TRUE(remove(1));
    EXPECT_EQ(stage->cell(0, 1), u"");
    EXPECT_EQ(stage->cell(0, 2), u"");
    EXPECT_FALSE(stage->exists("lstTable(1)"));
    EXPECT_EQ(told(), Texts{});
}

TEST_F(RemovingTables, DisablesTheScrollingWithTheLastTable) {
    table(u"A", {}, 600);
    bind();
    ASSERT_TRUE(stage->look("vsbTable").enabled);

    remove(1);
    EXPECT_FALSE(stage->look("vsbTable").enabled);
    EXPECT_FALSE(stage->look("hsbTable").enabled);
    EXPECT_FALSE(stage->look("cmdHome").enabled);
}

TEST_F(RemovingTables, LooksForAnotherActiveTableWhenItWasTheActiveOne) {
    table(u"A", {}, 600);
    table(u"B", {}, 3000);
    bind();
    Back::mActiveTableIndex(control()) = 1;

    remove(1);
    EXPECT_EQ(Back::mActiveTableIndex(control()), 2);
}

TEST_F(RemovingTables, IsFalseForASlotWithoutATableAndChangesNothing) {
    table(u"A", {}, 600);
    bind();
    fields({u"A.ID"});

    EXPECT_FALSE(remove(5));
    EXPECT_EQ(told(), Texts{noElement("RemoveTable", 5)});
    EXPECT_EQ(control().DeletedTable, u"  ");
    EXPECT_EQ(stage->cell(0, 1), u"A.ID");
}

TEST_F(RemovingTables, IsFalseWhenTheElementCannotBeUnloadedAndLeavesTheStepsBeforeDone) {
    table(u"A", {}, 600);
    bind();
    fields({u"A.ID"});
    element(0)->Text(u"A");

    EXPECT_FALSE(remove(0));
    EXPECT_EQ(told(),
              Texts{report("RemoveTable", 362, "Can't unload controls created at design time")});
    EXPECT_EQ(control().DeletedTable, u"A");
    EXPECT_EQ(stage->cell(0, 1), u"");
    EXPECT_EQ(Back::mTableFreeList(control())->FreeCount(), 15);
}

TEST_F(RemovingTables, TerminatesWhatTheElementHolds) {
    table(u"A", {u"ID", u"NAME"}, 600);
    bind();

    Back::TerminateTable(control(), std::int16_t{1});
    EXPECT_EQ(look(1).items, std::vector<String>{});
    EXPECT_TRUE(stage->exists("lstTable(1)"));
    EXPECT_FALSE(slotIsFree(1));
}

TEST_F(RemovingTables, TerminatesNothingInASlotWithoutATable) {
    bind();
    Back::TerminateTable(control(), std::int16_t{4});
    EXPECT_EQ(told(), Texts{});
}

using TheCloseButtonOfATable = RemovingTables;

TEST_F(TheCloseButtonOfATable, DeletesItFromTheModelAndThenTellsTheHost) {
    table(u"A", {}, 600);
    table(u"B", {}, 3000);
    bind();

    stage->closeTable(1);
    ASSERT_EQ(model->tableCount(), 1);
    EXPECT_EQ(model->tableAt(1).name, u"B");
    EXPECT_FALSE(stage->exists("lstTable(1)"));
    EXPECT_EQ(events(), Texts{"TableDeleted"});
    EXPECT_EQ(control().DeletedTable, u"A");
    EXPECT_EQ(told(), Texts{});
}

TEST_F(TheCloseButtonOfATable, FindsTheModelTableByItsKeyNotByItsName) {
    model->table(u"SAME", {}, u"k1")->place(600, 600, 1500, 1500);
    model->table(u"SAME", {}, u"k2")->place(3000, 600, 1500, 1500);
    bind();

    stage->closeTable(2);
    ASSERT_EQ(model->tableCount(), 1);
    EXPECT_EQ(model->tableAt(1).key, u"k1");
    EXPECT_TRUE(stage->exists("lstTable(1)"));
}

TEST_F(TheCloseButtonOfATable, StopsBeforeAnythingIsRemovedWhenTheModelHasNoSuchTable) {
    table(u"A", {}, 600);
    bind();
    model->tables.items.Remove(u"tA");

    stage->closeTable(1);
    EXPECT_EQ(told(), Texts{noKey("lstTable_CloseClick")});
    EXPECT_TRUE(stage->exists("lstTable(1)"));
    EXPECT_EQ(events(), Texts{});
    EXPECT_EQ(control().DeletedTable, u"  ");
}

TEST_F(TheCloseButtonOfATable, StopsBeforeAnythingIsRemovedWhenTheModelRefuses) {
    table(u"A", {}, 600);
    bind();
    model->fail("Zandor.DeleteTable", broken());

    stage->closeTable(1);
    EXPECT_EQ(told(), Texts{brokenIn("lstTable_CloseClick")});
    EXPECT_EQ(model->tableCount(), 1);
    EXPECT_TRUE(stage->exists("lstTable(1)"));
    EXPECT_EQ(events(), Texts{});
}

TEST_F(TheCloseButtonOfATable, ReportsASlotWithoutATable) {
    bind();
    Back::lstTable_CloseClick(control(), std::int16_t{2});
    EXPECT_EQ(told(), Texts{noElement("lstTable_CloseClick", 2)});
    EXPECT_EQ(events(), Texts{});
}

} // namespace
