#include "OneServer.h"

#include <Zandor/reader/addTables.h>
#include <Zandor/reader/rows.h>

#include <algorithm>

using namespace zandor;

namespace {

using model::ColumnType;
using Columns = std::vector<model::ColumnDescription>;

QString sql(const char* text) { return QString::fromUtf8(text); }

/// Each test has a schema of its own, dropped at its end, in a session that begins in it.
class PostgresReader : public testing::Test {
protected:
    void SetUp() override {
        runOnServer({sql("DROP SCHEMA IF EXISTS aside CASCADE"), sql("DROP SCHEMA public CASCADE"),
                     sql("CREATE SCHEMA public")});
    }

    reader::DatabaseReader& schema() {
        if (!mReader) {
            auto opened = reader::openDatabase(serverAddress());
            if (!opened) throw std::runtime_error(opened.error().toStdString());
            mConnection = std::make_unique<reader::Connection>(std::move(*opened));
            mReader = reader::makeReader(mConnection->database());
        }
        return *mReader;
    }

    std::vector<reader::TableEntry> tables() {
        const auto tables = schema().tables();
        EXPECT_TRUE(tables) << tables.error().toStdString();
        return tables ? *tables : std::vector<reader::TableEntry>();
    }

    Columns columns(const reader::TableId& id) {
        const auto table = schema().table(id);
        EXPECT_TRUE(table) << table.error().toStdString();
        return table ? table->columns : Columns();
    }

    std::vector<reader::ForeignKey> foreignKeys(const reader::TableId& id) {
        const auto keys = schema().foreignKeys(id);
        EXPECT_TRUE(keys) << keys.error().toStdString();
        return keys ? *keys : std::vector<reader::ForeignKey>();
    }

private:
    std::unique_ptr<reader::Connection> mConnection;
    std::unique_ptr<reader::DatabaseReader> mReader;
};

} // namespace

TEST_F(PostgresReader, ListsTablesAndViewsOfAllSchemasAndNoneOfTheEnginesOwn) {
    runOnServer({sql("CREATE SCHEMA aside"), sql("CREATE TABLE b (x int)"),
                 sql("CREATE TABLE aside.b (x int)"), sql("CREATE VIEW \"A v\" AS SELECT 1 AS x"),
                 sql("CREATE MATERIALIZED VIEW m AS SELECT 1 AS x"),
                 sql("CREATE TABLE parts (x int) PARTITION BY LIST (x)"),
                 sql("CREATE TABLE part PARTITION OF parts FOR VALUES IN (1)"),
                 sql("CREATE INDEX i ON b (x)"), sql("CREATE SEQUENCE s")});
    EXPECT_EQ(tables(), (std::vector<reader::TableEntry>{{{u"", u"A v"}, true},
                                                         {{u"aside", u"b"}, false},
                                                         {{u"", u"b"}, false},
                                                         {{u"", u"m"}, true},
                                                         {{u"", u"parts"}, false}}));
}

TEST_F(PostgresReader, NamesTheSchemaOfATableThatAnotherOneHides) {
    runOnServer({sql("CREATE TABLE pg_class (x int)")}); // the engine's own comes first
    EXPECT_EQ(tables(), (std::vector<reader::TableEntry>{{{u"public", u"pg_class"}, false}}));
    EXPECT_EQ(columns({u"public", u"pg_class"}).size(), 1U);
}

TEST_F(PostgresReader, OrdersTablesByNameWithoutRegardToTheCaseOfLetters) {
    runOnServer({sql("CREATE TABLE \"b\" (x int)"), sql("CREATE TABLE \"A\" (x int)"),
                 sql("CREATE TABLE \"a\" (x int)"), sql("CREATE VIEW \"B_\" AS SELECT 1 AS x"),
                 sql("CREATE TABLE \"ä\" (x int)"), sql("CREATE TABLE \"Ä\" (x int)"),
                 sql("CREATE TABLE \"table_10\" (x int)"),
                 sql("CREATE TABLE \"TABLE_9\" (x int)")});
    std::vector<platform::String> names;
    for (const auto& entry : tables()) names.push_back(entry.id.name);
    EXPECT_EQ(names, (std::vector<platform::String>{u"A", u"a", u"b", u"B_", u"table_10",
                                                    u"TABLE_9", u"Ä", u"ä"}));
}

