#include "OneServer.h"

#include <Zandor/DatabaseReader.h>
#include <Zandor/Query.h>
#include <Zandor/reader/bindValue.h>
#include <Zandor/sql/Builder.h>

#include <iostream>

using namespace zandor;

using model::sql::Dialect;
using model::sql::ValueForm;

// Every type of the catalogue with every operator of criteria: what is no finding runs.

namespace {

QString sql(const char* text) { return QString::fromUtf8(text); }

/// Those of the engine itself that a column can have, arrays too, and some that are made here.
QStringList everyType() {
    const reader::Connection connection(oneServer.server().connect(QStringLiteral("types")));
    QSqlQuery query(connection.database());
    EXPECT_TRUE(query.exec(sql("SELECT format_type(oid, NULL) FROM pg_type "
                               "WHERE typnamespace = 'pg_catalog'::regnamespace "
                               "AND typtype IN ('b', 'r', 'm') AND NOT EXISTS (SELECT FROM "
                               "pg_class WHERE reltype = typelem AND typelem <> 0) "
                               "AND typname <> '_cstring' ORDER BY oid")));
    QStringList types;
    while (query.next()) types << query.value(0).toString();
    return types + QStringList{sql("mood"),    sql("feeling"), sql("pointer"),   sql("paper"),
                               sql("spans"),   sql("mood[]"),  sql("pointer[]"), sql("feeling[]"),
                               sql("paper[]"), sql("sheet[]"), sql("sheets"),    sql("sheets[]"),
                               sql("ring[]"),  sql("price[]")};
}

model::sql::Text textOf(const model::TableDescription& table, const QString& criterion,
                        ValueForm form) {
    const auto query = platform::makeRef<model::Query>();
    const auto definition = platform::makeRef<model::ColumnDefinition>();
    definition->Column(query->addTable(table)->columnNamed(u"x"));
    definition->AddCriterium(criterion.toStdU16String(), u"4");
    query->AddColumnDefinition(definition);
    return statementText(*query, Dialect::PostgreSQL, form);
}

/// What the engine says to a statement; nothing where it runs.
QString refusal(const QSqlDatabase& database, const model::sql::Text& text) {
    QSqlQuery rows(database);
    const QString statement = QString::fromStdU16String(text.text);
    const bool prepared = text.bindings.empty() || rows.prepare(statement);
    for (const auto& value : text.bindings)
        rows.addBindValue(
            reader::bindValue(std::get<model::sql::Value>(value), Dialect::PostgreSQL));
    const bool ran = prepared && (text.bindings.empty() ? rows.exec(statement) : rows.exec());
    return ran ? QString() : rows.lastError().text();
}

class ComparingInPostgres : public testing::Test {
protected:
    void SetUp() override {
        runOnServer({sql("DROP SCHEMA public CASCADE"), sql("CREATE SCHEMA public"),
                     sql("CREATE TYPE mood AS ENUM ('sad', 'happy', '5')"),
                     sql("CREATE DOMAIN feeling AS mood"),
                     sql("CREATE TYPE pointer AS (x int, y int)"),
                     sql("CREATE DOMAIN paper AS json"), sql("CREATE DOMAIN sheet AS paper"),
                     sql("CREATE DOMAIN sheets AS sheet[]"), sql("CREATE DOMAIN ring AS circle"),
                     sql("CREATE DOMAIN price AS numeric(10,2)"),
                     sql("CREATE TYPE spans AS RANGE (subtype = float8)")});
    }

    /// Whether a criterion finds the one row that a column of a type has.
    bool finds(const char* type, const char* value, const QString& criterion) {
        runOnServer({sql("DROP TABLE IF EXISTS t"), sql("CREATE TABLE t (x %1)").arg(sql(type)),
                     sql("INSERT INTO t VALUES (%1)").arg(sql(value))});
        const auto opened = reader::openDatabase(serverAddress());
        const auto table = reader::makeReader(opened->database())->table({u"", u"t"});
        const auto text = textOf(*table, criterion, ValueForm::literal);
        EXPECT_TRUE(text.runnable());
        QSqlQuery rows(opened->database());
        EXPECT_TRUE(rows.exec(QString::fromStdU16String(text.text)))
            << rows.lastError().text().toStdString();
        return rows.next();
    }
};

} // namespace

