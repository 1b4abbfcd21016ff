#include "GridStage.h"

namespace gridstage {

/// One output column, NAME; the next one is blank.
class TheFieldsOffered : public GridTest {
protected:
    TheFieldsOffered() {
        first = model->definition(customers, u"NAME");
        bind();
        stage->comforts().setFlags({.OffersFields = true});
    }

    bool open() { return stage->exists("lstFields") && shows("lstFields"); }
    bool anyOpen() {
        return open() || shows("fraSortOrder") || shows("fraVisibility") || shows("fraValue");
    }
    void standOn(std::int32_t row, std::int32_t col) {
        grid().Row(row);
        grid().Col(col);
    }

    const Texts all = {u"ORDERS.*",    u"ORDERS.ID",    u"ORDERS.CUSTOMER", u"ORDERS.TOTAL",
                       u"CUSTOMERS.*", u"CUSTOMERS.ID", u"CUSTOMERS.NAME"};
    Ref<fake::Definition> first;
};

TEST_F(TheFieldsOffered, AreThoseOfAllTables) {
    stage->clickField(2);
    ASSERT_TRUE(open());
    EXPECT_TRUE(stage->look("lstFields").focused);
    EXPECT_EQ(stage->look("lstFields").items, all);
}

TEST_F(TheFieldsOffered, MakeAColumnOfABlankOne) {
    stage->clickField(2);
    stage->pickField(u"ORDERS.TOTAL");
    EXPECT_FALSE(open());
    EXPECT_EQ(fields(3), (Texts{u"NAME", u"ORDERS.TOTAL", u""}));
    EXPECT_EQ(events(), (Names{"ColumnCreated", "Activate"}));
    EXPECT_EQ(model->definitionAt(2).column.get(), orders->columnRef(u"TOTAL").get());
    EXPECT_EQ(stage->cell(visibleRow, 2), u"Visible");
    EXPECT_EQ(grid().Row(), fieldRow);
    EXPECT_EQ(grid().Col(), 2);
    EXPECT_TRUE(stage->look("sprColumn").focused);
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(TheFieldsOffered, LeaveNoGapBehindTheLastColumn) {
    stage->clickField(5);
    stage->pickField(u"ORDERS.ID");
    EXPECT_EQ(fields(6), (Texts{u"NAME", u"ORDERS.ID", u"", u"", u"", u""}));
}

TEST_F(TheFieldsOffered, OpenByKeysToo) {
    standOn(fieldRow, 2);
    stage->editCell();
    ASSERT_TRUE(open());
    stage->pickField(u"ORDERS.ID");
    EXPECT_EQ(stage->cell(fieldRow, 2), u"ORDERS.ID");
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(TheFieldsOffered, OpenByTypingWithWhatWasTyped) {
    standOn(fieldRow, 2);
    stage->typeInGrid(u"T");
    ASSERT_TRUE(open());
    EXPECT_EQ(stage->look("lstFields").text, u"T");
    stage->pickField(u"OTAL");
    EXPECT_EQ(stage->cell(fieldRow, 2), u"ORDERS.TOTAL");
}

TEST_F(TheFieldsOffered, ReplaceThatOfAFilledColumn) {
    first->synonym = u"who";
    first->addCriterion(u"'A'", u"4");
    bind();
    stage->clickField(1);
    stage->pickField(u"CUSTOMERS.ID");
    EXPECT_EQ(fields(2), (Texts{u"CUSTOMERS.ID", u""}));
    EXPECT_EQ(first->column.get(), customers->columnRef(u"ID").get());
    EXPECT_EQ(stage->cell(synonymRow, 1), u"who");
    EXPECT_EQ(stage->cell(criteriaRow, 1), u"'A'");
    EXPECT_EQ(events(), Names{"ColumnModified"});
    EXPECT_EQ(model->definitionCount(), 1);
}

TEST_F(TheFieldsOffered, ChangeNothingWhereTheFieldIsTheSame) {
    stage->clickField(2);
    stage->pickField(u"ORDERS.ID");
    forget();
    stage->clickField(2);
    stage->pickField(u"ORDERS.ID");
    EXPECT_EQ(events(), Names{});
}

TEST_F(TheFieldsOffered, StayWhereTheHostRefusesAnother) {
    model->calls->failNext("ZDColumnDefinition.Column=", refusal());
    stage->clickField(1);
    stage->pickField(u"CUSTOMERS.ID");
    EXPECT_EQ(fields(2), (Texts{u"NAME", u""}));
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(stage->boxes, Boxes{report(u"fieldPicked", refusal(), u"comforts.Comforts")});
}

TEST_F(TheFieldsOffered, GoWhenTheFocusGoes) {
    stage->clickField(2);
    stage->focus("sprColumn");
    EXPECT_FALSE(open());
    EXPECT_EQ(events(), Names{});
}

TEST_F(TheFieldsOffered, AreNotTakenFromATableThatIsGone) {
    stage->clickField(2);
    const auto list = stage->look("lstFields").items;
    ASSERT_EQ(list, all);
    model->DeleteTable(Ref<TalvikZandorLib::ZDTable>(orders));
    Backstage::RemoveTable(control(), 1);
    forget();
    if (open()) stage->pickField(u"ORDERS.ID");
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(TheFieldsOffered, AreAllThatABlankColumnOpens) {
    for (std::int32_t row = 1; row < 6; ++row) {
        press(left, row, 2);
        stage->releaseCell(left, row, 2);
        EXPECT_FALSE(anyOpen()) << row;
        EXPECT_EQ(grid().Row(), row);
        EXPECT_EQ(grid().Col(), 2);
        stage->editCell();
        EXPECT_FALSE(anyOpen()) << row;
        stage->typeInGrid(u"x");
        EXPECT_FALSE(anyOpen()) << row;
    }
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(TheFieldsOffered, LeaveFilledCellsToTheirEditors) {
    press(left, sortRow, 1);
    EXPECT_TRUE(shows("fraSortOrder"));
    press(left, sortRow, 2);
    EXPECT_FALSE(anyOpen());
}

TEST_F(TheFieldsOffered, AreNoneWithoutTables) {
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(library.newModel()));
    forget();
    stage->clickField(3);
    EXPECT_FALSE(open());
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(TheFieldsOffered, ComeToNothingInAFullGrid) {
    const std::int32_t last = grid().Cols() - 1;
    for (std::int32_t col = 2; col <= last; ++col) grid().TextMatrix(0, col, u"taken");
    stage->clickField(2);
    EXPECT_FALSE(open()) << "a field without a definition has none to change";
}

TEST_F(TheFieldsOffered, AreUnknownToTheBareControl) {
    stage->comforts().setFlags({});
    stage->clickField(2);
    EXPECT_FALSE(open());
    press(left, criteriaRow, 2);
    EXPECT_TRUE(shows("fraValue"));
}

} // namespace gridstage
