#include "CanvasTest.h"

namespace {

using TalvikDBxZandor::clsDragColumn;

/// Two tables; drags start at the first.
class DraggingColumns : public CanvasTest {
protected:
    DraggingColumns() {
        first = table(u"A", {u"ID", u"NAME", u"CITY"}, 600);
        second = table(u"B", {u"ID", u"NAME"}, 3000);
        bind();
    }

    auto& records() { return Back::mDragColumns(control()); }
    bool collect(int index) {
        return Back::GetDragColumns(control(), static_cast<std::int16_t>(index));
    }
    std::vector<String> recorded() {
        std::vector<String> texts;
        for (const auto& record : records())
            texts.push_back(record->Table()->Text() + u"." + record->Column()->Text());
        return texts;
    }

    Ref<fake::Table> first, second;
};

TEST_F(DraggingColumns, RecordsEachSelectedColumnInTheOrderOfTheList) {
    stage->selectEntries(1, {3, 1});
    EXPECT_TRUE(collect(1));
    EXPECT_EQ(recorded(), (std::vector<String>{u"A.ID", u"A.CITY"}));
}

TEST_F(DraggingColumns, FillsARecordWithTheTableTheEntryAndTheirModelObjects) {
    stage->selectEntries(2, {2});
    collect(2);
    ASSERT_EQ(records().size(), 1U);
    const auto& record = records().front();
    EXPECT_EQ(record->TableIndex(), 2);
    EXPECT_EQ(record->Table(), element(2));
    EXPECT_EQ(record->Column(), element(2)->ColumnItems().Item(2));
    EXPECT_EQ(record->ZDTable().get(), second.get());
    EXPECT_EQ(record->ZDColumn().get(), &second->column(u"NAME"));
}

TEST_F(DraggingColumns, ReplacesTheRecordsBefore) {
    stage->selectEntries(1, {1, 2});
    collect(1);
    stage->selectEntries(2, {1});
    collect(2);
    EXPECT_EQ(recorded(), std::vector<String>{u"B.ID"});
}

TEST_F(DraggingColumns, IsTrueWithoutRecordsWhenNothingIsSelected) {
    stage->selectEntries(1, {1});
    collect(1);
    stage->selectEntries(1, {});
    EXPECT_TRUE(collect(1));
    EXPECT_TRUE(records().empty());
}

TEST_F(DraggingColumns, KeepsTheRecordsBeforeWhenAModelColumnIsMissing) {
    stage->selectEntries(2, {1});
    collect(2);
    stage->selectEntries(1, {1, 2});
    first->columns.items.Remove(u"kNAME");

    EXPECT_FALSE(collect(1));
    EXPECT_EQ(told(), Texts{noKey("GetDragColumns")});
    EXPECT_EQ(recorded(), std::vector<String>{u"B.ID"});
}

TEST_F(DraggingColumns, KeepsTheRecordsBeforeWhenTheModelTableIsMissing) {
    stage->selectEntries(2, {1});
    collect(2);
    stage->selectEntries(1, {1});
    model->tables.items.Remove(u"tA");

    EXPECT_FALSE(collect(1));
    EXPECT_EQ(told(), Texts{noKey("GetDragColumns")});
    EXPECT_EQ(recorded(), std::vector<String>{u"B.ID"});
}

TEST_F(DraggingColumns, ReportsASlotWithoutATable) {
    EXPECT_FALSE(collect(8));
    EXPECT_EQ(told(), Texts{noElement("GetDragColumns", 8)});
}

TEST_F(DraggingColumns, StartsWithTheFirstMoveOfTheLeftButton) {
    stage->selectEntries(2, {1, 2});
    stage->pressEntry(2, 1, 1);
    ASSERT_TRUE(records().empty());
    stage->moveOverEntry(2, 1, 1);
    EXPECT_EQ(Back::mDragTableIndex(control()), 2);
    EXPECT_EQ(recorded(), (std::vector<String>{u"B.ID", u"B.NAME"}));
}

TEST_F(DraggingColumns, StartsNoDragWithAnyOtherButtonsHeld) {
    stage->selectEntries(1, {1});
    for (const std::int16_t buttons : {0, 2, 3, 4, 5})
        Back::lstTable_ColumnMouseMove(control(), std::int16_t{1}, Ref<ColumnItem>(), buttons,
                                       std::int16_t{0});
    EXPECT_TRUE(records().empty());
    EXPECT_EQ(Back::mDragTableIndex(control()), 0);
}

TEST_F(DraggingColumns, ReportsAMoveOverASlotWithoutATable) {
    Back::lstTable_ColumnMouseMove(control(), std::int16_t{8}, Ref<ColumnItem>(), std::int16_t{1},
                                   std::int16_t{0});
    EXPECT_EQ(told(),
              (Texts{noElement("GetDragColumns", 8), noElement("lstTable_ColumnMouseMove", 8)}));
    EXPECT_EQ(Back::mDragTableIndex(control()), 8);
}

TEST_F(DraggingColumns, HoldsItsObjectsWhateverBecomesOfTheTable) {
    stage->selectEntries(1, {1});
    collect(1);
    const std::weak_ptr<Tabulet> held = element(1);
    Back::RemoveTable(control(), std::int16_t{1});
    forget();

    EXPECT_FALSE(stage->exists("lstTable(1)")) << "it leaves the canvas all the same";
    const auto& record = records().front();
    EXPECT_EQ(recorded(), std::vector<String>{u"A.ID"});
    EXPECT_EQ(record->Table()->Tag(), u"tA");
    EXPECT_EQ(record->Column()->Key(), u"kID");
    EXPECT_EQ(record->ZDTable().get(), first.get());
    EXPECT_EQ(record->ZDColumn().get(), &first->column(u"ID"));
    EXPECT_EQ(told(), Texts{});

    collect(2);
    EXPECT_TRUE(held.expired()) << "and is let go with its record";
}

using ADragRecord = DraggingColumns;

TEST_F(ADragRecord, StartsWithoutAnything) {
    const clsDragColumn record(stage->toolkit());
    EXPECT_EQ(record.TableIndex(), 0);
    EXPECT_FALSE(record.Table());
    EXPECT_FALSE(record.Column());
    EXPECT_FALSE(record.ZDTable());
    EXPECT_FALSE(record.ZDColumn());
    EXPECT_EQ(told(), Texts{});
}

TEST_F(ADragRecord, TakesAnythingWithoutACheckNothingIncluded) {
    clsDragColumn record(stage->toolkit());
    record.TableIndex(-32768);
    record.Table(element(1));
    record.Column(element(2)->ColumnItems().Item(1));
    record.ZDTable(std::shared_ptr<TalvikZandorLib::ZDTable>(second));
    record.ZDColumn(std::shared_ptr<TalvikZandorLib::ZDColumn>(first->columnRef(u"CITY")));
    EXPECT_EQ(record.TableIndex(), -32768);
    EXPECT_EQ(record.Table(), element(1));
    EXPECT_EQ(record.Column(), element(2)->ColumnItems().Item(1));
    EXPECT_EQ(record.ZDTable().get(), second.get());
    EXPECT_EQ(record.ZDColumn().get(), &first->column(u"CITY"));

    record.Table({});
    record.Column({});
    record.ZDTable({});
    record.ZDColumn({});
    EXPECT_FALSE(record.Table());
    EXPECT_FALSE(record.Column());
    EXPECT_FALSE(record.ZDTable());
    EXPECT_FALSE(record.ZDColumn());
    EXPECT_EQ(told(), Texts{});
}

TEST_F(ADragRecord, ReleasesTheModelObjectsWhenItEnds) {
    const auto owners = first.use_count();
    {
        clsDragColumn record(stage->toolkit());
        record.ZDTable(std::shared_ptr<TalvikZandorLib::ZDTable>(first));
        ASSERT_EQ(first.use_count(), owners + 1);
    }
    EXPECT_EQ(first.use_count(), owners);
}

} // namespace
