#include "../SmallQuery.h"

#include <Zandor/sql/Builder.h>

#include <gtest/gtest.h>

using namespace zandor;

// What stands in the statement for a saved query; which rows it gives, the corpus shows.

namespace {

using model::Finding;
using model::SavedQuery;
using model::sql::Dialect;
using platform::Ref;
using platform::String;
using platform::toUtf8;

class SavedQueries : public testing::Test {
protected:
    static Ref<model::Query> reading(const String& table) {
        auto query = platform::makeRef<model::Query>();
        query->addTable(SmallQuery::described(table));
        return query;
    }
    static Ref<model::ColumnDefinition> add(const Ref<model::Query>& to, const String& table,
                                            const String& column) {
        auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->Column(to->tableNamed(table)->columnNamed(column));
        to->AddColumnDefinition(definition);
        return definition;
    }
    static SavedQuery saved(const Ref<model::Query>& query) { return {u"", query->record()}; }
    std::string sql(Dialect dialect = Dialect::SQLite) {
        return toUtf8(
            model::sql::statementText(*query, dialect, model::sql::ValueForm::literal).text);
    }
    std::string findings(Dialect dialect = Dialect::SQLite) {
        std::string all;
        for (const auto& finding : model::sql::validate(*query, dialect))
            all += toUtf8(finding.table + u": " + finding.text()) +
                   (finding.isError() ? " (error)\n" : "\n");
        return all;
    }

    Ref<model::Query> query = platform::makeRef<model::Query>();
};

} // namespace

TEST_F(SavedQueries, StandInTheStatementAsItWouldBeAlone) {
    const auto inner = reading(u"orders");
    add(inner, u"orders", u"id")->AddCriterium(u"> 3", u"4");
    query->addTable(SmallQuery::described(u"items"));
    query->addQuery(u"late", saved(inner));
    add(query, u"late", u"id");
    EXPECT_EQ(sql(), "SELECT\n"
                     "    late.id\n"
                     "FROM items\n"
                     "    CROSS JOIN (\n"
                     "        SELECT\n"
                     "            orders.id\n"
                     "        FROM orders\n"
                     "        WHERE orders.id > 3\n"
                     "    ) AS late");
}

TEST_F(SavedQueries, StandFirstWithoutIndentation) {
    query->addQuery(u"late", saved(reading(u"orders")));
    EXPECT_EQ(sql(), "SELECT\n"
                     "    late.*\n"
                     "FROM (\n"
                     "    SELECT\n"
                     "        orders.id,\n"
                     "        orders.name\n"
                     "    FROM orders\n"
                     ") AS late");
}

TEST_F(SavedQueries, ThatAreTheSameAreWrittenOnceBeforeTheStatement) {
    const auto inner = reading(u"orders");
    query->addQuery(u"late", saved(inner));
    query->addQuery(u"orders", saved(inner));
    query->addTable(SmallQuery::described(u"late_1"));
    add(query, u"orders", u"id");
    EXPECT_EQ(sql(), "WITH late AS (\n"
                     "    SELECT\n"
                     "        orders.id,\n"
                     "        orders.name\n"
                     "    FROM orders\n"
                     ")\n"
                     "SELECT\n"
                     "    orders.id\n"
                     "FROM late\n"
                     "    CROSS JOIN late AS orders\n"
                     "    CROSS JOIN late_1");
}

TEST_F(SavedQueries, HideNoTableOfTheDatabase) {
    const auto inner = reading(u"orders");
    query->addQuery(u"ORDERS", saved(inner));
    query->addQuery(u"again", saved(inner));
    add(query, u"again", u"id");
    EXPECT_EQ(sql(), "WITH ORDERS_1 AS (\n"
                     "    SELECT\n"
                     "        orders.id,\n"
                     "        orders.name\n"
                     "    FROM orders\n"
                     ")\n"
                     "SELECT\n"
                     "    again.id\n"
                     "FROM ORDERS_1 AS ORDERS\n"
                     "    CROSS JOIN ORDERS_1 AS again");
}

