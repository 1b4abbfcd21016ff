#include "control/ShellFixture.h"

#include <stdexcept>

using namespace zandor;

namespace {

const platform::RuntimeError broken{1234, u"The host is broken"};

/// One table with a selected column that is marked, one join and one definition with a criterion.
class AModelThatFails : public AControl {
protected:
    AModelThatFails() {
        orders = model->table(u"ORDERS", {u"ID"});
        orders->place(150, 150, 2400, 2400);
        orders->column(u"ID").selected = true;
        customers = model->table(u"CUSTOMERS", {u"ID"});
        customers->place(3000, 150, 2400, 2400);
        model->join(orders, u"ID", customers, u"ID");
        model->definition(orders, u"ID", {u"> 1"});
    }

    void fail(const std::string& member, int nth = 1) {
        model->calls->disarm();
        model->fail(member, broken, nth);
    }
    static Stage::Box brokenIn(StringView procedure) {
        return unexpected(procedure, u"1234", u"The host is broken");
    }
    std::int32_t joinsDrawn() { return Backstage::mJoinLines(zandor()).Count(); }
    std::size_t tablesLoaded() { return Backstage::lstTable(zandor()).Count() - 1; }

    platform::Ref<fake::Model> model = library.newModel();
    platform::Ref<fake::Table> orders, customers;
};

} // namespace

TEST_F(AModelThatFails, WithItsTablesEndsTheBindingBeforeTheJoins) {
    for (const char* member :
         {"Zandor.Tables", "Tables.Count", "Tables.Item(position)", "ZDTable.Name", "ZDTable.Key",
          "ZDTable.Left", "ZDTable.Top", "ZDTable.Width", "ZDTable.Height", "ZDTable.Columns",
          "Columns.Count", "Columns.Item(position)", "ZDColumn.Name", "ZDColumn.Key",
          "ZDColumn.Marker", "ZDColumn.Selected", "ZDTable.Selected"}) {
        bind(library.newModel());
        forget();
        fail(member);
        bind(model);
        EXPECT_EQ(stage->boxes, std::vector{brokenIn(u"SetZandor")}) << member;
        EXPECT_EQ(joinsDrawn(), 0) << member;
        EXPECT_EQ(stage->cell(0, 1), u"") << member;
        EXPECT_EQ(zandor().P_GET_Zandor().get(), model.get()) << member;
    }
}

TEST_F(AModelThatFails, AtItsSecondTableKeepsTheFirst) {
    fail("Tables.Item(position)", 2);
    bind(model);
    EXPECT_EQ(stage->boxes, std::vector{brokenIn(u"SetZandor")});
    EXPECT_TRUE(look("lstTable(1)").visible);
    EXPECT_EQ(tablesLoaded(), 1U);
    EXPECT_EQ(orders->selected, 0) << "none has been made current";
}

TEST_F(AModelThatFails, AtAColumnKeepsTheTableLoadedAndUnseen) {
    fail("ZDColumn.Key");
    bind(model);
    EXPECT_EQ(tablesLoaded(), 1U);
    EXPECT_EQ(look("lstTable(1)").text, u"ORDERS");
    EXPECT_FALSE(look("lstTable(1)").visible);
    EXPECT_FALSE(Backstage::mTableFreeList(zandor())->IsFree(1));
}

TEST_F(AModelThatFails, CanBeBoundAgainOnceItWorks) {
    fail("ZDColumn.Key");
    bind(model);
    forget();
    bind(model);
    EXPECT_TRUE(stage->boxes.empty());
    EXPECT_TRUE(look("lstTable(1)").visible);
    EXPECT_TRUE(look("lstTable(2)").visible);
    EXPECT_EQ(joinsDrawn(), 1);
}

TEST_F(AModelThatFails, WithItsJoinsEndsTheBindingBeforeTheGrid) {
    for (const char* member : {"Zandor.Joins", "Joins.Count", "Joins.Item(position)",
                               "ZDJoin.LeftTable", "ZDJoin.LeftColumn", "ZDJoin.RightTable",
                               "ZDJoin.RightColumn", "ZDJoin.JoinType", "ZDJoin.CompareOperator"}) {
        bind(library.newModel());
        forget();
        fail(member);
        bind(model);
        EXPECT_EQ(stage->boxes, std::vector{brokenIn(u"SetZandor")}) << member;
        EXPECT_EQ(joinsDrawn(), 0) << member;
        EXPECT_TRUE(look("lstTable(2)").visible) << member;
        EXPECT_EQ(orders->selected, 1) << member << ": the tables are done with";
        EXPECT_EQ(stage->cell(0, 1), u"") << member;
    }
}

TEST_F(AModelThatFails, WithTheKeyOfAJoinLeavesItDrawnWithoutATag) {
    fail("ZDJoin.Key");
    bind(model);
    EXPECT_EQ(stage->boxes, std::vector{brokenIn(u"SetZandor")});
    ASSERT_EQ(joinsDrawn(), 1);
    EXPECT_FALSE(std::holds_alternative<String>(Backstage::mJoinLines(zandor()).Item(1)->Tag()));
}

TEST_F(AModelThatFails, WithAJoinOfNothingReportsAnUnsetObject) {
    model->joinAt(1).leftTable = nullptr;
    bind(model);
    EXPECT_EQ(stage->boxes, std::vector{objectNotSet(u"SetZandor")});
    EXPECT_EQ(joinsDrawn(), 0);
}

