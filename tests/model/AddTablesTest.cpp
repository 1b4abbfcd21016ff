#include "model/TemporaryDatabase.h"

#include <Zandor/reader/addTables.h>

#include <gtest/gtest.h>

using namespace zandor;

using platform::Each;
using platform::String;
using reader::TableId;

namespace {

/// The joins of a query as text: "orders.customer = customers.id".
std::vector<std::string> joins(model::Query& query) {
    std::vector<std::string> result;
    for (const auto& join : Each<TalvikZandorLib::ZDJoin>(query.Joins())) {
        const String text = join->LeftTable()->Name() + u"." + join->LeftColumn()->Name() +
                            (join->CompareOperator() == 0 ? u" = " : u" ? ") +
                            join->RightTable()->Name() + u"." + join->RightColumn()->Name();
        result.push_back(platform::toUtf8(text));
    }
    return result;
}

class AddingTables : public testing::Test {
protected:
    using Joins = std::vector<std::string>;

    reader::Result<std::vector<platform::Ref<model::Table>>> add(const std::vector<String>& names) {
        std::vector<TableId> ids;
        for (const String& name : names) ids.push_back({u"", name});
        return reader::addTables(query, database.reader(), ids, 16000);
    }

    TemporaryDatabase database{
        {"CREATE TABLE customers (id INTEGER PRIMARY KEY, name TEXT)",
         "CREATE TABLE orders (id INTEGER PRIMARY KEY, customer REFERENCES Customers (ID))",
         "CREATE TABLE lines (o REFERENCES orders, pos, PRIMARY KEY (o, pos))",
         "CREATE TABLE parts (o, pos, FOREIGN KEY (o, pos) REFERENCES lines)",
         "CREATE TABLE staff (id INTEGER PRIMARY KEY, boss REFERENCES staff)",
         "CREATE TABLE odd (x REFERENCES customers (no_such_column))",
         "CREATE TABLE bills (payer REFERENCES customers, Buyer REFERENCES customers, a REFERENCES "
         "customers (gone), again REFERENCES customers (gone), taker REFERENCES customers)",
         "CREATE TABLE teams (id INTEGER PRIMARY KEY, head REFERENCES members)",
         "CREATE TABLE members (id INTEGER PRIMARY KEY, team REFERENCES teams)"}};
    model::Query query;
};

} // namespace

TEST_F(AddingTables, PutsThemIntoTheQueryInTheirOrderWithAllColumns) {
    const auto added = add({u"orders", u"customers"});
    ASSERT_TRUE(added) << added.error().toStdString();
    ASSERT_EQ(added->size(), 2U);
    EXPECT_EQ(query.Tables().Item(1), (*added)[0]);
    EXPECT_EQ((*added)[0]->Name(), u"orders");
    EXPECT_EQ((*added)[0]->Columns().Count(), 3);
    EXPECT_TRUE((*added)[1]->columnNamed(u"id")->Marker());
}

TEST_F(AddingTables, JoinsThemByTheirForeignKeysWhateverTheCaseOfTheNames) {
    ASSERT_TRUE(add({u"customers", u"orders", u"lines"}));
    EXPECT_EQ(joins(query), (Joins{"orders.customer = customers.id", "lines.o = orders.id"}));
}

TEST_F(AddingTables, MakesOneJoinForEachPairOfACompositeKey) {
    ASSERT_TRUE(add({u"lines", u"parts"}));
    EXPECT_EQ(joins(query), (Joins{"parts.o = lines.o", "parts.pos = lines.pos"}));
}

TEST_F(AddingTables, JoinsThemToTheTablesThatStandThereAlready) {
    ASSERT_TRUE(add({u"orders"}));
    ASSERT_TRUE(add({u"customers"}));
    ASSERT_TRUE(add({u"lines"}));
    EXPECT_EQ(joins(query), (Joins{"orders.customer = customers.id", "lines.o = orders.id"}));
}

TEST_F(AddingTables, DoesNotBringBackAJoinThatTheUserDeleted) {
    ASSERT_TRUE(add({u"orders", u"customers"}));
    query.Joins().Remove(query.Joins().Item(1)->Key());
    ASSERT_TRUE(add({u"lines"}));
    EXPECT_EQ(joins(query), Joins{"lines.o = orders.id"});
}

TEST_F(AddingTables, JoinsOnlyTheFirstInstanceOfATable) {
    ASSERT_TRUE(add({u"orders", u"customers", u"customers"}));
    EXPECT_EQ(query.Tables().Item(3)->Name(), u"customers_1");
    EXPECT_EQ(joins(query), Joins{"orders.customer = customers.id"});
    ASSERT_TRUE(add({u"customers"}));
    EXPECT_EQ(joins(query).size(), 1U);
}

TEST_F(AddingTables, JoinsATableThatRefersToItselfToItsSecondInstanceOnly) {
    ASSERT_TRUE(add({u"staff"}));
    EXPECT_EQ(joins(query), Joins{});
    ASSERT_TRUE(add({u"staff"}));
    EXPECT_EQ(joins(query), Joins{"staff.boss = staff_1.id"});
}