TEST_F(SavedQueries, AreSortedOnlyWhereTheyAreCutOff) {
    const auto inner = reading(u"orders");
    add(inner, u"orders", u"id")->SortOrder(2);
    const auto table = query->addQuery(u"late", saved(inner));
    EXPECT_EQ(sql().find("ORDER BY"), std::string::npos);
    inner->options({.first = 3});
    query->refreshQuery(table, saved(inner));
    EXPECT_NE(sql().find("    ORDER BY orders.id DESC\n    LIMIT 3\n) AS late"), std::string::npos)
        << sql();
    EXPECT_NE(sql(Dialect::SqlServer)
                  .find("    ORDER BY orders.id DESC\n    OFFSET 0 ROWS\n    FETCH NEXT 3 ROWS "
                        "ONLY\n) AS late"),
              std::string::npos)
        << sql(Dialect::SqlServer);
}

TEST_F(SavedQueries, GiveEveryColumnANameOfItsOwn) {
    const auto inner = reading(u"orders");
    inner->addTable(SmallQuery::described(u"customers"));
    add(inner, u"customers", u"id");
    add(inner, u"orders", u"id");
    const auto all = platform::makeRef<model::ColumnDefinition>();
    all->Column(inner->tableNamed(u"orders")->Columns().Item(1));
    inner->AddColumnDefinition(all);
    std::string names;
    for (const auto& column : model::sql::outputColumns(*inner)) names += toUtf8(column.name) + ' ';
    EXPECT_EQ(names, "id id_1 id_2 name ");
}

TEST_F(SavedQueries, SayWhatThereIsToSayOfThem) {
    const auto inner = reading(u"orders");
    add(inner, u"orders", u"id")->AddCriterium(u"> x", u"4");
    add(inner, u"orders", u"id");
    const auto around = platform::makeRef<model::Query>();
    around->addQuery(u"late", saved(inner));
    query->addQuery(u"some", saved(around));
    EXPECT_EQ(findings(), "t1: In some: In late: orders.id: At character 3: this is no number, "
                          "write it like 12 or 1.5. (error)\n");
    EXPECT_FALSE(model::sql::statementText(*query, Dialect::SQLite, model::sql::ValueForm::bound)
                     .runnable());
}

TEST_F(SavedQueries, SayWhichNamesADialectCannotCarry) {
    query->addQuery(u"some", saved(reading(String(70, u'n'))));
    EXPECT_EQ(findings(), "");
    EXPECT_EQ(findings(Dialect::PostgreSQL).substr(0, 13), "t1: In some: ");
    EXPECT_EQ(sql(Dialect::PostgreSQL), "");
}

TEST_F(SavedQueries, AreReadAgainWhereTheirColumnsAreOthers) {
    query->addQuery(u"some", saved(reading(u"orders")));
    auto record = query->record();
    record.tables.front().columns.pop_back();
    query = model::Query::restored(record);
    EXPECT_EQ(findings(), "t1: some has other columns here than its query gives: read it again "
                          "from its file. (error)\n");
    record.tables.front().query = SavedQuery();
    query = model::Query::restored(record);
    EXPECT_EQ(findings(), "t1: In some: The query has no tables: add one first. (error)\n");
}

// Only a damaged file can bring such a query into another one.
TEST_F(SavedQueries, OfWhichNothingComesOutAreAFinding) {
    const auto inner = reading(u"orders");
    query->addQuery(u"late", saved(inner));
    auto record = query->record();
    auto empty = inner->record();
    empty.tables.front().columns.resize(1);
    record.tables.front().query = model::SavedQueryRef(SavedQuery{u"", empty});
    query = model::Query::restored(record);
    EXPECT_NE(findings().find("No column comes out of that query"), std::string::npos)
        << findings();
}
