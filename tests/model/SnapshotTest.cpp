#include <Zandor/model/Snapshot.h>

#include "Expect.h"
#include "SmallQuery.h"

#include <functional>

using namespace zandor;

using platform::Ref;

namespace {

/// Two tables, two joins, three definitions, and what is known of them.
class ASnapshot : public testing::Test {
protected:
    ASnapshot() {
        query.AddJoin(small.newJoin(small.orders, small.customers));
        query.AddJoin(small.newJoin(small.customers, small.orders));
        for (const auto& table : {small.orders, small.customers, small.orders})
            query.AddColumnDefinition(small.newDefinition(table));
        known = model::Snapshot(query);
    }

    /// Changes the query, and expects that to be undone and made again exactly.
    model::Change changed(const std::function<void()>& how) {
        const auto before = query.record();
        how();
        const auto after = query.record();
        model::Change change = known.update(query);
        query.apply(change.reversed());
        EXPECT_EQ(query.record(), before);
        query.apply(change);
        EXPECT_EQ(query.record(), after);
        EXPECT_TRUE(known.update(query).empty());
        return change;
    }

    Ref<TalvikZandorLib::ZDColumnDefinition> definition(std::int32_t position) {
        return query.ColumnDefinitions().Item(position);
    }

    SmallQuery small;
    model::Query& query = *small.query;
    model::Snapshot known{query};
};

} // namespace

TEST_F(ASnapshot, FindsNothingWhereNothingHasChanged) { EXPECT_TRUE(known.update(query).empty()); }

TEST_F(ASnapshot, FindsOnlyWhatHasChanged) {
    const auto change = changed([&] { small.orders->Left(300); });
    ASSERT_EQ(change.tables.changed.size(), 1u);
    EXPECT_EQ(change.tables.changed[0].before.left, -1);
    EXPECT_EQ(change.tables.changed[0].after.left, 300);
    EXPECT_TRUE(change.joins.empty());
    EXPECT_TRUE(change.definitions.empty());
}

TEST_F(ASnapshot, FindsTheWidthOfAColumn) {
    const auto change =
        changed([&] { dynamic_cast<model::ColumnDefinition&>(*definition(2)).Width(2250); });
    ASSERT_EQ(change.definitions.changed.size(), 1u);
    EXPECT_EQ(change.definitions.changed[0].before.width, 0);
    EXPECT_EQ(change.definitions.changed[0].after.width, 2250);
    EXPECT_TRUE(change.tables.empty());
}

TEST_F(ASnapshot, FindsNoChangeInASelection) {
    small.orders->Selected(1);
    small.id(small.orders)->Selected(true);
    EXPECT_TRUE(known.update(query).empty());
}

TEST_F(ASnapshot, PutsAnItemBackAtItsPosition) {
    const auto change = changed([&] { query.ColumnDefinitions().Remove(u"x2"); });
    ASSERT_EQ(change.definitions.gone.size(), 1u);
    EXPECT_EQ(change.definitions.gone[0].position, 2);
    query.apply(change.reversed());
    EXPECT_EQ(definition(2)->Key(), u"x2");
}

TEST_F(ASnapshot, PutsTheVerySameObjectsBack) {
    const auto join = query.Joins().Item(1);
    const auto change = changed([&] { query.DeleteTable(small.orders); });
    EXPECT_EQ(query.Tables().Count(), 1);
    EXPECT_EQ(query.Joins().Count(), 0);
    query.apply(change.reversed());
    EXPECT_EQ(query.Tables().Item(1), small.orders);
    EXPECT_EQ(query.Joins().Item(1), join);
}

TEST_F(ASnapshot, PutsAnItemBackAsItWasWhateverBecameOfIt) {
    const auto join = query.Joins().Item(1);
    const auto before = query.record();
    query.Joins().Remove(u"j1");
    const auto change = known.update(query);
    join->JoinType(2);
    query.apply(change.reversed());
    EXPECT_EQ(query.record(), before);
}

TEST_F(ASnapshot, KnowsAnItemAtAnotherPositionAgain) {
    changed([&] {
        const auto first = definition(1);
        query.ColumnDefinitions().Remove(u"x1");
        first->Synonym(u"last");
        query.AddColumnDefinition(first);
    });
    EXPECT_EQ(definition(3)->Key(), u"x1");
}

