#include "OneServer.h"

#include <Zandor/DatabaseReader.h>
#include <Zandor/Query.h>
#include <Zandor/reader/bindValue.h>
#include <Zandor/sql/Builder.h>

using namespace zandor;

namespace {

using model::ColumnType;

/// A type of a column, what it means, and criteria that find the value that the row has.
struct Type {
    const char* written;
    ColumnType meaning;
    const char* value; ///< as SQL
    std::vector<const char*> criteria;
};

/// Every type of values that the engine has.
const Type types[] = {
    {"smallint", ColumnType::Integer, "5", {"5", "<70000", "<5.5", "In (4, 5)"}},
    {"integer", ColumnType::Integer, "5", {"5", "between 4 and 6"}},
    {"bigint", ColumnType::Integer, "9007199254740993", {"9007199254740993"}},
    {"numeric(30,10)", ColumnType::Decimal, "1.5", {"1.5", ">1"}},
    {"real", ColumnType::Decimal, "1.5", {"1.5"}},
    {"double precision", ColumnType::Decimal, "1.5", {"1.5", "<2"}},
    {"money", ColumnType::Text, "12.34", {"12.34", ">5", "between 12 and 13", "In (12.34)"}},
    {"char(3)", ColumnType::Text, "'abc'", {"abc", "Like A*"}},
    {"varchar(9)", ColumnType::Text, "'abc'", {"abc", "Like A*"}},
    {"text", ColumnType::Text, "'it''s \\'", {"it's \\", "Like *\\"}},
    {"name", ColumnType::Text, "'abc'", {"abc", "Like A*"}},
    {"\"char\"", ColumnType::Text, "'a'", {"a", "Like A"}},
    {"bytea", ColumnType::Blob, "'abc'", {"Is Not Null"}},
    {"timestamp",
     ColumnType::Timestamp,
     "'2024-02-29 01:02:03.000001'",
     {"2024-02-29 01:02:03.000001", ">2024-02-29 01:02:03"}},
    {"timestamptz", ColumnType::Timestamp, "'2024-02-29 01:02:03'", {"2024-02-29 01:02:03"}},
    {"date", ColumnType::Date, "'2024-02-29'", {"2024-02-29", "<2024-03-01"}},
    {"time", ColumnType::Time, "'01:02:03.5'", {"01:02:03.5", "01:02:03.500"}},
    {"timetz", ColumnType::Time, "'01:02:03+00'", {"01:02:03"}},
    {"interval", ColumnType::Unknown, "'1 day'", {"\"1 day\"", "Like 1*", "\"24 hours\""}},
    {"boolean", ColumnType::Boolean, "true", {"true"}},
    {"mood", ColumnType::Unknown, "'happy'", {"happy", "Like H*", "In (sad, happy)", "<>sad"}},
    {"feeling", ColumnType::Unknown, "'happy'", {"Like H*"}},
    {"uuid",
     ColumnType::Unknown,
     "'123e4567-e89b-12d3-a456-426655440000'",
     {"123e4567-e89b-12d3-a456-426655440000", "Like 123E*"}},
    {"xml", ColumnType::Unknown, "'<a/>'", {"Like \"<A*\""}},
    {"json", ColumnType::Unknown, "'{\"a\":1}'", {"Like *a*"}},
    {"jsonb", ColumnType::Unknown, "'{\"a\":1}'", {"Like *a*", "\"{\"\"a\"\":  1}\""}},
    {"integer[]", ColumnType::Unknown, "'{1,2}'", {"\"{1,2}\"", "Like *2*"}},
    {"feeling[]", ColumnType::Unknown, "'{happy}'", {"\"{happy}\"", "Like *H*"}},
    {"paper[]", ColumnType::Unknown, "'{5}'", {"\"{5}\"", "Like *5*"}},
    {"int4range", ColumnType::Unknown, "'[1,3)'", {"\"[1,2]\"", "Like *3*"}},
    {"int4multirange", ColumnType::Unknown, "'{[1,3)}'", {"Like *3*"}},
    {"pointer", ColumnType::Unknown, "'(1,2)'", {"Like *2*"}},
    {"point", ColumnType::Unknown, "'(1,2)'", {"Like *2*"}},
    {"line", ColumnType::Unknown, "'{1,2,3}'", {"Like *2*"}},
    {"lseg", ColumnType::Unknown, "'((1,2),(3,4))'", {"Like *2*"}},
    {"box", ColumnType::Unknown, "'((1,2),(3,4))'", {"Like *2*"}},
    {"path", ColumnType::Unknown, "'((1,2),(3,4))'", {"Like *2*"}},
    {"polygon", ColumnType::Unknown, "'((1,2),(3,4))'", {"Like *2*"}},
    {"circle", ColumnType::Unknown, "'<(1,2),3>'", {"Like *2*"}},
    {"cidr", ColumnType::Unknown, "'10.0.0.0/8'", {"10.0.0.0/8", "Like 10.*"}},
    {"inet", ColumnType::Unknown, "'10.0.0.1'", {"10.0.0.1", "Like 10.*"}},
    {"macaddr", ColumnType::Unknown, "'08:00:2b:01:02:03'", {"08:00:2b:01:02:03", "Like 08*"}},
    {"macaddr8", ColumnType::Unknown, "'08:00:2b:01:02:03:04:05'", {"Like 08*"}},
    {"bit(3)", ColumnType::Unknown, "'101'", {"\"101\"", "Like 1*"}},
    {"varbit(5)", ColumnType::Unknown, "'101'", {"Like 1*"}},
    {"tsvector", ColumnType::Unknown, "'a b'", {"Like *a*"}},
    {"tsquery", ColumnType::Unknown, "'a'", {"Like *a*"}},
    {"jsonpath", ColumnType::Unknown, "'$.a'", {"Like *a*"}},
    {"oid", ColumnType::Unknown, "1", {"1", "Like 1"}},
    {"regclass", ColumnType::Unknown, "'pg_class'", {"Like PG*"}},
    {"xid8", ColumnType::Unknown, "'1'", {"Like 1"}},
    {"pg_lsn", ColumnType::Unknown, "'0/1'", {"0/1", "Like 0*"}},
    {"int GENERATED ALWAYS AS (5) STORED", ColumnType::Integer, "DEFAULT", {"5"}},
    {"serial", ColumnType::Integer, "1", {"1"}},
};

QString sql(const char* text) { return QString::fromUtf8(text); }

} // namespace

