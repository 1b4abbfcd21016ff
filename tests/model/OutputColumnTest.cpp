#include "Expect.h"
#include "SmallQuery.h"

#include <Zandor/sql/Builder.h>

#include <vector>

using namespace zandor;

using platform::String;
using DefinitionRef = platform::Ref<TalvikZandorLib::ZDColumnDefinition>;

namespace {

/// Three output columns: orders.id, customers.id and orders.name.
class OutputColumns : public testing::Test {
protected:
    OutputColumns() {
        add(SmallQuery::id(small.orders));
        add(SmallQuery::id(small.customers));
        add(small.orders->columnNamed(u"name"));
    }

    DefinitionRef add(const platform::Ref<TalvikZandorLib::ZDColumn>& column) {
        const auto definition = small.library.NewZDColumnDefinition();
        definition->Column(column);
        return query.AddColumnDefinition(definition);
    }

    DefinitionRef at(std::int32_t position) { return query.ColumnDefinitions().Item(position); }

    std::vector<String> keys() {
        std::vector<String> result;
        for (const auto& each : platform::Each(query.ColumnDefinitions()))
            result.push_back(each->Key());
        return result;
    }

    std::string select() {
        const auto sql = model::sql::statementText(query, model::sql::Dialect::SQLite,
                                                   model::sql::ValueForm::literal);
        const std::string text = platform::toUtf8(sql.text);
        return text.substr(0, text.find("\nFROM"));
    }

    SmallQuery small;
    model::Query& query = *small.query;
};

using Keys = std::vector<String>;

} // namespace

TEST_F(OutputColumns, AreNamedAfterTheirTableAndColumn) {
    EXPECT_EQ(at(1)->Column()->Name(), u"orders.id");
    EXPECT_EQ(at(2)->Column()->Name(), u"customers.id");
    EXPECT_EQ(add(small.orders->Columns().Item(1))->Column()->Name(), u"orders.*");
}

TEST_F(OutputColumns, BearTheNewNameOfARenamedTable) {
    const auto column = at(1)->Column();
    query.renameTable(small.orders, u"sales");
    EXPECT_EQ(column->Name(), u"sales.id");
    EXPECT_EQ(at(3)->Column()->Name(), u"sales.name");
    EXPECT_EQ(at(2)->Column()->Name(), u"customers.id");
}

TEST_F(OutputColumns, AreTheColumnsOfTheTableInEverythingButTheirNames) {
    const auto column = SmallQuery::id(small.orders);
    const auto shown = at(1)->Column();
    EXPECT_EQ(shown->Key(), column->Key());
    EXPECT_TRUE(shown->Marker());
    EXPECT_FALSE(at(3)->Column()->Marker());
    shown->Selected(true);
    EXPECT_TRUE(column->Selected());
    column->Selected(false);
    EXPECT_FALSE(shown->Selected());
    shown->activated(1);
    EXPECT_EQ(column->activated(), 1);
    EXPECT_EQ(column->Name(), u"id") << "lists and joins name it without its table";
}

TEST_F(OutputColumns, OfOneColumnAreOneObject) {
    EXPECT_EQ(at(1)->Column(), at(1)->Column());
    EXPECT_EQ(at(1)->Column(), add(SmallQuery::id(small.orders))->Column());
    EXPECT_NE(at(1)->Column(), at(3)->Column());
}

TEST_F(OutputColumns, CanBeCopiedToNewDefinitionsAndJoins) {
    const auto copy = add(at(2)->Column());
    EXPECT_EQ(copy->Column(), at(2)->Column());
    const auto join = small.library.NewZDJoin();
    join->LeftColumn(at(1)->Column());
    join->RightColumn(at(2)->Column());
    query.AddJoin(join);
    EXPECT_EQ(join->LeftColumn(), SmallQuery::id(small.orders));
    EXPECT_EQ(join->RightTable(), small.customers);
    SmallQuery other;
    const auto stranger = other.library.NewZDColumnDefinition();
    stranger->Column(at(1)->Column());
    EXPECT_EQ(errorOf([&] { other.query->AddColumnDefinition(stranger); }), 5);
}

TEST_F(OutputColumns, HeldByAHostOutliveTheirTableAndTheirQuery) {
    const auto column = at(1)->Column();
    const auto definition = at(1);
    query.DeleteTable(small.orders);
    EXPECT_EQ(definition->Column(), nullptr);
    EXPECT_EQ(column->Name(), u"id");
    small.orders.reset();
    small.query.reset();
    EXPECT_EQ(column->Key(), u"c2");
    EXPECT_EQ(column->Name(), u"id");
}

TEST_F(OutputColumns, ComeOutInTheOrderInWhichTheyStand) {
    EXPECT_EQ(select(), "SELECT\n    orders.id,\n    customers.id,\n    orders.name");
    query.StandsBehind(at(3), at(1));
    EXPECT_EQ(keys(), (Keys{u"x1", u"x3", u"x2"}));
    EXPECT_EQ(select(), "SELECT\n    orders.id,\n    orders.name,\n    customers.id");
    query.StandsBehind(at(3), {});
    EXPECT_EQ(keys(), (Keys{u"x2", u"x1", u"x3"}));
    query.StandsBehind(at(1), at(3));
    EXPECT_EQ(keys(), (Keys{u"x1", u"x3", u"x2"}));
    query.StandsBehind(at(2), at(1));
    EXPECT_EQ(keys(), (Keys{u"x1", u"x3", u"x2"})) << "where it stands already";
}

TEST_F(OutputColumns, SortTheRowsInTheOrderInWhichTheyStand) {
    at(1)->SortOrder(1);
    at(3)->SortOrder(2);
    query.StandsBehind(at(3), {});
    const auto sql = model::sql::statementText(query, model::sql::Dialect::SQLite,
                                               model::sql::ValueForm::literal);
    EXPECT_NE(sql.text.find(u"ORDER BY orders.name DESC, orders.id"), String::npos)
        << platform::toUtf8(sql.text);
}

TEST_F(OutputColumns, StandOnlyBehindOthersOfTheirQuery) {
    SmallQuery other;
    const auto stranger = other.query->AddColumnDefinition(other.newDefinition(other.orders));
    EXPECT_EQ(errorOf([&] { query.StandsBehind({}, at(1)); }), 91);
    EXPECT_EQ(errorOf([&] { query.StandsBehind(stranger, at(1)); }), 5);
    EXPECT_EQ(errorOf([&] { query.StandsBehind(at(1), stranger); }), 5);
    EXPECT_EQ(errorOf([&] { query.StandsBehind(at(2), at(2)); }), 5);
    EXPECT_EQ(errorOf([&] { query.StandsBehind(small.library.NewZDColumnDefinition(), {}); }), 5);
    EXPECT_EQ(keys(), (Keys{u"x1", u"x2", u"x3"}));
}