TEST_F(AModelThatFails, WithItsDefinitionsKeepsTablesAndJoins) {
    for (const char* member :
         {"Zandor.ColumnDefinitions", "ColumnDefinitions.Count", "ColumnDefinitions.Item(position)",
          "ZDColumnDefinition.Column", "ZDColumnDefinition.Synonym", "ZDColumnDefinition.SortOrder",
          "ZDColumnDefinition.Visible", "ZDColumnDefinition.Criteria", "Criteria.Count",
          "Criteria.Item(position)", "ZDCriterium.Criterium"}) {
        bind(library.newModel());
        forget();
        fail(member);
        bind(model);
        EXPECT_EQ(stage->boxes, std::vector{brokenIn(u"SetZandor")}) << member;
        EXPECT_EQ(joinsDrawn(), 1) << member;
        EXPECT_EQ(tablesLoaded(), 2U) << member;
    }
}

TEST_F(AModelThatFails, WithinADefinitionLeavesItsColumnHalfFilled) {
    model->definitionAt(1).visible = false;
    fail("ZDColumnDefinition.SortOrder");
    bind(model);
    EXPECT_EQ(stage->cell(0, 1), u"ID");
    EXPECT_EQ(stage->cell(3, 1), u"");
    EXPECT_EQ(grid().ColData(1), 1) << "yet it can be edited and deleted";
}

TEST_F(AModelThatFails, WithTheColumnOfADefinitionLeavesTheColumnsAfterItEmpty) {
    model->definition(customers, u"ID");
    model->definitionAt(1).column = nullptr;
    bind(model);
    EXPECT_EQ(stage->boxes, std::vector{objectNotSet(u"SetZandor")});
    EXPECT_EQ(stage->cell(0, 1), u"");
    EXPECT_EQ(stage->cell(0, 2), u"");
}

TEST_F(AModelThatFails, WithTheKeyOfADefinitionIsBoundAllTheSame) {
    zandor().LNGMnuDelColVis = false;
    fail("ZDColumnDefinition.Key");
    bind(model);
    EXPECT_EQ(stage->boxes, std::vector{brokenIn(u"P_SET Zandor")});
    EXPECT_EQ(stage->cell(0, 1), u"ID");
    EXPECT_EQ(joinsDrawn(), 1);
    EXPECT_FALSE(look("mnuColumnDefinitionDelete").visible);
    EXPECT_TRUE(look("hsbTable").enabled) << "the tables have been arranged";
}

TEST_F(AModelThatFails, StillHasItsTablesArrangedAndTheMenuSet) {
    zandor().LNGMnuDelColVis = false;
    fail("Zandor.Joins");
    bind(model);
    EXPECT_FALSE(look("mnuColumnDefinitionDelete").visible);
    EXPECT_TRUE(look("hsbTable").enabled);
}

TEST_F(AModelThatFails, WhenATableIsMadeCurrentGoesOnWithTheBinding) {
    fail("ZDTable.Selected=");
    bind(model);
    EXPECT_EQ(stage->boxes, std::vector{brokenIn(u"SetSelectedTable")});
    EXPECT_EQ(joinsDrawn(), 1);
    EXPECT_EQ(stage->cell(0, 1), u"ID");
}

TEST_F(AModelThatFails, WithAnExceptionOfItsOwnIsReportedByItsText) {
    model->fail("Zandor.Joins", std::runtime_error("no connection"));
    bind(model);
    EXPECT_EQ(stage->boxes, std::vector{unexpected(u"SetZandor", u"440", u"no connection")});
}

TEST_F(AModelThatFails, ForLackOfMemoryIsReportedAsSuch) {
    model->fail("ZDTable.Name", std::bad_alloc());
    bind(model);
    EXPECT_EQ(stage->boxes, std::vector{unexpected(u"SetZandor", u"7", u"Out of memory")});
}

TEST_F(AModelThatFails, InSelectColumnNamesLeavesTheEntriesSelected) {
    for (const char* member : {"Zandor.Tables", "Tables.Count", "Tables.Item(position)",
                               "ZDTable.Name", "ZDTable.Columns", "Columns.Count",
                               "Columns.Item(position)", "ZDColumn.Name", "ZDColumn.Selected="}) {
        orders->column(u"ID").selected = false;
        bind(model);
        forget();
        fail(member);
        zandor().SelectColumnNames(u"ORDERS", u"ID");
        EXPECT_EQ(stage->boxes, std::vector{brokenIn(u"SelectColumnNames")}) << member;
        EXPECT_EQ(look("lstTable(1)").selected, std::vector<String>{u"ID"}) << member;
        EXPECT_FALSE(orders->column(u"ID").selected) << member;
    }
}

TEST_F(AModelThatFails, ToBeMadeLeavesTheHostWithNothing) {
    library.calls->failNext("Library.NewZandor", broken);
    EXPECT_FALSE(zandor().P_GET_Zandor());
    EXPECT_EQ(stage->boxes, std::vector{brokenIn(u"P_GET Zandor")});
    EXPECT_TRUE(zandor().P_GET_Zandor()) << "the next time it works";
}

TEST_F(AModelThatFails, ToBeMadeLeavesTheOldOneHeldAfterTerminate) {
    bind(model);
    forget();
    library.calls->failNext("Library.NewZandor", broken);
    zandor().Terminate();
    EXPECT_EQ(stage->boxes, std::vector{brokenIn(u"Terminate")});
    EXPECT_EQ(tablesLoaded(), 0U) << "its tables have gone all the same";
    EXPECT_EQ(zandor().P_GET_Zandor().get(), model.get());
}
