#include "model/Expect.h"
#include "model/SmallQuery.h"

using namespace zandor;

TEST(ATable, BeginsWithTheEntryForAllColumns) {
    SmallQuery small;
    auto& columns = small.orders->Columns();
    ASSERT_EQ(columns.Count(), 3);
    EXPECT_EQ(columns.Item(1)->Name(), u"*");
    EXPECT_FALSE(columns.Item(1)->Marker());
    EXPECT_EQ(columns.Item(2)->Name(), u"id");
    EXPECT_EQ(columns.Item(3)->Name(), u"name");
}

TEST(ATable, MarksTheColumnsOfItsPrimaryKey) {
    SmallQuery small;
    EXPECT_TRUE(small.orders->columnNamed(u"id")->Marker());
    EXPECT_FALSE(small.orders->columnNamed(u"name")->Marker());
}

TEST(ATable, KeepsWhatTheDatabaseSaysOfItsColumns) {
    SmallQuery small;
    const auto& description = small.orders->columnNamed(u"id")->description();
    EXPECT_EQ(description.type, model::ColumnType::Integer);
    EXPECT_EQ(description.declaredType, u"INTEGER");
}

TEST(ATable, FindsAColumnWhoseNameDiffersInCaseOnlyWhenNoneFitsExactly) {
    model::Query query;
    const auto table =
        query.addTable({u"", u"t", {{.name = u"ID"}, {.name = u"id"}, {.name = u"É"}}});
    EXPECT_EQ(table->columnNamed(u"id")->Name(), u"id");
    EXPECT_EQ(table->columnNamed(u"Id")->Name(), u"ID");
    EXPECT_EQ(table->columnNamed(u"é"), nullptr);
    EXPECT_EQ(table->columnNamed(u"*"), nullptr);
}

TEST(ATable, IsUnplacedWhenNew) {
    SmallQuery small;
    EXPECT_EQ(small.orders->Left(), -1);
    EXPECT_EQ(small.orders->Top(), -1);
    EXPECT_EQ(small.orders->Width(), 0);
    EXPECT_EQ(small.orders->Height(), 0);
}

TEST(ATable, KeepsItsPlacementToTheNearestTwipWithHalvesToEven) {
    SmallQuery small;
    auto& table = *small.orders;
    table.Left(10.5F);
    table.Top(11.5F);
    table.Width(2000.4F);
    table.Height(-0.6F);
    EXPECT_EQ(table.Left(), 10);
    EXPECT_EQ(table.Top(), 12);
    EXPECT_EQ(table.Width(), 2000);
    EXPECT_EQ(table.Height(), -1);
}

TEST(ATable, StaysWhereItIsWhenAPlaceDoesNotFit32Bits) {
    SmallQuery small;
    small.orders->Left(300);
    EXPECT_EQ(errorOf([&] { small.orders->Left(3e9F); }), 6);
    EXPECT_EQ(small.orders->Left(), 300);
}

TEST(ATable, KeepsItsFlags) {
    SmallQuery small;
    small.orders->Selected(1);
    EXPECT_EQ(small.orders->Selected(), 1);
    const auto column = small.orders->columnNamed(u"name");
    column->Selected(true);
    column->activated(1);
    EXPECT_TRUE(column->Selected());
    EXPECT_EQ(std::as_const(*column).activated(), 1);
}

TEST(ATable, GetsANameOfItsOwnWhenItStandsInTheQuerySeveralTimes) {
    SmallQuery small;
    const auto second = small.query->addTable(SmallQuery::described(u"orders"));
    const auto third = small.query->addTable(SmallQuery::described(u"orders"));
    EXPECT_EQ(small.orders->Name(), u"orders");
    EXPECT_EQ(second->Name(), u"orders_1");
    EXPECT_EQ(third->Name(), u"orders_2");
    EXPECT_EQ(third->sourceName(), u"orders");
}

TEST(ATable, DoesNotGetANameThatAnotherSourceHas) {
    model::Query query;
    query.addTable({u"", u"orders_1", {}});
    query.addTable({u"", u"orders", {}});
    EXPECT_EQ(query.addTable({u"", u"orders", {}})->Name(), u"orders_2");
}

TEST(ATable, DoesNotGetANameThatADatabaseTakesForAnother) {
    model::Query query;
    query.addTable({u"sales", u"Orders", {}});
    const auto archived = query.addTable({u"archive", u"orders", {}});
    EXPECT_EQ(archived->Name(), u"orders_1");
    EXPECT_EQ(archived->schema(), u"archive");
}

TEST(ATable, MayTakeTheNameOfADeletedOne) {
    SmallQuery small;
    small.query->DeleteTable(small.orders);
    EXPECT_EQ(small.query->addTable(SmallQuery::described(u"orders"))->Name(), u"orders");
}

TEST(ATable, NeedsASourceWithAName) {
    model::Query query;
    EXPECT_EQ(errorOf([&] { query.addTable({u"", u"", {}}); }), 5);
    EXPECT_EQ(query.Tables().Count(), 0);
}

TEST(ATable, CanBeRenamedAndKeepsWhatHangsOnIt) {
    SmallQuery small;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    small.query->renameTable(small.orders, u"purchases");
    EXPECT_EQ(join->LeftTable()->Name(), u"purchases");
    EXPECT_EQ(small.orders->sourceName(), u"orders");
    small.query->renameTable(small.orders, u"Purchases"); // its own name in another case
    EXPECT_EQ(small.orders->Name(), u"Purchases");
}

TEST(ATable, RefusesANameThatIsEmptyOrTaken) {
    SmallQuery small;
    SmallQuery other;
    EXPECT_EQ(errorOf([&] { small.query->renameTable(small.orders, u""); }), 5);
    EXPECT_EQ(errorOf([&] { small.query->renameTable(small.orders, u"CUSTOMERS"); }), 457);
    EXPECT_EQ(errorOf([&] { small.query->renameTable(other.orders, u"mine"); }), 5);
    EXPECT_EQ(errorOf([&] { small.query->renameTable({}, u"mine"); }), 91);
    EXPECT_EQ(small.orders->Name(), u"orders");
    EXPECT_EQ(other.orders->Name(), u"orders");
}

TEST(ATable, HasTheColumnsActivatedThatItIsToldOfAndNoOthers) {
    SmallQuery small;
    const auto id = small.orders->columnNamed(u"id");
    const auto name = small.orders->columnNamed(u"name");
    name->activated(1);
    EXPECT_TRUE(small.orders->Activate({id->Key()}));
    EXPECT_EQ(id->activated(), 1);
    EXPECT_EQ(name->activated(), 0);
    EXPECT_EQ(errorOf([&] { small.orders->Activate({name->Key(), u"none"}); }), 5);
    EXPECT_EQ(id->activated(), 0);
    EXPECT_EQ(name->activated(), 1);
}
