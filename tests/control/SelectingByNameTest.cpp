#include "control/ShellFixture.h"

#include <algorithm>

using namespace zandor;

namespace {

class SelectingByName : public AControl {
protected:
    SelectingByName() {
        orders = model->table(u"ORDERS", {u"ID", u"TOTAL"});
        orders->place(150, 150, 2400, 2400);
        items = model->table(u"ITEMS", {u"ID", u"id", u"ORDER_ID"});
        items->place(3000, 150, 2400, 2400);
        again = model->table(u"ORDERS", {u"ID", u"NOTE"}, u"tORDERS2");
        again->place(6000, 150, 2400, 2400);
    }

    void bindAndForget() {
        bind(model);
        forget();
    }
    std::vector<std::int16_t> selectedTables() const {
        return {orders->selected, items->selected, again->selected};
    }
    std::vector<String> entriesSelected(int slot) {
        return look("lstTable(" + std::to_string(slot) + ")").selected;
    }
    static std::vector<bool> columnsSelected(const fake::Table& table) {
        std::vector<bool> result;
        for (std::int32_t i = 1; i <= table.columns.items.Count(); ++i)
            result.push_back(dynamic_cast<fake::Column&>(*table.columns.items.Item(i)).selected);
        return result;
    }

    using Flags = std::vector<bool>;
    using Selections = std::vector<std::int16_t>;

    platform::Ref<fake::Model> model = library.newModel();
    platform::Ref<fake::Table> orders, items, again;
};

} // namespace

TEST_F(SelectingByName, MakesTheTableOfThatNameCurrent) {
    bindAndForget();
    zandor().SetCurrentTable(u"ITEMS");
    EXPECT_EQ(selectedTables(), (Selections{0, 1, 0}));
    EXPECT_TRUE(look("lstTable(2)").focused);
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(SelectingByName, MakesOnlyTheFirstOfTwoTablesOfOneNameCurrent) {
    bindAndForget();
    zandor().SetCurrentTable(u"ITEMS");
    zandor().SetCurrentTable(u"ORDERS");
    EXPECT_EQ(selectedTables(), (Selections{1, 0, 0}));
    EXPECT_TRUE(look("lstTable(1)").focused);
}

TEST_F(SelectingByName, ChangesNothingForANameThatNoShownTableHas) {
    bindAndForget();
    zandor().SetCurrentTable(u"ITEMS");
    forget();
    for (const char16_t* name : {u"items", u"ITEM", u"ITEMS ", u"PARTS"}) {
        zandor().SetCurrentTable(name);
        EXPECT_EQ(selectedTables(), (Selections{0, 1, 0}));
        EXPECT_TRUE(look("lstTable(2)").focused);
    }
    EXPECT_TRUE(stage->transcript.empty());
}

TEST_F(SelectingByName, TellsNothingButItsSearchForANameThatNoShownTableHas) {
    bindAndForget();
    zandor().DebugSwitch(1);
    zandor().SetCurrentTable(u"PARTS");
    EXPECT_EQ(stage->boxes,
              (std::vector{trace(u"SetCurrentTable"), trace(u"Looking for Table: PARTS")}));
}

TEST_F(SelectingByName, MakesATableCurrentThatCannotTakeTheFocus) {
    bindAndForget();
    zandor().SetCurrentTable(u"ORDERS");
    Backstage::lstTable(zandor())(2)->Visible(false);
    zandor().SetCurrentTable(u"ITEMS");
    EXPECT_FALSE(look("lstTable(2)").focused);
    EXPECT_EQ(selectedTables(), (Selections{0, 1, 0}));
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(SelectingByName, SelectsTheColumnAndNoOtherInEveryShownTableOfThatName) {
    bindAndForget();
    zandor().SelectColumnNames(u"ORDERS", u"ID");
    EXPECT_EQ(entriesSelected(1), std::vector<String>{u"ID"});
    EXPECT_EQ(entriesSelected(3), std::vector<String>{u"ID"});
    zandor().SelectColumnNames(u"ORDERS", u"NOTE");
    EXPECT_EQ(entriesSelected(1), std::vector<String>{});
    EXPECT_EQ(entriesSelected(3), std::vector<String>{u"NOTE"});
}

TEST_F(SelectingByName, WritesTheSelectionOfTheColumnsIntoEveryModelTableOfThatName) {
    bindAndForget();
    zandor().SelectColumnNames(u"ORDERS", u"TOTAL");
    EXPECT_EQ(columnsSelected(*orders), (Flags{false, true}));
    EXPECT_EQ(columnsSelected(*again), (Flags{false, false}));
    zandor().SelectColumnNames(u"ORDERS", u"ID");
    EXPECT_EQ(columnsSelected(*orders), (Flags{true, false}));
    EXPECT_EQ(columnsSelected(*again), (Flags{true, false}));
}

TEST_F(SelectingByName, LeavesTablesOfOtherNamesAlone) {
    items->column(u"ORDER_ID").selected = true;
    bindAndForget();
    zandor().SelectColumnNames(u"ORDERS", u"ID");
    EXPECT_EQ(entriesSelected(2), std::vector<String>{u"ORDER_ID"});
    EXPECT_EQ(columnsSelected(*items), (Flags{false, false, true}));
}

TEST_F(SelectingByName, TellsUpperFromLowerCase) {
    bindAndForget();
    zandor().SelectColumnNames(u"ITEMS", u"id");
    EXPECT_EQ(entriesSelected(2), std::vector<String>{u"id"});
    EXPECT_EQ(columnsSelected(*items), (Flags{false, true, false}));
    zandor().SelectColumnNames(u"items", u"ID");
    EXPECT_EQ(entriesSelected(2), std::vector<String>{u"id"});
    EXPECT_EQ(columnsSelected(*items), (Flags{false, true, false}));
}

TEST_F(SelectingByName, MayEndWithSeveralColumnsOfOneNameSelected) {
    const auto table = model->table(u"PARTS", {u"ID"});
    table->place(9000, 150, 2400, 2400);
    table->addColumn(u"ID", u"another");
    bindAndForget();
    zandor().SelectColumnNames(u"PARTS", u"ID");
    EXPECT_EQ(entriesSelected(4), (std::vector<String>{u"ID", u"ID"}));
    EXPECT_EQ(columnsSelected(*table), (Flags{true, true}));
}

TEST_F(SelectingByName, ReachesModelTablesThatAreNotShown) {
    const auto large = library.newModel();
    platform::Ref<fake::Table> last;
    for (int n = 1; n <= 17; ++n)
        last = large->table(u"T" + platform::decimal(n), {u"ID", u"NAME"});
    bind(large);
    zandor().SelectColumnNames(u"T17", u"NAME");
    EXPECT_EQ(columnsSelected(*last), (Flags{false, true}));
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(SelectingByName, ClearsTheSelectionForAColumnThatTheTableLacks) {
    bindAndForget();
    zandor().SelectColumnNames(u"ORDERS", u"ID");
    zandor().SelectColumnNames(u"ORDERS", u"none");
    EXPECT_EQ(entriesSelected(1), std::vector<String>{});
    EXPECT_EQ(columnsSelected(*orders), (Flags{false, false}));
}

TEST_F(SelectingByName, DoesNothingBeforeAModelIsBound) {
    zandor().SelectColumnNames(u"ORDERS", u"ID");
    zandor().SetCurrentTable(u"ORDERS");
    EXPECT_TRUE(stage->transcript.empty());
}
