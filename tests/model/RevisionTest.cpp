#include "SmallQuery.h"

#include <Zandor/model/Snapshot.h>

#include <gtest/gtest.h>

#include <functional>

using namespace zandor;

using platform::Ref;

namespace {

/// A query in which everything can be changed, and what is known of it.
class EveryChange : public testing::Test {
protected:
    EveryChange() {
        definition->AddCriterium(u"orders.id", u"4");
        query.AddColumnDefinition(small.newDefinition(small.customers));
        query.AddJoin(small.newJoin(small.customers, small.orders));
        known.update(query);
    }

    /// The change is seen at once and only once; one that was undone meanwhile is none.
    void isSeen(const char* what, const std::function<void()>& how) {
        SCOPED_TRACE(what);
        const auto before = query.record();
        model::Snapshot unaware(query);
        how();
        ASSERT_NE(query.record(), before) << "changes nothing";
        const model::Change change = known.update(query);
        EXPECT_FALSE(change.empty());
        EXPECT_TRUE(known.update(query).empty());
        query.apply(change.reversed());
        EXPECT_EQ(query.record(), before);
        EXPECT_TRUE(unaware.update(query).empty());
        EXPECT_FALSE(known.update(query).empty());
    }

    SmallQuery small;
    model::Query& query = *small.query;
    const Ref<TalvikZandorLib::ZDTable> table = small.orders;
    const Ref<TalvikZandorLib::ZDJoin> join =
        query.AddJoin(small.newJoin(small.orders, small.customers));
    const Ref<TalvikZandorLib::ZDColumnDefinition> definition =
        query.AddColumnDefinition(small.newDefinition(small.orders));
    model::Snapshot known{query};
};

} // namespace

TEST_F(EveryChange, OfATableIsSeen) {
    isSeen("Left", [&] { table->Left(10); });
    isSeen("Top", [&] { table->Top(10); });
    isSeen("Width", [&] { table->Width(10); });
    isSeen("Height", [&] { table->Height(10); });
    isSeen("name", [&] { query.renameTable(small.orders, u"sales"); });
}

TEST_F(EveryChange, OfAJoinIsSeen) {
    isSeen("LeftTable", [&] { join->LeftTable(small.customers); });
    isSeen("RightTable", [&] { join->RightTable(small.orders); });
    isSeen("LeftColumn", [&] { join->LeftColumn(small.orders->columnNamed(u"name")); });
    isSeen("RightColumn", [&] { join->RightColumn(small.customers->columnNamed(u"name")); });
    isSeen("JoinType", [&] { join->JoinType(1); });
    isSeen("CompareOperator", [&] { join->CompareOperator(1); });
}

TEST_F(EveryChange, OfADefinitionIsSeen) {
    isSeen("Column", [&] { definition->Column(small.id(small.customers)); });
    isSeen("Synonym", [&] { definition->Synonym(u"number"); });
    isSeen("SortOrder", [&] { definition->SortOrder(1); });
    isSeen("Visible", [&] { definition->Visible(false); });
}

TEST_F(EveryChange, OfCriteriaIsSeen) {
    isSeen("AddCriterium", [&] { definition->AddCriterium(u"7", u"5"); });
    isSeen("the first of a definition",
           [&] { query.ColumnDefinitions().Item(2)->AddCriterium(u"7", u"4"); });
    isSeen("Criterium", [&] { definition->Criteria().Item(u"4")->Criterium(u"8"); });
    isSeen("Criterium by row", [&] { definition->Criteria().Item(1)->Criterium(u"8"); });
    isSeen("Remove", [&] { definition->Criteria().Remove(u"4"); });
    isSeen("what names are tied to", [&] { query.addTable(SmallQuery::described(u"items")); });
    const auto& criterium = static_cast<model::ColumnDefinition&>(*definition).criteria().rows();
    isSeen("references", [&] { criterium.at(4)->tie({u"orders.id", {{0, 6, {}}}}); });
}

TEST_F(EveryChange, OfAListIsSeen) {
    isSeen("AddJoin", [&] { query.AddJoin(small.newJoin(small.orders, small.orders)); });
    isSeen("a join removed", [&] { query.Joins().Remove(u"j1"); });
    isSeen("AddColumnDefinition",
           [&] { query.AddColumnDefinition(small.newDefinition(small.orders)); });
    isSeen("a definition removed", [&] { query.ColumnDefinitions().Remove(u"x1"); });
    isSeen("a definition moved", [&] {
        query.ColumnDefinitions().Remove(u"x1");
        query.AddColumnDefinition(definition);
    });
    isSeen("addTable", [&] { query.addTable(SmallQuery::described(u"items")); });
    isSeen("DeleteTable", [&] { query.DeleteTable(table); });
}

TEST_F(EveryChange, OfARestoredQueryIsSeen) {
    const auto restored = model::Query::restored(query.record());
    model::Snapshot snapshot(*restored);
    restored->Tables().Item(1)->Left(7);
    restored->Joins().Item(1)->JoinType(2);
    restored->ColumnDefinitions().Item(1)->Criteria().Item(u"4")->Criterium(u"8");
    const auto change = snapshot.update(*restored);
    EXPECT_EQ(change.tables.changed.size(), 1u);
    EXPECT_EQ(change.joins.changed.size(), 1u);
    EXPECT_EQ(change.definitions.changed.size(), 1u);
}

TEST_F(EveryChange, IsToldInTheOrderOfTheList) {
    small.customers->Left(7);
    small.orders->Left(7);
    small.customers->Left(8);
    const auto change = known.update(query);
    ASSERT_EQ(change.tables.changed.size(), 2u);
    EXPECT_EQ(change.tables.changed[0].after.object, small.orders);
}

TEST_F(EveryChange, OfWhatIsHeldLongerThanItsQueryIsNobodysBusiness) {
    const auto criterium = definition->Criteria().Item(u"4");
    const auto held = query.Joins().Item(u"j1");
    definition->Criteria().Remove(u"4");
    query.Joins().Remove(u"j1");
    known.update(query);
    criterium->Criterium(u"9");
    held->JoinType(3);
    EXPECT_TRUE(known.update(query).empty());
    known = model::Snapshot(*platform::makeRef<model::Query>());
    small.query.reset();
    criterium->Criterium(u"10");
    held->JoinType(2);
    EXPECT_EQ(criterium->Criterium(), u"10");
}
