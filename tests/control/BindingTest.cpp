#include "control/ShellFixture.h"

#include <algorithm>

using namespace zandor;

namespace {

/// Three tables that are placed side by side, with their columns.
class Binding : public AControl {
protected:
    Binding() {
        orders = model->table(u"ORDERS", {u"ID", u"CUSTOMER_ID", u"TOTAL"});
        orders->place(150, 150, 2400, 2400);
        customers = model->table(u"CUSTOMERS", {u"ID", u"NAME"});
        customers->place(3000, 150, 2400, 2400);
        items = model->table(u"ITEMS", {u"ORDER_ID"});
        items->place(6000, 150, 2400, 2400);
    }

    /// Names in the slots 1 to 16; "-" for an empty slot.
    String slots() {
        String names;
        for (std::int16_t i = 1; i <= 16; ++i) {
            const std::string element = "lstTable(" + std::to_string(i) + ")";
            if (!names.empty()) names += u" ";
            names += stage->exists(element) ? look(element).text : u"-";
        }
        while (names.ends_with(u" -")) names.resize(names.size() - 2);
        return names;
    }

    platform::Ref<fake::Model> model = library.newModel();
    platform::Ref<fake::Table> orders, customers, items;
};

const char* const menuEntries[] = {"mnuJoinShowDefinition",
                                   "mnuJoinDelete",
                                   "mnuJoinSep",
                                   "mnuTableDefinitionCopy",
                                   "mnuTableDefinitionPaste",
                                   "mnuTableDefinitionDelete",
                                   "mnuTableDefinitionSep",
                                   "mnuColumnDefinitionPaste",
                                   "mnuColumnDefinitionDelete"};

} // namespace

TEST_F(Binding, ShowsTheTablesInTheirOrder) {
    bind(model);
    EXPECT_EQ(slots(), u"ORDERS CUSTOMERS ITEMS");
    EXPECT_EQ(look("lstTable(2)").items, (std::vector<String>{u"ID", u"NAME"}));
    EXPECT_TRUE(stage->boxes.empty());
    EXPECT_TRUE(stage->raised.empty());
}

TEST_F(Binding, GivesTheModelBack) {
    bind(model);
    EXPECT_EQ(zandor().P_GET_Zandor().get(), model.get());
}

TEST_F(Binding, MakesAnEmptyModelOfItsOwnWhenAskedForOneBefore) {
    const auto own = zandor().P_GET_Zandor();
    ASSERT_TRUE(own);
    EXPECT_EQ(own->Tables().Count(), 0);
    EXPECT_EQ(zandor().P_GET_Zandor().get(), own.get()) << "and keeps it";
}