TEST_F(ComparingInPostgres, RunsOrIsAFindingForEveryTypeAndOperator) {
    const QStringList types = everyType();
    EXPECT_GT(types.size(), 150);
    QStringList columns;
    const QStringList criteria = {
        sql("= 5"),         sql("<> 5"),         sql("< 5"),
        sql("> 5"),         sql("<= 1.5"),       sql(">= 5"),
        sql("In (5, 6)"),   sql("Not In (5)"),   sql("Between 1 And 5"),
        sql("Is Null"),     sql("Is Not Null"),  sql("Like a*"),
        sql("= [t].[x]"),   sql("<> [t].[x]"),   sql("< [t].[x]"),
        sql(">= [t].[x]"),  sql("In ([t].[x])"), sql("Between [t].[x] And [t].[x]"),
        sql("Not (5 Or 6)")};
    const auto opened = reader::openDatabase(serverAddress());
    ASSERT_TRUE(opened) << opened.error().toStdString();
    const auto schema = reader::makeReader(opened->database());
    int ran = 0;
    int findings = 0;
    for (const QString& type : types) {
        SCOPED_TRACE(type.toStdString());
        runOnServer({sql("DROP TABLE IF EXISTS t"), sql("CREATE TABLE t (x %1)").arg(type),
                     sql("INSERT INTO t VALUES (%1)")
                         .arg(type.endsWith(u"[]") ? sql("'{}'") : sql("NULL"))});
        const auto table = schema->table({u"", u"t"});
        ASSERT_TRUE(table) << table.error().toStdString();
        for (const QString& criterion : criteria) {
            for (const auto form : {ValueForm::bound, ValueForm::literal}) {
                const auto text = textOf(*table, criterion, form);
                ++(text.runnable() ? ran : findings);
                if (!text.runnable()) continue;
                EXPECT_EQ(refusal(opened->database(), text).toStdString(), "")
                    << criterion.toStdString() << "\n"
                    << platform::toUtf8(text.text);
            }
        }
    }
    std::cout << types.size() << " types, " << ran << " statements ran, " << findings
              << " were findings\n";
    EXPECT_GT(ran, 2 * findings);
}

TEST_F(ComparingInPostgres, TellsByItsTextWhatHasNoOperatorForTheSame) {
    EXPECT_TRUE(finds("json", "'{\"a\":1}'", sql("= '{\"a\":1}'")));
    EXPECT_FALSE(finds("json", "'{\"a\":1}'", sql("= '{\"a\": 1}'")));
    EXPECT_TRUE(finds("json", "'{\"a\":1}'", sql("<> '{}' And In ('{\"a\":1}', '[]')")));
    EXPECT_TRUE(finds("jsonb", "'{\"a\":1}'", sql("= '{\"a\":   1}'"))) << "it has one";
    EXPECT_TRUE(finds("jsonb", "'5'", sql("= 5 And > 4 And In (4, 5)")));
    EXPECT_TRUE(finds("json", "'5'", sql("= 5")));
    EXPECT_TRUE(finds("xml", "'<a/>'", sql("= '<a/>' And <> '<b/>'")));
    EXPECT_TRUE(finds("paper", "'{}'", sql("= '{}'"))) << "a domain is what it is made from";
    EXPECT_TRUE(finds("paper[]", "'{5}'", sql("= '{5}' And <> '{6}'"))) << "nor has a list of them";
    EXPECT_TRUE(finds("sheets[]", "array['{5}'::sheets]", sql("= '{\"{5}\"}'")));
    EXPECT_TRUE(finds("price[]", "'{5}'", sql("= '{5.0}' And < '{6}'"))) << "this one has";
    EXPECT_TRUE(finds("point", "'(1,2)'", sql("= '(1,2)'")));
}

TEST_F(ComparingInPostgres, TakesANumberForWhatReadsLikeIt) {
    EXPECT_TRUE(finds("mood", "'5'", sql("= 5")));
    EXPECT_FALSE(finds("mood", "'sad'", sql("= 5")));
    EXPECT_TRUE(finds("mood", "'sad'", sql("Not In (5, 6)")));
    EXPECT_FALSE(finds("integer[]", "'{5}'", sql("= 5")));
    EXPECT_TRUE(finds("int4range", "'[1,3)'", sql("<> 5")));
    EXPECT_TRUE(finds("bit(3)", "'101'", sql("= 101")));
    EXPECT_TRUE(finds("oid", "9", sql("= 9 And < 10")));
}

TEST_F(ComparingInPostgres, SaysWhatHasNoOrder) {
    runOnServer({sql("CREATE TABLE t (x json)")});
    const auto opened = reader::openDatabase(serverAddress());
    const auto table = reader::makeReader(opened->database())->table({u"", u"t"});
    const auto text = textOf(*table, sql("< 5"), ValueForm::bound);
    ASSERT_EQ(text.findings.size(), 1U);
    EXPECT_EQ(text.findings[0].kind, model::Finding::Kind::notInDialect);
    EXPECT_EQ(platform::toUtf8(text.findings[0].text()),
              "PostgreSQL has nothing that says t.x < …: leave it out, or calculate it from what "
              "was found.");
}
