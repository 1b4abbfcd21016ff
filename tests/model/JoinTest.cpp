#include "model/Expect.h"
#include "model/SmallQuery.h"

using namespace zandor;

TEST(AJoin, IsNormalWithEqualsAndHasNoEndsWhenNew) {
    model::Library library;
    const auto join = library.NewZDJoin();
    EXPECT_EQ(join->JoinType(), 0);
    EXPECT_EQ(join->CompareOperator(), 0);
    EXPECT_EQ(join->LeftTable(), nullptr);
    EXPECT_EQ(join->LeftColumn(), nullptr);
    EXPECT_EQ(join->RightTable(), nullptr);
    EXPECT_EQ(join->RightColumn(), nullptr);
}

TEST(AJoin, GivesItsEndsBack) {
    SmallQuery small;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    EXPECT_EQ(join->LeftTable(), small.orders);
    EXPECT_EQ(join->LeftColumn(), SmallQuery::id(small.orders));
    EXPECT_EQ(join->RightTable(), small.customers);
    EXPECT_EQ(join->RightColumn(), SmallQuery::id(small.customers));
}

TEST(AJoin, TakesItsTableFromItsColumn) {
    SmallQuery small;
    const auto join = small.library.NewZDJoin();
    join->LeftColumn(SmallQuery::id(small.orders));
    EXPECT_EQ(join->LeftTable(), small.orders);
}

TEST(AJoin, RefusesAColumnOfAnotherTableThanItsEnds) {
    SmallQuery small;
    const auto join = small.newJoin(small.orders, small.customers);
    EXPECT_EQ(errorOf([&] { join->LeftColumn(SmallQuery::id(small.customers)); }), 5);
    EXPECT_EQ(join->LeftColumn(), SmallQuery::id(small.orders));
}

TEST(AJoin, LosesTheColumnOfAnEndThatGoesToAnotherTable) {
    SmallQuery small;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    join->LeftTable(small.orders); // the same
    EXPECT_EQ(join->LeftColumn(), SmallQuery::id(small.orders));
    join->LeftTable(small.customers);
    EXPECT_EQ(join->LeftColumn(), nullptr);
    join->LeftColumn(SmallQuery::id(small.customers));
    EXPECT_EQ(join->LeftColumn(), SmallQuery::id(small.customers));
}

TEST(AJoin, StaysWithItsQueryOnceItIsStored) {
    SmallQuery small;
    SmallQuery other;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    EXPECT_EQ(errorOf([&] { join->LeftTable(other.orders); }), 5);
    EXPECT_EQ(errorOf([&] { join->RightColumn(SmallQuery::id(other.customers)); }), 5);
    EXPECT_EQ(errorOf([&] { join->LeftTable({}); }), 91);
    EXPECT_EQ(errorOf([&] { join->RightColumn({}); }), 91);
    EXPECT_EQ(join->LeftTable(), small.orders);
    EXPECT_EQ(join->RightColumn(), SmallQuery::id(small.customers));
}

TEST(AJoin, KeepsTypesAndOperatorsOfTheKnownCodesOnly) {
    SmallQuery small;
    const auto join = small.newJoin(small.orders, small.customers);
    join->JoinType(3);
    join->CompareOperator(5);
    EXPECT_EQ(errorOf([&] { join->JoinType(4); }), 380);
    EXPECT_EQ(errorOf([&] { join->JoinType(-1); }), 380);
    EXPECT_EQ(errorOf([&] { join->CompareOperator(6); }), 380);
    EXPECT_EQ(errorOf([&] { join->CompareOperator(-1); }), 380);
    EXPECT_EQ(join->JoinType(), 3);
    EXPECT_EQ(join->CompareOperator(), 5);
}

TEST(AJoin, StillKnowsItsTablesAfterItWasRemoved) {
    SmallQuery small;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    small.query->Joins().Remove(join->Key());
    EXPECT_EQ(join->LeftTable(), small.orders);
    EXPECT_EQ(join->Key(), u"j1");
}

TEST(AJoin, HeldByAHostHasNoEndOnADeletedTable) {
    SmallQuery small;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    small.query->DeleteTable(small.customers);
    EXPECT_EQ(join->LeftTable(), small.orders);
    EXPECT_EQ(join->RightTable(), nullptr);
    EXPECT_EQ(join->RightColumn(), nullptr);
}

TEST(AJoin, HeldByAHostHasNoEndsOnceItsQueryIsGone) {
    SmallQuery small;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    small.query.reset(); // the host still holds the tables
    EXPECT_EQ(join->LeftTable(), nullptr);
    EXPECT_EQ(join->LeftColumn(), nullptr);
    EXPECT_EQ(join->RightTable(), nullptr);
    EXPECT_EQ(join->RightColumn(), nullptr);
    EXPECT_EQ(join->Key(), u"j1");
    join->JoinType(1);
    EXPECT_EQ(join->JoinType(), 1);
}

TEST(AJoin, OfAGoneQueryIsRefusedByAnother) {
    SmallQuery small;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    small.query.reset();
    SmallQuery other;
    EXPECT_EQ(errorOf([&] { other.query->AddJoin(join); }), 5);
    EXPECT_EQ(other.query->Joins().Count(), 0);
}

TEST(AJoin, DoesNotKeepItsTablesAlive) {
    SmallQuery small;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.orders));
    const std::weak_ptr<model::Table> table = small.orders;
    small.orders.reset();
    EXPECT_FALSE(table.expired());
    small.query.reset();
    EXPECT_TRUE(table.expired());
}