TEST_F(PostgresReader, ListsTablesWithLineBreaksInTheirNames) {
    const platform::String names[] = {u"\n", u"\n\n", u"a\n", u"a\n b", u"b\n\n \n", u"c"};
    for (const auto& name : names)
        runOnServer({sql("CREATE TABLE \"%1\" (x int)").arg(reader::toQt(name))});
    std::vector<platform::String> listed;
    for (const auto& entry : tables()) listed.push_back(entry.id.name);
    EXPECT_EQ(listed, std::vector<platform::String>(std::begin(names), std::end(names)));
}

TEST_F(PostgresReader, ReadsColumnsWithDeclaredTypeAndMeaning) {
    runOnServer({sql("CREATE TYPE mood AS ENUM ('sad', 'happy')"),
                 sql("CREATE TYPE pointer AS (x int, y int)"),
                 sql("CREATE DOMAIN amount AS numeric(10,2)"),
                 sql("CREATE DOMAIN price AS amount CHECK (value > 0)"),
                 sql("CREATE TABLE t (i integer, b bigint, n numeric(10,2), r real, "
                     "d double precision, v varchar(40), c char(2), x text, o boolean, da date, "
                     "ti time, tz timestamp with time zone, ts timestamp, y bytea, u uuid, "
                     "j jsonb, iv interval, a integer[], e mood, p price, ra int4range, "
                     "po pointer, pt point, gone int, g int GENERATED ALWAYS AS (i + 1) STORED, "
                     "me mood[], pl price[])"),
                 sql("ALTER TABLE t DROP COLUMN gone")});
    const Columns expected = {{u"i", ColumnType::Integer, u"integer", false},
                              {u"b", ColumnType::Integer, u"bigint", false},
                              {u"n", ColumnType::Decimal, u"numeric(10,2)", false},
                              {u"r", ColumnType::Decimal, u"real", false},
                              {u"d", ColumnType::Decimal, u"double precision", false},
                              {u"v", ColumnType::Text, u"character varying(40)", false},
                              {u"c", ColumnType::Text, u"character(2)", false},
                              {u"x", ColumnType::Text, u"text", false},
                              {u"o", ColumnType::Boolean, u"boolean", false},
                              {u"da", ColumnType::Date, u"date", false},
                              {u"ti", ColumnType::Time, u"time without time zone", false},
                              {u"tz", ColumnType::Timestamp, u"timestamp with time zone", false},
                              {u"ts", ColumnType::Timestamp, u"timestamp without time zone", false},
                              {u"y", ColumnType::Blob, u"bytea", false},
                              {u"u", ColumnType::Unknown, u"uuid", false},
                              {u"j", ColumnType::Unknown, u"jsonb", false},
                              {u"iv", ColumnType::Unknown, u"interval", false},
                              {u"a", ColumnType::Unknown, u"integer[]", false},
                              {u"e", ColumnType::Unknown, u"mood", false},
                              {u"p", ColumnType::Decimal, u"price", false},
                              {u"ra", ColumnType::Unknown, u"int4range", false},
                              {u"po", ColumnType::Unknown, u"pointer", false},
                              {u"pt", ColumnType::Unknown, u"point", false},
                              {u"g", ColumnType::Integer, u"integer", false},
                              {u"me", ColumnType::Unknown, u"mood[]", false},
                              {u"pl", ColumnType::Unknown, u"price[] AS numeric[]", false}};
    const Columns read = columns({u"", u"t"});
    ASSERT_EQ(read.size(), expected.size());
    for (std::size_t n = 0; n < read.size(); ++n)
        EXPECT_EQ(read[n], expected[n])
            << platform::toUtf8(read[n].name + u" " + read[n].declaredType);
}

TEST_F(PostgresReader, MarksTheColumnsOfAPrimaryKey) {
    runOnServer({sql("CREATE TABLE t (a int, b int, c int UNIQUE, PRIMARY KEY (b, a))"),
                 sql("CREATE VIEW v AS SELECT * FROM t"),
                 sql("CREATE MATERIALIZED VIEW m AS SELECT * FROM t")});
    const auto marks = [&](const char16_t* table) {
        std::vector<bool> marks;
        for (const auto& column : columns({u"", table})) marks.push_back(column.primaryKey);
        return marks;
    };
    EXPECT_EQ(marks(u"t"), (std::vector<bool>{true, true, false}));
    EXPECT_EQ(marks(u"v"), (std::vector<bool>{false, false, false}));
    EXPECT_EQ(marks(u"m"), (std::vector<bool>{false, false, false}));
}

