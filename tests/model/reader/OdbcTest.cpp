#include "OneServerOf.h"
#include "model/TemporaryDatabase.h"
#include "support/MariaServer.h"
#include "support/OdbcSources.h"
#include "support/PostgresServer.h"

#include <Zandor/Query.h>
#include <Zandor/reader/bindValue.h>
#include <Zandor/reader/dialectOf.h>
#include <Zandor/sql/Builder.h>

using namespace zandor;

// The engines that there are, each behind its own driver of ODBC.

namespace {

[[maybe_unused]] auto& postgresServer = OneServerOf<PostgresServer>::instance();
[[maybe_unused]] auto& mariaServer = OneServerOf<MariaServer>::instance();

using model::ColumnType;
using model::sql::Dialect;
using Columns = std::vector<model::ColumnDescription>;
using Entries = std::vector<reader::TableEntry>;

QString sql(const char* text) { return QString::fromUtf8(text); }

/// A source of ODBC over a database that each test fills.
class OverOdbc : public testing::Test {
protected:
    void open() {
        auto opened = reader::openDatabase(QStringLiteral("odbc://") + mSource);
        ASSERT_TRUE(opened) << opened.error().toStdString();
        mConnection = std::make_unique<reader::Connection>(std::move(*opened));
        mReader = reader::makeReader(mConnection->database());
    }
    const QSqlDatabase& database() { return mConnection->database(); }
    reader::DatabaseReader& schema() { return *mReader; }

    void expectTables(const Entries& expected) {
        const auto tables = schema().tables();
        ASSERT_TRUE(tables) << tables.error().toStdString();
        EXPECT_EQ(*tables, expected);
    }
    void expectColumns(const reader::TableId& id, const Columns& expected) {
        const auto table = schema().table(id);
        ASSERT_TRUE(table) << table.error().toStdString();
        EXPECT_EQ(table->columns, expected);
    }
    void expectForeignKey(const reader::ForeignKey& expected) {
        const auto keys = schema().foreignKeys(expected.child);
        ASSERT_TRUE(keys) << keys.error().toStdString();
        EXPECT_EQ(*keys, std::vector{expected});
    }
    void expectRefused(const QString& statement, const QString& words) {
        QSqlQuery query(database());
        EXPECT_FALSE(query.exec(statement)) << statement.toStdString();
        EXPECT_TRUE(query.lastError().text().contains(words))
            << query.lastError().text().toStdString();
    }
    int number(const QString& statement) {
        QSqlQuery query(database());
        EXPECT_TRUE(query.exec(statement) && query.next())
            << query.lastError().text().toStdString();
        return query.value(0).toInt();
    }

    /// Finds the row that a table has by what is typed for a column of it.
    void expectFound(const reader::TableId& id, const char16_t* column, const char16_t* typed) {
        const auto table = schema().table(id);
        ASSERT_TRUE(table) << table.error().toStdString();
        const auto query = platform::makeRef<model::Query>();
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->Column(query->addTable(*table)->columnNamed(column));
        definition->AddCriterium(typed, u"4");
        query->AddColumnDefinition(definition);
        const Dialect dialect = reader::dialectOf(database());
        const auto text =
            model::sql::statementText(*query, dialect, model::sql::ValueForm::bound, 2);
        ASSERT_TRUE(text.runnable());
        QSqlQuery rows(database());
        ASSERT_TRUE(rows.prepare(QString::fromStdU16String(text.text)));
        for (const auto& value : text.bindings)
            rows.addBindValue(reader::bindValue(std::get<model::sql::Value>(value), dialect));
        ASSERT_TRUE(rows.exec()) << rows.lastError().text().toStdString();
        EXPECT_TRUE(rows.next());
        EXPECT_FALSE(rows.next());
    }

