#include "CanvasTest.h"

namespace {

/// Two tables, whose lists begin with the entry for all columns.
class DroppingOnTables : public CanvasTest {
protected:
    DroppingOnTables() {
        first = table(u"A", {u"*", u"ID", u"NAME", u"CITY"}, 600);
        second = table(u"B", {u"*", u"ID", u"NAME"}, 6000);
        bind();
    }

    /// Records a drag of entries of a table without moving a mouse.
    void drag(std::int16_t index, const std::vector<std::int32_t>& entries) {
        stage->selectEntries(index, entries);
        Back::mDragTableIndex(control()) = index;
        Back::GetDragColumns(control(), index);
    }
    void over(std::int16_t index, TalvikTabulet::Point at) {
        for (const std::int16_t state : {0, 2, 1})
            Back::lstTable_DragOver(control(), index, nullptr, at.X, at.Y, state);
    }
    void drop(std::int16_t index, TalvikTabulet::Point at) {
        Back::lstTable_DragDrop(control(), index, nullptr, at.X, at.Y);
    }
    bool hasRecords() { return !Back::mDragColumns(control()).empty(); }

    Ref<fake::Table> first, second;
};

using DraggingOverTables = DroppingOnTables;

TEST_F(DraggingOverTables, SelectsTheEntryUnderTheMouseAlone) {
    stage->selectEntries(2, {1, 2});
    drag(1, {2});
    over(2, entryPoint(2, 3));
    EXPECT_EQ(selectedIn(2), std::vector<String>{u"NAME"});
    EXPECT_EQ(selectedIn(1), std::vector<String>{u"ID"});
}

TEST_F(DraggingOverTables, SelectsForEveryState) {
    drag(1, {2});
    for (const std::int16_t state : {0, 1, 2}) {
        stage->selectEntries(2, {2});
        const auto at = entryPoint(2, 3);
        Back::lstTable_DragOver(control(), std::int16_t{2}, nullptr, at.X, at.Y, state);
        EXPECT_EQ(selectedIn(2), std::vector<String>{u"NAME"}) << state;
    }
}

TEST_F(DraggingOverTables, TellsTwoEntriesOfOneNameApart) {
    second->addColumn(u"NAME", u"other");
    bind();
    drag(1, {2});
    over(2, entryPoint(2, 4));
    EXPECT_FALSE(element(2)->ColumnItems().Item(3)->Selected());
    EXPECT_TRUE(element(2)->ColumnItems().Item(4)->Selected());
}

TEST_F(DraggingOverTables, ChangesNothingOverTheTableThatTheDragStartedAt) {
    drag(1, {2, 3});
    over(1, entryPoint(1, 4));
    EXPECT_EQ(selectedIn(1), (std::vector<String>{u"ID", u"NAME"}));
}

TEST_F(DraggingOverTables, ChangesNothingOverAnEmptyPlace) {
    stage->selectEntries(2, {2, 3});
    drag(1, {2});
    over(2, emptyPoint(2));
    EXPECT_EQ(selectedIn(2), (std::vector<String>{u"ID", u"NAME"}));
}

TEST_F(DraggingOverTables, ChangesNothingOverTheEntryForAllColumns) {
    stage->selectEntries(2, {2, 3});
    drag(1, {2});
    over(2, entryPoint(2, 1));
    EXPECT_EQ(selectedIn(2), (std::vector<String>{u"ID", u"NAME"}));
}

TEST_F(DraggingOverTables, ReportsASlotWithoutATable) {
    over(7, {});
    EXPECT_EQ(told(), Texts(3, noElement("lstTable_DragOver", 7)));
}

TEST_F(DroppingOnTables, MakesAJoinInTheModelAndTellsTheHostOfItAndOfTheActivity) {
    stage->selectEntries(1, {2});
    stage->dragToEntry(1, 2, 2, 3);

    ASSERT_EQ(model->joinCount(), 1);
    const auto& join = model->joinAt(1);
    EXPECT_EQ(join.leftTable.get(), first.get());
    EXPECT_EQ(join.leftColumn.get(), &first->column(u"ID"));
    EXPECT_EQ(join.rightTable.get(), second.get());
    EXPECT_EQ(join.rightColumn.get(), &second->column(u"NAME"));
    EXPECT_EQ(events(), (Texts{"JoinCreated", "Activate"}));
    EXPECT_EQ(stage->raised.front().arguments.Join.get(), &join);
    EXPECT_TRUE(stage->look("linJoin(1)").visible);
    EXPECT_FALSE(hasRecords());
    EXPECT_EQ(told(), Texts{});
}

TEST_F(DroppingOnTables, TellsOfTheJoinAsTheModelStoredIt) {
    model->storesCopies = true;
    drag(1, {2});
    drop(2, entryPoint(2, 2));
    ASSERT_EQ(model->joinCount(), 1);
    ASSERT_EQ(events(), (Texts{"JoinCreated", "Activate"}));
    EXPECT_EQ(stage->raised.front().arguments.Join.get(), &model->joinAt(1));
}

TEST_F(DroppingOnTables, MakesOneJoinFromTheFirstOfSeveralColumns) {
    stage->selectEntries(1, {2, 3, 4});
    stage->dragToEntry(1, 3, 2, 2);
    ASSERT_EQ(model->joinCount(), 1);
    EXPECT_EQ(model->joinAt(1).leftColumn.get(), &first->column(u"ID"));
    EXPECT_EQ(events(), (Texts{"JoinCreated", "Activate"}));
    EXPECT_FALSE(hasRecords());
}

TEST_F(DroppingOnTables, MakesNoJoinOnTheTableThatTheDragStartedAtButTellsOfTheActivity) {
    stage->selectEntries(1, {2});
    stage->dragToEntry(1, 2, 1, 3);
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_FALSE(hasRecords());
    EXPECT_EQ(events(), Texts{"Activate"});
}

TEST_F(DroppingOnTables, DropsTheRecordsAtAnEmptyPlaceAndTellsTheHostNothing) {
    drag(1, {2});
    drop(2, emptyPoint(2));
    EXPECT_FALSE(hasRecords());
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_EQ(events(), Texts{});
}

TEST_F(DroppingOnTables, DropsTheRecordsOnTheEntryForAllColumnsAndTellsTheHostNothing) {
    drag(1, {2});
    drop(2, entryPoint(2, 1));
    EXPECT_FALSE(hasRecords());
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_EQ(events(), Texts{});
}

TEST_F(DroppingOnTables, DropsADragThatStartedAtTheEntryForAllColumnsAndTellsTheHostNothing) {
    drag(1, {1});
    drop(2, entryPoint(2, 2));
    EXPECT_FALSE(hasRecords());
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_EQ(events(), Texts{});
}

TEST_F(DroppingOnTables, DropsADragWhoseFirstColumnStandsForAllThoughOthersFollow) {
    drag(1, {1, 2});
    drop(2, entryPoint(2, 2));
    EXPECT_FALSE(hasRecords());
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_EQ(events(), Texts{});
}

TEST_F(DroppingOnTables, DoesNothingWithoutRecords) {
    drop(2, entryPoint(2, 2));
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_EQ(events(), Texts{});
    EXPECT_EQ(told(), Texts{});
}

TEST_F(DroppingOnTables, TellsOfTheActivityAloneWhenEveryJoinLineIsTaken) {
    std::int32_t slot = 0;
    while (Back::mJoinFreeList(control())->GetNextFreeIndex(slot)) {
    }
    drag(1, {2});
    drop(2, entryPoint(2, 2));
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_FALSE(hasRecords());
    EXPECT_EQ(events(), Texts{"Activate"});
}

TEST_F(DroppingOnTables, LeavesTheLineDrawnWithoutAModelJoinWhenTheTargetColumnIsMissing) {
    drag(1, {2});
    second->columns.items.Remove(u"kNAME");
    drop(2, entryPoint(2, 3));
    EXPECT_EQ(told(), Texts{noKey("lstTable_DragDrop")});
    EXPECT_TRUE(stage->look("linJoin(1)").visible);
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_TRUE(hasRecords());
    EXPECT_EQ(events(), Texts{});
}

TEST_F(DroppingOnTables, LeavesNoLineOfAJoinThatTheModelRefuses) {
    for (const char* refused : {"Library.NewZDJoin", "ZDJoin.RightTable=", "Zandor.AddJoin"}) {
        SCOPED_TRACE(refused);
        drag(1, {2});
        model->fail(refused, broken());
        drop(2, entryPoint(2, 3));
        EXPECT_EQ(told(), Texts{brokenIn("AddNewJoin")});
        EXPECT_FALSE(stage->exists("linJoin(1)"));
        EXPECT_FALSE(stage->exists("shpJoin(1)"));
        EXPECT_FALSE(stage->exists("shpJoin(2)"));
        EXPECT_FALSE(hasRecords());
        EXPECT_EQ(events(), Texts{"Activate"}) << "as after a drop that makes no join";
        forget();
    }
    drag(1, {2});
    drop(2, entryPoint(2, 3));
    EXPECT_TRUE(stage->look("linJoin(1)").visible) << "the next one has its number again";
    EXPECT_EQ(model->joinCount(), 1);
}

TEST_F(DroppingOnTables, KeepsTheLineOfAJoinThatTheModelHasTakenButCannotName) {
    drag(1, {2});
    model->fail("ZDJoin.Key", broken());
    drop(2, entryPoint(2, 3));
    EXPECT_EQ(told(), Texts{brokenIn("AddNewJoin")});
    EXPECT_TRUE(stage->look("linJoin(1)").visible);
    EXPECT_EQ(model->joinCount(), 1);
}

TEST_F(DroppingOnTables, JoinsNothingOnceTheTableDraggedFromHasGone) {
    drag(1, {2});
    Back::RemoveTable(control(), std::int16_t{1});
    forget();
    drop(2, entryPoint(2, 3));
    EXPECT_EQ(told(), Texts{});
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_EQ(events(), Texts{"Activate"});
}

TEST_F(DroppingOnTables, ReportsASlotWithoutATable) {
    drop(7, {});
    EXPECT_EQ(told(), Texts{noElement("lstTable_DragDrop", 7)});
}

} // namespace