TEST_F(AddingTables, LeavesOutAKeyToAColumnThatIsNotThere) {
    ASSERT_TRUE(add({u"odd", u"customers"}));
    EXPECT_EQ(joins(query), Joins{});
}

TEST_F(AddingTables, DrawsOneOfSeveralKeysBetweenTwoTablesAndTellsOfTheOthers) {
    std::vector<reader::LeftOut> leftOut;
    ASSERT_TRUE(reader::addTables(query, database.reader(), {{u"", u"customers"}, {u"", u"bills"}},
                                  16000, &leftOut));
    EXPECT_EQ(joins(query), (Joins{"bills.Buyer = customers.id"}));
    ASSERT_EQ(leftOut.size(), 2U);
    for (const auto& each : leftOut) EXPECT_EQ(each.drawn.columns.front().first, u"Buyer");
    EXPECT_EQ(leftOut[0].other.columns.front().first, u"payer");
    EXPECT_EQ(leftOut[1].other.columns.front().first, u"taker");
    // Also when the one that is referred to comes later.
    ASSERT_TRUE(add({u"orders"}));
    EXPECT_EQ(joins(query).size(), 2U);
}

TEST_F(AddingTables, LeadsEachOfSeveralKeysToAnInstanceOfItsOwn) {
    ASSERT_TRUE(add({u"bills"}));
    ASSERT_TRUE(add({u"customers"}));
    ASSERT_TRUE(add({u"customers"}));
    EXPECT_EQ(joins(query), (Joins{"bills.Buyer = customers.id", "bills.payer = customers_1.id"}));
    // A key that is drawn stays where it is, whoever drew it.
    query.Joins().Remove(query.Joins().Item(1)->Key());
    const auto join = platform::makeRef<model::Join>();
    const auto table = [&](std::int32_t n) {
        return std::static_pointer_cast<model::Table>(query.Tables().Item(n));
    };
    join->LeftColumn(table(2)->columnNamed(u"id"));
    join->RightColumn(table(1)->columnNamed(u"taker"));
    query.AddJoin(join);
    ASSERT_TRUE(add({u"customers"}));
    EXPECT_EQ(joins(query), (Joins{"bills.payer = customers_1.id", "customers.id = bills.taker",
                                   "bills.Buyer = customers_2.id"}));
    ASSERT_TRUE(add({u"customers"}));
    EXPECT_EQ(joins(query).size(), 3U);
}

TEST_F(AddingTables, LeadsEachKeyToAnInstanceWhenAllComeAtOnce) {
    std::vector<reader::LeftOut> leftOut;
    const TableId customers{u"", u"customers"};
    ASSERT_TRUE(reader::addTables(query, database.reader(),
                                  {customers, {u"", u"bills"}, customers, customers}, 16000,
                                  &leftOut));
    EXPECT_EQ(joins(query), (Joins{"bills.Buyer = customers.id", "bills.payer = customers_1.id",
                                   "bills.taker = customers_2.id"}));
    EXPECT_TRUE(leftOut.empty());
}

TEST_F(AddingTables, DrawsOneOfTwoKeysThatRunAgainstEachOther) {
    std::vector<reader::LeftOut> leftOut;
    ASSERT_TRUE(reader::addTables(query, database.reader(), {{u"", u"members"}, {u"", u"teams"}},
                                  16000, &leftOut));
    EXPECT_EQ(joins(query), (Joins{"teams.head = members.id"}));
    ASSERT_EQ(leftOut.size(), 1U);
    EXPECT_EQ(leftOut[0].other.child.name, u"members");
}

TEST_F(AddingTables, ChangesNothingWhenOneOfThemIsNotThere) {
    const auto added = add({u"customers", u"gone"});
    EXPECT_EQ(added.error().toStdString(),
              "The table \"gone\" is not in the database; read the list of tables afresh.");
    EXPECT_EQ(query.Tables().Count(), 0);
}

TEST_F(AddingTables, PlacesThemClearOfEachOtherAndOfThoseThatHaveAPlace) {
    ASSERT_TRUE(add({u"customers", u"orders", u"staff"}));
    query.Tables().Item(1)->Left(900); // the user moves one
    query.Tables().Item(1)->Top(700);
    ASSERT_TRUE(add({u"lines", u"parts", u"odd"}));
    for (std::int32_t i = 1; i <= query.Tables().Count(); ++i) {
        const auto a = query.Tables().Item(i);
        EXPECT_GT(a->Width(), 0);
        EXPECT_GT(a->Height(), 0);
        EXPECT_LE(a->Left() + a->Width(), 16000);
        for (std::int32_t j = 1; j < i && i > 3; ++j) {
            const auto b = query.Tables().Item(j);
            EXPECT_TRUE(a->Left() >= b->Left() + b->Width() + 900 ||
                        b->Left() >= a->Left() + a->Width() + 900 ||
                        a->Top() >= b->Top() + b->Height() || b->Top() >= a->Top() + a->Height())
                << i << " and " << j;
        }
    }
}

TEST_F(AddingTables, OfNoNamesAddsNothing) {
    const auto added = add({});
    ASSERT_TRUE(added);
    EXPECT_TRUE(added->empty());
}