TEST_F(Binding, ToNothingRaisesErrorAndKeepsTheModelHeld) {
    bind(model);
    forget();
    zandor().P_SET_Zandor(nullptr);
    ASSERT_EQ(stage->raised.size(), 1U);
    EXPECT_EQ(stage->raised[0].event, TalvikDBxZandor::Event::Error);
    EXPECT_EQ(stage->raised[0].arguments.Text, u"New Zanodr is nothing!");
    EXPECT_EQ(stage->raised[0].arguments.Number, -1);
    EXPECT_EQ(zandor().P_GET_Zandor().get(), model.get());
    EXPECT_EQ(slots(), u"ORDERS CUSTOMERS ITEMS");
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(Binding, ShowsTheFirstSixteenOfSeventeenTablesAndSaysNothing) {
    const auto large = library.newModel();
    for (int n = 1; n <= 17; ++n) large->table(u"T" + platform::decimal(n), {u"ID"});
    bind(large);
    EXPECT_EQ(slots(), u"T1 T2 T3 T4 T5 T6 T7 T8 T9 T10 T11 T12 T13 T14 T15 T16");
    EXPECT_EQ(Backstage::lstTable(zandor()).Count(), 17U) << "with the template";
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(Binding, EndsTheJoinsAtOneToATableThatIsNotShown) {
    const auto large = library.newModel();
    std::vector<platform::Ref<fake::Table>> tables;
    for (int n = 1; n <= 17; ++n)
        tables.push_back(large->table(u"T" + platform::decimal(n), {u"ID"}));
    large->join(tables[0], u"ID", tables[16], u"ID");
    large->join(tables[0], u"ID", tables[1], u"ID");
    large->definition(tables[0], u"ID");
    bind(large);
    EXPECT_EQ(stage->boxes, (std::vector{objectNotSet(u"FindColumn"), objectNotSet(u"DrawNewJoin"),
                                         objectNotSet(u"SetZandor")}));
    EXPECT_EQ(Backstage::mJoinLines(zandor()).Count(), 0);
    EXPECT_EQ(stage->cell(0, 1), u"") << "the grid is not filled any more";
    EXPECT_TRUE(look("lstTable(16)").visible) << "what was shown before stays";
}

TEST_F(Binding, DrawsTheJoinsAndKeepsTheKeysOfTheModelInTheirRecords) {
    model->join(orders, u"CUSTOMER_ID", customers, u"ID", 2, 5);
    model->join(items, u"ORDER_ID", orders, u"ID");
    bind(model);
    auto& lines = Backstage::mJoinLines(zandor());
    ASSERT_EQ(lines.Count(), 2);
    EXPECT_EQ(lines.Item(1)->LeftTableName(), u"ORDERS");
    EXPECT_EQ(lines.Item(1)->LeftColumnName(), u"CUSTOMER_ID");
    EXPECT_EQ(lines.Item(1)->RightTableName(), u"CUSTOMERS");
    EXPECT_EQ(lines.Item(1)->RightColumnName(), u"ID");
    EXPECT_EQ(lines.Item(1)->JoinType(), 2);
    EXPECT_EQ(lines.Item(1)->CompareOperator(), 5);
    EXPECT_EQ(std::get<String>(lines.Item(1)->Tag()), u"j1");
    EXPECT_EQ(lines.Item(2)->LeftTableName(), u"ITEMS");
    EXPECT_EQ(std::get<String>(lines.Item(2)->Tag()), u"j2");
    EXPECT_TRUE(look("linJoin(1)").visible);
    EXPECT_TRUE(look("linJoin(2)").visible);
}

TEST_F(Binding, GivesTheTablesAndTheGridTheFontOfTheSurroundings) {
    const String ambient = toolkit().AmbientFont().Name;
    bind(model);
    EXPECT_EQ(look("lstTable(0)").font, ambient);
    EXPECT_EQ(look("lstTable(1)").font, ambient);
    EXPECT_EQ(look("sprColumn").font, ambient);
}

TEST_F(Binding, MakesTheSelectedTableCurrent) {
    customers->selected = -1;
    bind(model);
    EXPECT_EQ(customers->selected, 1) << "as a table made current is";
    EXPECT_EQ(orders->selected, 0);
    EXPECT_EQ(items->selected, 0);
}

TEST_F(Binding, MakesTheLastOfSeveralSelectedTablesCurrent) {
    orders->selected = customers->selected = 1;
    bind(model);
    EXPECT_EQ(orders->selected, 0);
    EXPECT_EQ(customers->selected, 1);
}

TEST_F(Binding, MakesAShownTableCurrentWhenNoneIsSelected) {
    bind(model);
    EXPECT_EQ(orders->selected, 1) << "the first shown";
    EXPECT_EQ(customers->selected, 0);
    EXPECT_EQ(items->selected, 0);
}

TEST_F(Binding, MakesNoTableOfAnEmptyModelCurrent) {
    zandor().DebugSwitch(1);
    bind(library.newModel());
    ASSERT_FALSE(stage->boxes.empty());
    EXPECT_EQ(stage->boxes[0], trace(u"SetZandor"));
    EXPECT_EQ(std::count(stage->boxes.begin(), stage->boxes.end(), trace(u"SetCurrentTable")), 0);
}

TEST_F(Binding, LeavesTheTableShownLastAsTheActiveOneUntilATableTakesTheFocus) {
    bind(model);
    const bool focusTaken = look("lstTable(1)").focused;
    EXPECT_EQ(Backstage::mActiveTableIndex(zandor()), focusTaken ? 1 : 3);
}

TEST_F(Binding, ShowsTheMenuEntriesThatTheHostWants) {
    bind(model);
    for (const char* entry : menuEntries) EXPECT_TRUE(look(entry).visible) << entry;

    bool TalvikDBxZandor::Zandor::*const flags[] = {
        &TalvikDBxZandor::Zandor::LNGMnuShowJoinDefVis, &TalvikDBxZandor::Zandor::LNGMnuDelJoinVis,
        &TalvikDBxZandor::Zandor::LNGMnuSep1Vis,        &TalvikDBxZandor::Zandor::LNGMnuCopyColVis,
        &TalvikDBxZandor::Zandor::LNGMnuCreateJoinVis,  &TalvikDBxZandor::Zandor::LNGMnuDelTableVis,
        &TalvikDBxZandor::Zandor::LNGMnuSep2Vis,        &TalvikDBxZandor::Zandor::LNGMnuPasteColVis,
        &TalvikDBxZandor::Zandor::LNGMnuDelColVis};
    for (std::size_t hidden = 0; hidden < std::size(flags); ++hidden) {
        zandor().*flags[hidden] = false;
        EXPECT_TRUE(look(menuEntries[hidden]).visible) << "a flag takes effect with the next model";
        bind(model);
        for (std::size_t i = 0; i < std::size(menuEntries); ++i)
            EXPECT_EQ(look(menuEntries[i]).visible, i != hidden) << menuEntries[i];
        zandor().*flags[hidden] = true;
    }
}

TEST_F(Binding, AnotherModelTakesTheTablesAndJoinsOfTheFirstAway) {
    model->join(orders, u"CUSTOMER_ID", customers, u"ID");
    bind(model);
    const auto other = library.newModel();
    other->table(u"PARTS", {u"ID"});
    bind(other);
    EXPECT_EQ(slots(), u"PARTS");
    EXPECT_EQ(Backstage::mJoinLines(zandor()).Count(), 0);
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_EQ(Backstage::mJoinFreeList(zandor())->FreeCount(), 64);
    EXPECT_EQ(model->tableCount(), 3) << "the first model itself is left alone";
    EXPECT_EQ(model->joinCount(), 1);
    EXPECT_TRUE(stage->raised.empty());
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(Binding, TheSameModelAgainShowsItAsBefore) {
    model->join(orders, u"CUSTOMER_ID", customers, u"ID");
    model->definition(orders, u"ID");
    for (int round = 0; round < 3; ++round) bind(model);
    EXPECT_EQ(slots(), u"ORDERS CUSTOMERS ITEMS");
    EXPECT_EQ(Backstage::mJoinLines(zandor()).Count(), 1);
    EXPECT_EQ(stage->cell(0, 1), u"ID");
    EXPECT_EQ(stage->cell(0, 2), u"");
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(Binding, RemovesEveryTableButTheTemplateOnRequest) {
    bind(model);
    EXPECT_TRUE(Backstage::RemoveAllTables(zandor()));
    EXPECT_EQ(slots(), u"-");
    EXPECT_TRUE(stage->exists("lstTable(0)"));
    EXPECT_EQ(Backstage::mTableFreeList(zandor())->FreeCount(), 16);
    EXPECT_EQ(zandor().DeletedTable, u"ITEMS");
    EXPECT_TRUE(Backstage::RemoveAllTables(zandor())) << "also where there is none";
}

TEST_F(Binding, EndsWithTerminateWhichLeavesAnEmptyModel) {
    bind(model);
    zandor().Terminate();
    EXPECT_EQ(slots(), u"-");
    const auto left = zandor().P_GET_Zandor();
    ASSERT_TRUE(left);
    EXPECT_NE(left.get(), model.get());
    EXPECT_EQ(left->Tables().Count(), 0);
    EXPECT_EQ(model->tableCount(), 3);
    EXPECT_TRUE(stage->raised.empty());
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(Binding, IsPossibleAgainAfterTerminate) {
    bind(model);
    zandor().Terminate();
    bind(model);
    EXPECT_EQ(slots(), u"ORDERS CUSTOMERS ITEMS");
    EXPECT_TRUE(stage->boxes.empty());
}
