#include "GridStage.h"

using namespace zandor;

namespace gridstage {

class AColumnCommand : public GridTest {
protected:
    AColumnCommand() {
        for (const char16_t* column : {u"ID", u"NAME"}) model->definition(customers, column);
        model->definition(orders, u"TOTAL");
        bind();
    }

    std::size_t copied() { return Backstage::mDragColumns(control()).size(); }
};

TEST_F(AColumnCommand, CopiesTheSelectedColumnsOfTheTableUnderTheMenu) {
    stage->selectEntries(2, {id, name});
    menuOverEntry(2, id, "mnuTableDefinitionCopy");
    ASSERT_EQ(copied(), 2U);
    const auto& records = Backstage::mDragColumns(control());
    EXPECT_EQ(records[0]->TableIndex(), 2);
    EXPECT_EQ(records[0]->ZDColumn().get(), customers->columnRef(u"ID").get());
    EXPECT_EQ(records[1]->ZDColumn().get(), customers->columnRef(u"NAME").get());
    EXPECT_EQ(events(), Names{"Activate"});
}

TEST_F(AColumnCommand, PastesTheCopiedColumnsAtTheMenusColumn) {
    copy(1, {id, total});
    menuOverCell(criteriaRow, 2, "mnuColumnDefinitionPaste");
    EXPECT_EQ(fields(6), (Texts{u"ID", u"ORDERS.ID", u"ORDERS.TOTAL", u"NAME", u"TOTAL", u""}));
    // The one Activate is the menu's: pasting raises none.
    EXPECT_EQ(events(), (Names{"Activate", "ColumnCreated", "ColumnCreated"}));
    EXPECT_EQ(stage->raised[1].arguments.Definition.get(), &model->definitionAt(4));
    EXPECT_EQ(stage->raised[2].arguments.Definition.get(), &model->definitionAt(5));
}

TEST_F(AColumnCommand, PastesAtTheFirstColumnOnTheLabels) {
    copy(1, {id});
    menuOverCell(criteriaRow, 0, "mnuColumnDefinitionPaste");
    EXPECT_EQ(fields(2), (Texts{u"ORDERS.ID", u"ID"}));
}

TEST_F(AColumnCommand, PastesTheSameCopyAgainAndAgain) {
    copy(1, {id, total});
    menuOverCell(synonymRow, 1, "mnuColumnDefinitionPaste");
    menuOverCell(synonymRow, 1, "mnuColumnDefinitionPaste");
    EXPECT_EQ(fields(5),
              (Texts{u"ORDERS.ID", u"ORDERS.TOTAL", u"ORDERS.ID", u"ORDERS.TOTAL", u"ID"}));
    EXPECT_EQ(model->definitionCount(), 7);
    EXPECT_EQ(copied(), 2U);
}

TEST_F(AColumnCommand, PastesNothingWithoutACopy) {
    Backstage::mnuColumnDefinitionPaste_Click(control());
    EXPECT_EQ(fields(4), (Texts{u"ID", u"NAME", u"TOTAL", u""}));
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AColumnCommand, ReportsAPasteWhoseDefinitionCannotBeFound) {
    copy(1, {id, total});
    model->fail("ColumnDefinitions.Item(key)", refusal());
    menuOverCell(synonymRow, 1, "mnuColumnDefinitionPaste");
    EXPECT_EQ(stage->boxes, Boxes{report(u"mnuColumnDefinitionPaste_Click", refusal())});
    EXPECT_EQ(fields(2), (Texts{u"ORDERS.ID", u"ID"}));
    EXPECT_EQ(model->definitionCount(), 4);
    EXPECT_EQ(events(), Names{"Activate"});
}

TEST_F(AColumnCommand, PastesWhatWasCopiedFromATableThatHasGone) {
    copy(1, {id, total});
    stage->closeTable(1);
    forget();
    menuOverCell(synonymRow, 2, "mnuColumnDefinitionPaste");
    EXPECT_EQ(stage->boxes, Boxes{});
    EXPECT_EQ(fields(4), (Texts{u"ID", u"ORDERS.ID", u"ORDERS.TOTAL", u"NAME"}));
    EXPECT_EQ(model->definitionCount(), 5);
    EXPECT_EQ(copied(), 2U);
}

TEST_F(AColumnCommand, DeletesTheColumnUnderTheMenuAndItsDefinition) {
    const auto removed = model->definitions.items.Item(2);
    menuOverCell(criteriaRow, 2, "mnuColumnDefinitionDelete");
    EXPECT_EQ(fields(3), (Texts{u"ID", u"TOTAL", u""}));
    EXPECT_EQ(model->definitionCount(), 2);
    EXPECT_FALSE(model->definitions.items.Contains(u"x2"));
    EXPECT_EQ(events(), (Names{"Activate", "ColumnRemoved"}));
    EXPECT_EQ(stage->raised[1].arguments.Definition.get(), removed.get());
}

TEST_F(AColumnCommand, ClearsEveryCellOfADeletedColumn) {
    const std::int32_t last = grid().Cols() - 1;
    for (std::int32_t row = 0; row < grid().Rows(); ++row) grid().TextMatrix(row, 2, u"full");
    menuOverCell(criteriaRow, 2, "mnuColumnDefinitionDelete");
    for (std::int32_t row = 0; row < grid().Rows(); ++row)
        EXPECT_EQ(grid().TextMatrix(row, last), u"") << row;
    EXPECT_EQ(grid().ColWidth(last), grid().ColWidth(0));
    EXPECT_EQ(grid().ColData(last), 0) << "and names no definition";
}

TEST_F(AColumnCommand, MovesTheColumnsBehindADeletedOneWithTheirTies) {
    menuOverCell(criteriaRow, 1, "mnuColumnDefinitionDelete");
    EXPECT_EQ(grid().ColData(1), 2);
    EXPECT_EQ(grid().ColData(2), 3);
}

TEST_F(AColumnCommand, DeletesNothingOverTheLabelColumn) {
    menuOverCell(criteriaRow, 0);
    forget();
    Backstage::mnuColumnDefinitionDelete_Click(control());
    EXPECT_EQ(fields(3), (Texts{u"ID", u"NAME", u"TOTAL"}));
    EXPECT_EQ(model->definitionCount(), 3);
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AColumnCommand, LeavesTheLastColumnInTheGridButRemovesItsDefinition) {
    const std::int32_t last = grid().Cols() - 1;
    stage->scrollGrid(1, last);
    drag(1, {id}, last);
    forget();
    menuOverCell(criteriaRow, last, "mnuColumnDefinitionDelete");
    EXPECT_EQ(stage->cell(fieldRow, last), u"ORDERS.ID");
    EXPECT_EQ(stage->cell(visibleRow, last), u"Visible");
    EXPECT_EQ(model->definitionCount(), 3);
    EXPECT_EQ(events(), (Names{"Activate", "ColumnRemoved"}));
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AColumnCommand, ReportsADeletionWithoutDefinitionAndLeavesTheColumn) {
    grid().ColData(2, 44);
    menuOverCell(criteriaRow, 2, "mnuColumnDefinitionDelete");
    EXPECT_EQ(stage->boxes, Boxes{report(u"mnuColumnDefinitionDelete_Click",
                                         platform::errors::invalidProcedureCall())});
    EXPECT_EQ(fields(3), (Texts{u"ID", u"NAME", u"TOTAL"}));
    EXPECT_EQ(model->definitionCount(), 3);
    EXPECT_EQ(events(), Names{"Activate"});
}

TEST_F(AColumnCommand, ReportsAModelThatRefusesADeletionAfterTheColumnHasGone) {
    model->fail("ColumnDefinitions.Remove", refusal());
    menuOverCell(criteriaRow, 2, "mnuColumnDefinitionDelete");
    EXPECT_EQ(stage->boxes, Boxes{report(u"mnuColumnDefinitionDelete_Click", refusal())});
    EXPECT_EQ(fields(3), (Texts{u"ID", u"TOTAL", u""}));
    EXPECT_EQ(model->definitionCount(), 3);
    EXPECT_EQ(events(), Names{"Activate"});
}

TEST_F(AColumnCommand, DeletesTheTableUnderTheMenuAsItsCloseButtonDoes) {
    menuOverEntry(2, id, "mnuTableDefinitionDelete");
    EXPECT_FALSE(stage->exists("lstTable(2)"));
    EXPECT_EQ(model->tableCount(), 1);
    EXPECT_EQ(control().DeletedTable, u"CUSTOMERS");
    EXPECT_EQ(events(), (Names{"Activate", "TableDeleted"}));
}

TEST_F(AColumnCommand, JoinsTheFirstCopiedColumnToTheColumnUnderTheMenu) {
    copy(1, {customer, total});
    stage->selectEntries(2, {id});
    menuOverEntry(2, id, "mnuTableDefinitionPaste");
    ASSERT_EQ(model->joinCount(), 1);
    const auto& join = model->joinAt(1);
    EXPECT_EQ(join.leftTable.get(), orders.get());
    EXPECT_EQ(join.leftColumn.get(), orders->columnRef(u"CUSTOMER").get());
    EXPECT_EQ(join.rightTable.get(), customers.get());
    EXPECT_EQ(join.rightColumn.get(), customers->columnRef(u"ID").get());
    EXPECT_TRUE(stage->exists("linJoin(1)"));
    EXPECT_EQ(copied(), 2U);
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AColumnCommand, JoinsNoTwoColumnsOfOneTable) {
    copy(1, {customer});
    Backstage::mnuTableDefinitionPaste_Click(control());
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AColumnCommand, JoinsNothingToNorFromTheEntryForAllColumns) {
    copy(1, {allColumns});
    stage->selectEntries(2, {name});
    menuOverEntry(2, name, "mnuTableDefinitionPaste");
    copy(1, {id});
    stage->selectEntries(2, {allColumns});
    menuOverEntry(2, allColumns, "mnuTableDefinitionPaste");
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AColumnCommand, JoinsNothingWithoutACopy) {
    Backstage::mnuTableDefinitionPaste_Click(control());
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AColumnCommand, JoinsNothingToAColumnCopiedFromATableThatHasGone) {
    copy(1, {customer});
    menuOverEntry(2, id);
    stage->closeTable(1);
    forget();
    Backstage::mnuTableDefinitionPaste_Click(control());
    EXPECT_EQ(stage->boxes, Boxes{});
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_FALSE(stage->exists("linJoin(1)"));
}

TEST_F(AColumnCommand, LeavesNoLineOfAJoinThatTheModelRefuses) {
    copy(1, {customer});
    model->fail("Zandor.AddJoin", refusal());
    menuOverEntry(2, id, "mnuTableDefinitionPaste");
    EXPECT_EQ(stage->boxes, Boxes{report(u"AddNewJoin", refusal())});
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_EQ(model->joinCount(), 0);
}

} // namespace gridstage