TEST_F(ASnapshot, TakesTheKeysBackThatAChangeGave) {
    const auto change = changed([&] { query.addTable(SmallQuery::described(u"items")); });
    query.apply(change.reversed());
    EXPECT_EQ(query.addTable(SmallQuery::described(u"products"))->Key(), u"t3");
}

TEST_F(ASnapshot, PutsANameBackInTheCriteriaThatFollowedIt) {
    definition(2)->AddCriterium(u"orders.id", u"4");
    known.update(query);
    const auto change = changed([&] { query.renameTable(small.orders, u"sales"); });
    EXPECT_EQ(definition(2)->Criteria().Item(u"4")->Criterium(), u"sales.id");
    query.apply(change.reversed());
    EXPECT_EQ(definition(2)->Criteria().Item(u"4")->Criterium(), u"orders.id");
    query.renameTable(small.orders, u"bills");
    EXPECT_EQ(definition(2)->Criteria().Item(u"4")->Criterium(), u"bills.id")
        << "it is tied to its table as before";
}

TEST_F(ASnapshot, LeavesACriterionWithTheTableItNamesWhileThatIsGone) {
    definition(2)->AddCriterium(u"orders.id", u"5");
    known.update(query);
    const auto deleted = changed([&] { query.DeleteTable(small.orders); });
    const auto added = changed([&] { query.addTable(SmallQuery::described(u"orders")); });
    query.apply(added.reversed());
    query.apply(deleted.reversed());
    query.renameTable(small.orders, u"sales");
    EXPECT_EQ(definition(2)->Criteria().Item(u"5")->Criterium(), u"sales.id");
}

TEST_F(ASnapshot, KeepsPlacesThatASingleWouldRound) {
    auto record = query.record();
    record.tables[0].left = 16'777'217;
    small.query = model::Query::restored(record);
    model::Query& restored = *small.query;
    model::Snapshot snapshot(restored);
    const auto table = restored.Tables().Item(1);
    table->Left(5);
    const auto change = snapshot.update(restored);
    restored.apply(change.reversed());
    EXPECT_EQ(table->Left(), 16'777'217);
}

TEST_F(ASnapshot, DoesNothingToAQueryThatIsNotAsItWas) {
    const auto join = query.Joins().Item(1);
    query.Joins().Remove(u"j1");
    const auto change = known.update(query);
    const auto before = query.record();
    EXPECT_EQ(errorOf([&] { query.apply(change); }), 5) << "the join is gone already";
    query.Joins().Remove(u"j2");
    known.update(query);
    query.AddJoin(join);
    const auto other = query.record();
    EXPECT_EQ(errorOf([&] { query.apply(change.reversed()); }), 5) << "the join is back already";
    EXPECT_EQ(query.record(), other);
    EXPECT_NE(before, other);
}

TEST_F(ASnapshot, FindsThatOneItemMovedHoweverFar) {
    for (int n = 0; n < 4; ++n) query.AddColumnDefinition(small.newDefinition(small.orders));
    known = model::Snapshot(query);
    const std::int32_t count = query.ColumnDefinitions().Count();
    for (std::int32_t from = 1; from <= count; ++from)
        for (std::int32_t to = 1; to <= count; ++to) {
            if (from == to) continue;
            const auto moved = definition(from);
            const auto predecessor = to == 1 ? Ref<TalvikZandorLib::ZDColumnDefinition>()
                                             : definition(to > from ? to : to - 1);
            const auto change = changed([&] { query.StandsBehind(moved, predecessor); });
            ASSERT_EQ(definition(to), moved);
            ASSERT_EQ(change.definitions.gone.size(), 1u) << from << " to " << to;
            ASSERT_EQ(change.definitions.come.size(), 1u);
            if (std::abs(from - to) == 1) continue; // either of the two may be said to have moved
            EXPECT_EQ(change.definitions.come[0].state.object, moved);
            EXPECT_EQ(change.definitions.gone[0].position, from);
            EXPECT_EQ(change.definitions.come[0].position, to);
        }
}
