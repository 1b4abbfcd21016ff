#include "control_on_headless/MeanwhileTest.h"

namespace gridstage {

namespace {

/// Showing a model anew whose host has left it unfinished, or changes it meanwhile.
class ShowingAnewWhatIsUnfinished : public MeanwhileTest {
protected:
    void showAnew() {
        forget();
        control().ShowAnew();
        library.calls->onPass = nullptr;
        EXPECT_EQ(stage->boxes, Boxes{});
    }

    Stage::Seen table(std::int16_t slot) {
        return stage->look("lstTable(" + std::to_string(slot) + ")");
    }
    std::int16_t current() { return Backstage::mActiveTableIndex(control()); }
};

TEST_F(ShowingAnewWhatIsUnfinished, TakesAnyNumberButZeroForASelectedTable) {
    const auto items = model->table(u"ITEMS", {u"*"});
    bind();
    Backstage::mActiveTableIndex(control()) = 1;
    model->tables.items.Remove(orders->key);
    items->selected = -1;
    showAnew();
    EXPECT_EQ(table(current()).text, u"ITEMS");
}

TEST_F(ShowingAnewWhatIsUnfinished, LeavesOutTheCriteriaThatTheGridHasNoRowFor) {
    model->definition(customers, u"NAME",
                      {u"1", u"2", u"3", u"4", u"5", u"6", u"7", u"8", u"9", u"10"});
    bind();
    showAnew();
    EXPECT_EQ(stage->cell(grid().Rows() - 1, 1), u"8");
}

TEST_F(ShowingAnewWhatIsUnfinished, DoesNotLookAtTablesBeyondTheLastSlot) {
    for (int n = 3; n <= 18; ++n) model->table(u"T" + zandor::platform::decimal(n), {u"*"});
    bind();
    model->fail("ZDTable.Height", refusal(), 17);
    showAnew();
    EXPECT_TRUE(library.calls->isArmed("ZDTable.Height"));
}

TEST_F(ShowingAnewWhatIsUnfinished, LeavesOutAJoinThatLacksAnEnd) {
    const auto without = [&](auto end) {
        const auto join = model->join(orders, u"CUSTOMER", customers, u"ID");
        bind();
        (*join).*end = nullptr;
        showAnew();
        EXPECT_FALSE(stage->exists("linJoin(1)"));
        model->joins.items = {};
    };
    without(&fake::Join::leftColumn);
    without(&fake::Join::rightColumn);
    without(&fake::Join::leftTable);
    without(&fake::Join::rightTable);
}

TEST_F(ShowingAnewWhatIsUnfinished, GivesAColumnItsNewNameAndItsNewKey) {
    bind();
    orders->column(u"TOTAL").name = u"SUM";
    showAnew();
    EXPECT_EQ(table(1).items, (Texts{u"*", u"ID", u"CUSTOMER", u"SUM"}));
    orders->column(u"SUM").key = u"another";
    showAnew();
    EXPECT_EQ(Backstage::lstTable(control())(1)->ColumnItems().Item(total)->Key(), u"another");
}

TEST_F(ShowingAnewWhatIsUnfinished, TakesTheMarkOfAKeyAway) {
    customers->column(u"ID").marker = true;
    bind();
    ASSERT_EQ(table(2).keys, Texts{u"ID"});
    customers->column(u"ID").marker = false;
    showAnew();
    EXPECT_EQ(table(2).keys, Texts{});
}

TEST_F(ShowingAnewWhatIsUnfinished, LeavesWhatWasBoundMeanwhile) {
    bind();
    const auto other = library.newModel();
    other->table(u"OTHER", {u"*", u"ID"});
    when("ZDTable.Name", [&] { control().P_SET_Zandor(other); });
    showAnew();
    EXPECT_EQ(table(1).text, u"OTHER");
    EXPECT_FALSE(stage->exists("lstTable(2)"));
}

TEST_F(ShowingAnewWhatIsUnfinished, GivesATableNoSlotThatWasDeletedMeanwhile) {
    bind();
    const auto items = model->table(u"ITEMS", {u"*"});
    when("ColumnDefinitions.Count", [&] { model->tables.items.Remove(items->key); });
    showAnew();
    EXPECT_FALSE(stage->exists("lstTable(3)"));
    EXPECT_TRUE(Backstage::mTableFreeList(control())->IsFree(3));
}

TEST_F(ShowingAnewWhatIsUnfinished, FollowsAJoinWhoseEndsAndOperatorAreOthers) {
    const auto join = model->join(orders, u"CUSTOMER", customers, u"ID");
    bind();
    join->rightColumn = customers->columnRef(u"NAME");
    join->compareOperator = 3;
    showAnew();
    const auto record = Backstage::mJoinLines(control()).Item(1);
    EXPECT_TRUE(record->IsLeftColumn(u"CUSTOMER"));
    EXPECT_TRUE(record->IsRightColumn(u"NAME"));
    EXPECT_EQ(record->CompareOperator(), 3);
    join->compareOperator = 2;
    showAnew();
    EXPECT_EQ(Backstage::mJoinLines(control()).Item(1)->CompareOperator(), 2);
}

TEST_F(ShowingAnewWhatIsUnfinished, TakesAJoinAwayWithEitherOfItsRenamedTables) {
    model->join(orders, u"CUSTOMER", customers, u"ID");
    for (const std::int16_t slot : {std::int16_t{1}, std::int16_t{2}}) {
        bind();
        orders->name += u"!";
        customers->name += u"!";
        showAnew();
        ASSERT_TRUE(stage->exists("linJoin(1)"));
        Backstage::RemoveTable(control(), slot);
        EXPECT_FALSE(stage->exists("linJoin(1)")) << slot;
        EXPECT_EQ(stage->boxes, Boxes{});
    }
}

TEST_F(ShowingAnewWhatIsUnfinished, TakesAwayWhatIsTiedToNothingOrShownTwice) {
    model->definition(orders, u"ID");
    model->definition(customers, u"NAME");
    bind();
    grid().TextMatrix(fieldRow, 3, u"ID");
    grid().ColData(3, 1);
    grid().ColData(5, 99);
    showAnew();
    EXPECT_EQ(fields(4), (Texts{u"ID", u"NAME", u"", u""}));
    for (std::int32_t column = 3; column < grid().Cols(); ++column)
        EXPECT_EQ(grid().ColData(column), 0) << column;
}

} // namespace

} // namespace gridstage
