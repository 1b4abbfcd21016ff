#include <Zandor/model/Snapshot.h>

#include "Expect.h"
#include "SmallQuery.h"

#include <functional>

using namespace zandor;

using platform::Ref;

namespace {

/// A change of each kind, and a query that it does not fit any more.
class AChange : public testing::Test {
protected:
    AChange() {
        query.AddJoin(small.newJoin(small.orders, small.customers));
        query.AddColumnDefinition(small.newDefinition(small.orders));
        query.AddColumnDefinition(small.newDefinition(small.customers));
        known = model::Snapshot(query);
    }

    model::Change changeBy(const std::function<void()>& how) {
        how();
        return known.update(query);
    }
    /// Error 5, and the query as it was.
    void expectRefused(const model::Change& change) {
        const auto before = query.record();
        EXPECT_EQ(errorOf([&] { query.apply(change); }), 5);
        EXPECT_EQ(query.record(), before);
    }
    /// There and back, and there again.
    void expectUndone(const std::function<void()>& how) {
        const auto before = query.record();
        const auto change = changeBy(how);
        const auto after = query.record();
        ASSERT_NE(before, after);
        query.apply(change.reversed());
        EXPECT_EQ(query.record(), before);
        query.apply(change);
        EXPECT_EQ(query.record(), after);
        EXPECT_TRUE(known.update(query).empty());
    }
    model::ColumnDefinition& definition(std::int32_t position) {
        return dynamic_cast<model::ColumnDefinition&>(*query.ColumnDefinitions().Item(position));
    }

    SmallQuery small;
    model::Query& query = *small.query;
    model::Snapshot known{query};
};

TEST_F(AChange, OfEachThingThatIsSaidOfAnOutputColumnIsUndone) {
    expectUndone([&] { definition(1).format(model::Format::Thousands); });
    expectUndone([&] { definition(1).decimals(2); });
    expectUndone([&] { definition(1).total(model::Total::Count); });
    expectUndone([&] { definition(1).sortPriority(3); });
    expectUndone([&] { definition(1).Width(1500); });
    expectUndone([&] { definition(1).Synonym(u"Number"); });
    expectUndone([&] { definition(1).SortOrder(2); });
    expectUndone([&] { definition(1).Visible(false); });
    expectUndone([&] { definition(1).expression(u"orders.id + 1"); });
    expectUndone([&] { definition(1).AddCriterium(u"> 1", u"4"); });
}

TEST_F(AChange, OfATablesPlaceAndSizeIsUndone) {
    expectUndone([&] {
        small.orders->Left(1);
        small.orders->Top(2);
        small.orders->Width(3000);
        small.orders->Height(4000);
    });
    EXPECT_EQ(small.orders->Width(), 3000);
    EXPECT_EQ(small.orders->Height(), 4000);
}

TEST_F(AChange, OfTheOptionsIsUndoneStepByStep) {
    const auto set = [&](std::int32_t first) {
        auto options = query.options();
        options.first = first;
        query.options(options);
    };
    const auto one = changeBy([&] { set(1); });
    const auto two = changeBy([&] { set(2); });
    query.apply(two.reversed());
    EXPECT_EQ(query.options().first, 1);
    query.apply(one.reversed());
    EXPECT_EQ(query.options().first, 0);
    query.apply(one);
    query.apply(two);
    EXPECT_EQ(query.options().first, 2);
    EXPECT_TRUE(known.update(query).empty());
}

TEST_F(AChange, IsRefusedByAQueryWithOtherOptions) {
    const auto change = changeBy([&] { small.orders->Left(300); });
    auto options = query.options();
    options.distinct = true;
    query.options(options);
    expectRefused(change.reversed());
}

TEST_F(AChange, IsRefusedByAQueryThatHasGivenKeysSince) {
    const auto change = changeBy([&] { small.orders->Left(300); });
    query.addTable(SmallQuery::described(u"later"));
    expectRefused(change.reversed());
}

TEST_F(AChange, IsRefusedWhereAnotherObjectStandsInThePlace) {
    const auto change = changeBy([&] { query.ColumnDefinitions().Remove(u"x1"); });
    expectRefused(change); // x2 stands there now
    query.ColumnDefinitions().Remove(u"x2");
    expectRefused(change); // nothing stands there
}

TEST_F(AChange, IsRefusedBeforeAnythingOfItIsDoneWhereAnotherObjectStandsInAPlace) {
    const auto change = changeBy([&] {
        small.orders->Left(300);
        query.ColumnDefinitions().Remove(u"x1");
    });
    small.orders->Left(7);
    expectRefused(change);
    EXPECT_EQ(small.orders->Left(), 7);
}

TEST_F(AChange, IsRefusedWhereItsObjectIsGone) {
    const auto change = changeBy([&] { definition(2).Synonym(u"Number"); });
    query.ColumnDefinitions().Remove(u"x2");
    expectRefused(change.reversed());
}

TEST_F(AChange, IsRefusedWhereThereIsNoPlaceForWhatItBrings) {
    const auto change = changeBy([&] { query.ColumnDefinitions().Remove(u"x2"); });
    query.ColumnDefinitions().Remove(u"x1");
    expectRefused(change.reversed()); // it was the second one
}

TEST_F(AChange, CountsWhatItTakesAwayBeforeWhatItBrings) {
    // Of two columns that change places one goes and comes.
    const auto second = query.ColumnDefinitions().Item(2);
    const auto change = changeBy([&] { query.StandsBehind(second, {}); });
    query.apply(change.reversed());
    EXPECT_EQ(query.ColumnDefinitions().Item(2), second);
    model::Change tooFar = change.reversed();
    ASSERT_EQ(tooFar.definitions.come.size(), 1U);
    tooFar.definitions.come[0].position = 3;
    query.apply(change);
    expectRefused(tooFar); // with one gone there is no third place
}

TEST_F(AChange, ThatDoesNotFitAtItsEndIsNotBegun) {
    // Of a table and of a column: the table still fits.
    const auto change = changeBy([&] {
        small.orders->Left(300);
        definition(2).Synonym(u"Number");
    });
    query.ColumnDefinitions().Remove(u"x2");
    expectRefused(change.reversed());
    EXPECT_EQ(small.orders->Left(), 300);
}

TEST_F(AChange, IsToldOnceOfAnObjectThatWentAndCameBackAndOfNoneThatIsGone) {
    const auto join = query.Joins().Item(1);
    query.Joins().Remove(u"j1");
    query.AddJoin(join);
    join->JoinType(2);
    const auto change = known.update(query);
    EXPECT_EQ(change.joins.changed.size() + change.joins.come.size(), 1U);
    const std::int32_t before = query.ColumnDefinitions().Count();
    for (int n = 0; n < 3; ++n) {
        query.AddColumnDefinition(small.newDefinition(small.orders));
        query.ColumnDefinitions().Remove(query.ColumnDefinitions().Item(before + 1)->Key());
    }
    small.orders->Left(5);
    const auto later = known.update(query);
    EXPECT_TRUE(later.definitions.empty());
    EXPECT_EQ(later.tables.changed.size(), 1U);
}

TEST(TheLogOfChanges, HasEachObjectOnceAndOnlyWhileItIsThere) {
    const auto log = std::make_shared<model::ChangeLog>();
    {
        model::Revision one;
        one.enter(log);
        one.enter(log);
        EXPECT_EQ(log->since(0), std::vector<const model::Revision*>{&one});
        EXPECT_EQ(log->now(), 2U);
    }
    EXPECT_TRUE(log->since(0).empty());
}

} // namespace