    OdbcSources mSources;
    QString mSource;

private:
    std::unique_ptr<reader::Connection> mConnection;
    std::unique_ptr<reader::DatabaseReader> mReader;
};

class PostgresOverOdbc : public OverOdbc {
protected:
    void SetUp() override {
        if (const auto missing = OdbcSources::missing(odbcOfPostgres))
            GTEST_SKIP() << missing->toStdString();
        mSource = mSources.add(odbcOfPostgres,
                               {QStringLiteral("Servername=") + postgresServer.server().folder(),
                                QStringLiteral("Database=postgres"),
                                QStringLiteral("Username=postgres")});
        run({sql("SET client_min_messages = warning"), sql("DROP SCHEMA IF EXISTS aside CASCADE"),
             sql("DROP SCHEMA public CASCADE"), sql("CREATE SCHEMA public"),
             sql("CREATE SCHEMA aside")});
    }
    static void run(const QStringList& statements) {
        const reader::Connection connection(
            postgresServer.server().connect(QStringLiteral("statements")));
        runOver(connection, statements);
    }
};

class MariaOverOdbc : public OverOdbc {
protected:
    void SetUp() override {
        if (const auto missing = OdbcSources::missing(odbcOfMaria))
            GTEST_SKIP() << missing->toStdString();
        if (const auto missing = MariaServer::missing()) GTEST_SKIP() << missing->toStdString();
        mSource = mSources.add(odbcOfMaria,
                               {QStringLiteral("SOCKET=") + mariaServer.server().socket(),
                                QStringLiteral("DATABASE=here"), QStringLiteral("USER=root")});
        run({sql("SET foreign_key_checks = 0"), sql("CREATE OR REPLACE DATABASE here")});
    }
    static void run(const QStringList& statements) {
        const reader::Connection connection(
            mariaServer.server().connect(QStringLiteral("statements")));
        runOver(connection,
                QStringList{QStringLiteral("SET sql_mode = 'ANSI_QUOTES'")} + statements);
    }
};

class SqliteOverOdbc : public OverOdbc {
protected:
    void SetUp() override {
        if (const auto missing = OdbcSources::missing(odbcOfSqlite))
            GTEST_SKIP() << missing->toStdString();
        mSource = mSources.add(odbcOfSqlite, {QStringLiteral("Database=") + mDatabase.path()});
    }
    void run(const QStringList& statements) { writeSqlite(mDatabase.path(), statements); }

private:
    TemporaryDatabase mDatabase{{QStringLiteral("CREATE TABLE own (x INTEGER)")}};
};

} // namespace

TEST_F(PostgresOverOdbc, IsReadAsPostgres) {
    run({sql("CREATE TABLE \"Mixed Case\" (\"Id.x\" int PRIMARY KEY, \"a\"\"b?\" numeric(5,2))"),
         sql("CREATE TABLE aside.child (p int REFERENCES \"Mixed Case\", o boolean)"),
         sql("CREATE VIEW v AS SELECT 1 AS x")});
    open();
    EXPECT_EQ(reader::dialectOf(database()), Dialect::PostgreSQL);
    expectTables(
        {{{u"aside", u"child"}, false}, {{u"", u"Mixed Case"}, false}, {{u"", u"v"}, true}});
    expectColumns({u"", u"Mixed Case"}, {{u"Id.x", ColumnType::Integer, u"integer", true},
                                         {u"a\"b?", ColumnType::Decimal, u"numeric(5,2)", false}});
    expectForeignKey({{u"aside", u"child"}, {u"", u"Mixed Case"}, {{u"p", u"Id.x"}}});
}

TEST_F(PostgresOverOdbc, FindsRowsWithMixedNamesAndEveryKindOfValue) {
    run({sql("CREATE TABLE \"Mixed Case\" (\"I\" int, n numeric(5,2), t text, d date, m timestamp, "
             "o boolean)"),
         sql("INSERT INTO \"Mixed Case\" VALUES (1, 1.25, 'it''s \\ ?', '2024-02-29', "
             "'2024-02-29 01:02:03', true)")});
    open();
    const reader::TableId table{u"", u"Mixed Case"};
    expectFound(table, u"I", u"1");
    expectFound(table, u"I", u"<1.5");
    expectFound(table, u"n", u"1.25");
    expectFound(table, u"t", u"it's \\ ?");
    expectFound(table, u"t", u"Like IT*");
    expectFound(table, u"d", u"2024-02-29");
    expectFound(table, u"m", u"2024-02-29 01:02:03");
    expectFound(table, u"o", u"true");
}