TEST(TypesOfPostgres, MeanWhatCanBeAskedOfThem) {
    runOnServer({sql("DROP SCHEMA public CASCADE"), sql("CREATE SCHEMA public"),
                 sql("CREATE TYPE mood AS ENUM ('sad', 'happy')"),
                 sql("CREATE DOMAIN feeling AS mood"), sql("CREATE DOMAIN paper AS json"),
                 sql("CREATE TYPE pointer AS (x int, y int)")});
    const auto opened = reader::openDatabase(serverAddress());
    ASSERT_TRUE(opened) << opened.error().toStdString();
    const auto schema = reader::makeReader(opened->database());
    for (const Type& type : types) {
        SCOPED_TRACE(type.written);
        runOnServer({sql("DROP TABLE IF EXISTS t"), sql("CREATE TABLE t (x %1)").arg(type.written),
                     sql("INSERT INTO t VALUES (%1)").arg(sql(type.value))});
        const auto table = schema->table({u"", u"t"});
        ASSERT_TRUE(table) << table.error().toStdString();
        EXPECT_EQ(table->columns.front().type, type.meaning);
        for (const char* criterion : type.criteria) {
            SCOPED_TRACE(criterion);
            const auto query = platform::makeRef<model::Query>();
            const auto definition = platform::makeRef<model::ColumnDefinition>();
            definition->Column(query->addTable(*table)->columnNamed(u"x"));
            definition->AddCriterium(platform::fromUtf8(criterion), u"4");
            query->AddColumnDefinition(definition);
            const auto text = model::sql::statementText(*query, model::sql::Dialect::PostgreSQL,
                                                        model::sql::ValueForm::bound);
            ASSERT_TRUE(text.runnable());
            QSqlQuery rows(opened->database());
            const bool prepared = rows.prepare(QString::fromStdU16String(text.text));
            for (const auto& value : text.bindings)
                rows.addBindValue(reader::bindValue(std::get<model::sql::Value>(value),
                                                    model::sql::Dialect::PostgreSQL));
            EXPECT_TRUE(prepared && rows.exec()) << rows.lastError().text().toStdString();
            EXPECT_TRUE(rows.next()) << platform::toUtf8(text.text);
        }
    }
}