TEST_F(PostgresReader, TakesNamesAsTheyStand) {
    runOnServer({sql("CREATE SCHEMA aside"),
                 sql("CREATE TABLE aside.\"a.b \"\"c\"\" 'd' %\" (\"x y\" int PRIMARY KEY)"),
                 sql("CREATE TABLE \"Mixed\" (x int)"), sql("CREATE TABLE mixed (y int, z int)"),
                 sql("CREATE TABLE nothing ()")});
    EXPECT_EQ(columns({u"aside", u"a.b \"c\" 'd' %"}).front().name, u"x y");
    EXPECT_EQ(columns({u"", u"Mixed"}).size(), 1U);
    EXPECT_EQ(columns({u"", u"mixed"}).size(), 2U);
    EXPECT_EQ(columns({u"public", u"mixed"}).size(), 2U);
    EXPECT_TRUE(columns({u"", u"nothing"}).empty());
}

TEST_F(PostgresReader, SaysWhichTableIsNotThere) {
    EXPECT_EQ(schema().table({u"", u"gone"}).error(),
              QStringLiteral("The table \"gone\" is not in the database; read the list of tables "
                             "afresh."));
}

TEST_F(PostgresReader, ReadsForeignKeysInTheirOrderPairByPair) {
    runOnServer({sql("CREATE SCHEMA aside"),
                 sql("CREATE TABLE p (a int, b int, PRIMARY KEY (b, a))"),
                 sql("CREATE TABLE aside.q (id int PRIMARY KEY)"),
                 sql("CREATE TABLE c (x int, y int, q int REFERENCES aside.q, own int UNIQUE, "
                     "up int REFERENCES c (own), FOREIGN KEY (x, y) REFERENCES p (a, b))")});
    const reader::TableId c{u"", u"c"};
    EXPECT_EQ(foreignKeys(c),
              (std::vector<reader::ForeignKey>{
                  {c, {u"aside", u"q"}, {{u"q", u"id"}}},
                  {c, {u"", u"c"}, {{u"up", u"own"}}}, // the engine puts those of columns first
                  {c, {u"", u"p"}, {{u"x", u"a"}, {u"y", u"b"}}}}));
    EXPECT_TRUE(foreignKeys({u"", u"gone"}).empty());
}

TEST_F(PostgresReader, ReadsAForeignKeyToAPartitionedTableOnce) {
    runOnServer({sql("CREATE TABLE p (id int PRIMARY KEY) PARTITION BY LIST (id)"),
                 sql("CREATE TABLE p1 PARTITION OF p FOR VALUES IN (1)"),
                 sql("CREATE TABLE p2 PARTITION OF p FOR VALUES IN (2)"),
                 sql("CREATE TABLE c (p int REFERENCES p) PARTITION BY LIST (p)"),
                 sql("CREATE TABLE c1 PARTITION OF c FOR VALUES IN (1)")});
    const reader::TableId c{u"", u"c"}, c1{u"", u"c1"}, p{u"", u"p"};
    EXPECT_EQ(foreignKeys(c), (std::vector<reader::ForeignKey>{{c, p, {{u"p", u"id"}}}}));
    EXPECT_EQ(foreignKeys(c1), (std::vector<reader::ForeignKey>{{c1, p, {{u"p", u"id"}}}}));
}

TEST_F(PostgresReader, GivesWhatTablesNeedToBePutIntoAQueryAndJoined) {
    runOnServer({sql("CREATE SCHEMA aside"), sql("CREATE TABLE aside.parent (id int PRIMARY KEY)"),
                 sql("CREATE TABLE child (parent int REFERENCES aside.parent)")});
    const auto query = platform::makeRef<model::Query>();
    const auto added =
        reader::addTables(*query, schema(), {{u"", u"child"}, {u"aside", u"parent"}}, 12000);
    ASSERT_TRUE(added) << added.error().toStdString();
    ASSERT_EQ(query->Joins().Count(), 1);
    EXPECT_EQ(query->Joins().Item(1)->RightTable()->Name(), u"parent");
    EXPECT_EQ(query->Joins().Item(1)->RightColumn()->Name(), u"id");
}