TEST_F(PostgresOverOdbc, CannotWriteNotEvenByAFunction) {
    run({sql("CREATE TABLE t (x int)"),
         sql("CREATE FUNCTION w() RETURNS int LANGUAGE sql AS "
             "'INSERT INTO t VALUES (1); SELECT 1'"),
         sql("CREATE VIEW v AS SELECT w() AS x")});
    open();
    expectRefused(sql("SELECT x FROM v"), sql("read-only transaction"));
    EXPECT_EQ(number(sql("SELECT count(*) FROM t")), 0);
}

TEST_F(MariaOverOdbc, IsReadAsMariaDB) {
    run({sql("USE here"), sql("CREATE TABLE \"Mixed Case\" (\"Id.x\" int PRIMARY KEY, o boolean)"),
         sql("CREATE TABLE child (p int REFERENCES \"Mixed Case\" (\"Id.x\"))")});
    open();
    EXPECT_EQ(reader::dialectOf(database()), Dialect::MySQL);
    expectTables({{{u"", u"child"}, false}, {{u"", u"Mixed Case"}, false}});
    expectColumns({u"", u"Mixed Case"}, {{u"Id.x", ColumnType::Integer, u"int(11)", true},
                                         {u"o", ColumnType::Boolean, u"tinyint(1)", false}});
    expectForeignKey({{u"", u"child"}, {u"", u"Mixed Case"}, {{u"p", u"Id.x"}}});
}

TEST_F(MariaOverOdbc, FindsRowsAndCannotWrite) {
    run({sql("USE here"), sql("CREATE TABLE \"Mixed Case\" (t text, n decimal(5,2))"),
         sql("INSERT INTO \"Mixed Case\" VALUES ('it''s', 1.25)"),
         sql("CREATE FUNCTION w() RETURNS int BEGIN INSERT INTO \"Mixed Case\" VALUES ('', 1); "
             "RETURN 1; END")});
    open();
    // Not by the text: the driver takes a zero behind it for a part of it.
    expectFound({u"", u"Mixed Case"}, u"n", u"1.25");
    expectRefused(sql("SELECT w()"), sql("READ ONLY"));
    EXPECT_EQ(number(sql("SELECT count(*) FROM `Mixed Case`")), 1);
}

TEST_F(SqliteOverOdbc, IsReadAsSqlite) {
    run({sql("CREATE TABLE \"Mixed Case\" (\"Id.x\" INTEGER PRIMARY KEY, \"a\"\"b?\" "
             "DECIMAL(5,2))"),
         sql("CREATE TABLE child (p INTEGER REFERENCES \"Mixed Case\")")});
    open();
    EXPECT_EQ(reader::dialectOf(database()), Dialect::SQLite);
    expectTables({{{u"", u"child"}, false}, {{u"", u"Mixed Case"}, false}, {{u"", u"own"}, false}});
    expectColumns({u"", u"Mixed Case"}, {{u"Id.x", ColumnType::Integer, u"INTEGER", true},
                                         {u"a\"b?", ColumnType::Decimal, u"DECIMAL(5,2)", false}});
    expectForeignKey({{u"", u"child"}, {u"", u"Mixed Case"}, {{u"p", u"Id.x"}}});
}

TEST_F(SqliteOverOdbc, FindsRowsAndCannotWrite) {
    run({sql("CREATE TABLE \"Mixed Case\" (t TEXT, n DECIMAL(5,2))"),
         sql("INSERT INTO \"Mixed Case\" VALUES ('it''s', 1.25)")});
    open();
    expectFound({u"", u"Mixed Case"}, u"t", u"it's");
    expectFound({u"", u"Mixed Case"}, u"n", u"1.25");
    expectRefused(sql("INSERT INTO own VALUES (1)"), sql("readonly"));
}

TEST_F(SqliteOverOdbc, SaysThatThereIsNoSuchSource) {
    const auto opened = reader::openDatabase(QStringLiteral("odbc://nowhere"));
    ASSERT_FALSE(opened);
    EXPECT_EQ(opened.error(),
              sql("The database odbc://nowhere cannot be opened ([unixODBC][Driver Manager]Data "
                  "source name not found and no default driver specified): check the name of the "
                  "database."));
}
