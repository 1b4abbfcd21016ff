#include "MysqlSchema.h"

#include <Zandor/reader/addTables.h>
#include <Zandor/reader/bindValue.h>
#include <Zandor/sql/Builder.h>

#include <array>

using namespace zandor;

namespace {

using model::ColumnType;
using Columns = std::vector<model::ColumnDescription>;
using Entries = std::vector<reader::TableEntry>;
using Keys = std::vector<reader::ForeignKey>;

QString sql(const char* text) { return QString::fromUtf8(text); }

/// A type of a column, what the engine calls it, what it means; and a criterion that finds the
/// value that the row has.
struct Type {
    const char* written;
    const char16_t* declared;
    ColumnType meaning;
    const char* value;     ///< as SQL
    const char* criterion; ///< empty: none is possible
};

/// Every type that the engine has, and the other words for it.
constexpr std::array<Type, 55> types = {{
    {"tinyint", u"tinyint(4)", ColumnType::Integer, "-128", "-128"},
    {"tinyint unsigned", u"tinyint(3) unsigned", ColumnType::Integer, "255", ">254"},
    {"boolean", u"tinyint(1)", ColumnType::Boolean, "1", "true"},
    {"tinyint(1) unsigned", u"tinyint(1) unsigned", ColumnType::Integer, "7", "7"},
    {"smallint", u"smallint(6)", ColumnType::Integer, "5", "5"},
    {"mediumint", u"mediumint(9)", ColumnType::Integer, "5", "5"},
    {"int(5) unsigned zerofill", u"int(5) unsigned zerofill", ColumnType::Integer, "5", "5"},
    {"bigint", u"bigint(20)", ColumnType::Integer, "9007199254740993", "9007199254740993"},
    {"bigint unsigned", u"bigint(20) unsigned", ColumnType::Integer, "18446744073709551615",
     "18446744073709551615"},
    {"decimal(30,10)", u"decimal(30,10)", ColumnType::Decimal, "12345678901234567890.0123456789",
     "12345678901234567890.0123456789"},
    {"numeric(5,2)", u"decimal(5,2)", ColumnType::Decimal, "1.10", "1.1"},
    {"fixed", u"decimal(10,0)", ColumnType::Decimal, "3", "3"},
    {"float", u"float", ColumnType::Decimal, "1.5", "1.5"},
    {"double", u"double", ColumnType::Decimal, "1e300", ">1"},
    {"real", u"double", ColumnType::Decimal, "2.5", "between 2 and 3"},
    {"bit", u"bit(1)", ColumnType::Boolean, "b'1'", "true"},
    {"bit(64)", u"bit(64)", ColumnType::Integer, "b'101'", "5"},
    {"date", u"date", ColumnType::Date, "'2024-02-29'", "2024-02-29"},
    {"time", u"time", ColumnType::Time, "'23:59:58'", "23:59:58"},
    {"time(6)", u"time(6)", ColumnType::Time, "'800:00:00.5'", ">23:00"},
    {"datetime", u"datetime", ColumnType::Timestamp, "'2024-02-29 01:02:03'",
     "2024-02-29 01:02:03"},
    {"datetime(6)", u"datetime(6)", ColumnType::Timestamp, "'2024-02-29 01:02:03.123456'",
     "2024-02-29 01:02:03.123456"},
    {"timestamp null", u"timestamp", ColumnType::Timestamp, "'2024-02-29 01:02:03'", "<2025-01-01"},
    {"year", u"year(4)", ColumnType::Integer, "2024", "2024"},
    {"char(3)", u"char(3)", ColumnType::Text, "'abc'", "ABC"},
    {"nchar(3)", u"char(3)", ColumnType::Text, "'abc'", "Like a*"},
    {"varchar(9)", u"varchar(9)", ColumnType::Text, "'abc'", "Like *B?"},
    {"varchar(9) collate utf8mb4_bin", u"varchar(9)", ColumnType::Text, "'abc'", "Like a?c"},
    {"text character set latin1 collate latin1_bin", u"text", ColumnType::Text, "'abc'", "abc"},
    {"tinytext", u"tinytext", ColumnType::Text, "'abc'", "abc"},
    {"text", u"text", ColumnType::Text, "'it''s \\\\'", "it's \\"},
    {"mediumtext", u"mediumtext", ColumnType::Text, "'abc'", "abc"},
    {"longtext", u"longtext", ColumnType::Text, "'abc'", "abc"},
    {"enum('int','char')", u"enum('int','char')", ColumnType::Text, "'int'", "int"},
    {"set('date','blob')", u"set('date','blob')", ColumnType::Text, "'date,blob'", "Like *blob"},
    {"json", u"longtext", ColumnType::Text, "'{\"a\":1}'", "Like *a*"},
    {"uuid", u"uuid", ColumnType::Text, "'123e4567-e89b-12d3-a456-426655440000'", "Like 123E*"},
    {"inet4", u"inet4", ColumnType::Text, "'10.0.0.1'", "10.0.0.1"},
    {"inet6", u"inet6", ColumnType::Text, "'::1'", "::1"},
    {"binary(3)", u"binary(3)", ColumnType::Blob, "'abc'", "Is Not Null"},
    {"varbinary(9)", u"varbinary(9)", ColumnType::Blob, "'abc'", "Is Not Null"},
    {"tinyblob", u"tinyblob", ColumnType::Blob, "'abc'", "Is Not Null"},
    {"blob", u"blob", ColumnType::Blob, "'abc'", "Is Not Null"},
    {"mediumblob", u"mediumblob", ColumnType::Blob, "'abc'", "Is Not Null"},
    {"longblob", u"longblob", ColumnType::Blob, "'abc'", "Is Not Null"},
    {"geometry", u"geometry", ColumnType::Unknown, "point(1, 2)", "Is Not Null"},
    {"point", u"point", ColumnType::Unknown, "point(1, 2)", "Is Not Null"},
    {"linestring", u"linestring", ColumnType::Unknown, "linestring(point(1,2), point(3,4))",
     "Is Not Null"},
    {"polygon", u"polygon", ColumnType::Unknown, "NULL", "Is Null"},
    {"multipoint", u"multipoint", ColumnType::Unknown, "NULL", "Is Null"},
    {"multilinestring", u"multilinestring", ColumnType::Unknown, "NULL", "Is Null"},
    {"multipolygon", u"multipolygon", ColumnType::Unknown, "NULL", "Is Null"},
    {"geometrycollection", u"geometrycollection", ColumnType::Unknown, "NULL", "Is Null"},
    {"int as (5)", u"int(11)", ColumnType::Integer, "DEFAULT", "5"},
    {"serial", u"bigint(20) unsigned", ColumnType::Integer, "1", "1"},
}};

class MysqlReader : public MysqlSchema {};

} // namespace

TEST_F(MysqlReader, ListsTablesAndViewsOfTheDatabaseThatItIsIn) {
    run({sql("CREATE TABLE b (x int)"), sql("CREATE TABLE aside.b (x int)"),
         sql("CREATE VIEW `A v` AS SELECT x FROM b"), sql("CREATE SEQUENCE s"),
         sql("CREATE TABLE kept (x int) WITH SYSTEM VERSIONING"), sql("CREATE TABLE B (x int)")});
    EXPECT_EQ(tables(), (Entries{{{u"", u"A v"}, true},
                                 {{u"", u"B"}, false},
                                 {{u"", u"b"}, false},
                                 {{u"", u"kept"}, false}}));
}

TEST_F(MysqlReader, ListsTheTablesOfAllDatabasesWhenItIsInNone) {
    run({sql("CREATE TABLE b (x int)"), sql("CREATE TABLE aside.b (x int, y int)")});
    open(mariaAddress(QString()));
    EXPECT_EQ(tables(), (Entries{{{u"aside", u"b"}, false}, {{u"here", u"b"}, false}}));
    EXPECT_EQ(columns({u"aside", u"b"}).size(), 2U);
    EXPECT_FALSE(schema().table({u"", u"b"}));
}

TEST_F(MysqlReader, ReadsEveryTypeWithItsMeaning) {
    for (const Type& type : types) {
        SCOPED_TRACE(type.written);
        run({sql("DROP TABLE IF EXISTS t"), sql("CREATE TABLE t (x %1)").arg(sql(type.written))});
        const Columns read = columns({u"", u"t"});
        ASSERT_EQ(read.size(), 1U);
        EXPECT_EQ(platform::toUtf8(read[0].declaredType), platform::toUtf8(type.declared));
        EXPECT_EQ(read[0].type, type.meaning);
    }
}

TEST_F(MysqlReader, LetsEveryTypeBeAskedFor) {
    for (const Type& type : types) {
        SCOPED_TRACE(std::string(type.written) + ": " + type.criterion);
        run({sql("DROP TABLE IF EXISTS t"), sql("CREATE TABLE t (x %1)").arg(sql(type.written)),
             sql("INSERT INTO t VALUES (%1)").arg(sql(type.value))});
        const auto description = schema().table({u"", u"t"});
        ASSERT_TRUE(description);
        const auto query = platform::makeRef<model::Query>();
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->Column(query->addTable(*description)->columnNamed(u"x"));
        definition->AddCriterium(platform::fromUtf8(type.criterion), u"4");
        query->AddColumnDefinition(definition);
        for (const auto form : {model::sql::ValueForm::bound, model::sql::ValueForm::literal}) {
            const auto text = model::sql::statementText(*query, model::sql::Dialect::MySQL, form);
            ASSERT_TRUE(text.runnable());
            QSqlQuery rows(database());
            const QString statement = QString::fromStdU16String(text.text);
            // Prepared, a geometry takes the driver 4 GB and some seconds.
            if (form == model::sql::ValueForm::literal || text.bindings.empty()) {
                ASSERT_TRUE(rows.exec(statement)) << rows.lastError().text().toStdString();
            } else {
                ASSERT_TRUE(rows.prepare(statement));
                for (const auto& value : text.bindings)
                    rows.addBindValue(reader::bindValue(std::get<model::sql::Value>(value),
                                                        model::sql::Dialect::MySQL));
                ASSERT_TRUE(rows.exec()) << rows.lastError().text().toStdString();
            }
            EXPECT_TRUE(rows.next()) << platform::toUtf8(text.text);
        }
    }
}

TEST_F(MysqlReader, MarksTheColumnsOfAPrimaryKeyAndNotThoseOfAnother) {
    run({sql("CREATE TABLE `a``b.c` (a int, `x``y.z` int, c int UNIQUE, PRIMARY KEY (`x``y.z`, "
             "a))"),
         sql("CREATE TABLE u (a int NOT NULL UNIQUE, b int)"),
         sql("CREATE VIEW v AS SELECT * FROM u")});
    EXPECT_EQ(columns({u"", u"a`b.c"}), (Columns{{u"a", ColumnType::Integer, u"int(11)", true},
                                                 {u"x`y.z", ColumnType::Integer, u"int(11)", true},
                                                 {u"c", ColumnType::Integer, u"int(11)", false}}));
    EXPECT_EQ(columns({u"", u"u"}), (Columns{{u"a", ColumnType::Integer, u"int(11)", false},
                                             {u"b", ColumnType::Integer, u"int(11)", false}}));
    EXPECT_EQ(columns({u"", u"v"}), columns({u"", u"u"}));
}

TEST_F(MysqlReader, TakesNamesAsTheyStand) {
    run({sql("CREATE TABLE aside.`a.b \"c\" 'd' % \\ ?` (`x y` int PRIMARY KEY)"),
         sql("CREATE TABLE Mixed (x int)"), sql("CREATE TABLE mixed (y int, z int)"),
         sql("CREATE TABLE `Größe` (`naïve ☃` int)")});
    EXPECT_EQ(columns({u"aside", u"a.b \"c\" 'd' % \\ ?"}).front().name, u"x y");
    EXPECT_EQ(columns({u"", u"Mixed"}).size(), 1U);
    EXPECT_EQ(columns({u"", u"mixed"}).size(), 2U);
    EXPECT_EQ(columns({u"here", u"mixed"}).size(), 2U);
    EXPECT_EQ(columns({u"", u"Größe"}).front().name, u"naïve ☃");
}

TEST_F(MysqlReader, SaysWhichTableIsNotThereAndWhichViewIsBroken) {
    EXPECT_EQ(schema().table({u"", u"gone"}).error(),
              sql("The table \"gone\" is not in the database; read the list of tables afresh."));
    run({sql("CREATE TABLE t (x int)"), sql("CREATE VIEW `v``w` AS SELECT x FROM t"),
         sql("DROP TABLE t")});
    const QString error = schema().table({u"", u"v`w"}).error();
    EXPECT_TRUE(error.startsWith(sql("The table \"v`w\" cannot be read (View 'here.v`w' refer")))
        << error.toStdString();
}

TEST_F(MysqlReader, ReadsForeignKeysPairByPair) {
    run({sql("CREATE TABLE p (a int, `b``.c` int, PRIMARY KEY (`b``.c`, a))"),
         sql("CREATE TABLE aside.q (id int PRIMARY KEY)"),
         sql("CREATE TABLE c (x int, `y``.` int, q int, own int UNIQUE, up int, "
             "FOREIGN KEY (up) REFERENCES c (own), FOREIGN KEY (`y``.`, x) REFERENCES p "
             "(`b``.c`, a), FOREIGN KEY (q) REFERENCES aside.q (id))"),
         sql("CREATE TABLE aside.d (q int, FOREIGN KEY (q) REFERENCES q (id))")});
    const reader::TableId c{u"", u"c"}, d{u"aside", u"d"};
    EXPECT_EQ(foreignKeys(c), (Keys{{c, {u"", u"c"}, {{u"up", u"own"}}},
                                    {c, {u"", u"p"}, {{u"y`.", u"b`.c"}, {u"x", u"a"}}},
                                    {c, {u"aside", u"q"}, {{u"q", u"id"}}}}));
    EXPECT_EQ(foreignKeys(d), (Keys{{d, {u"aside", u"q"}, {{u"q", u"id"}}}}));
    EXPECT_TRUE(foreignKeys({u"", u"gone"}).empty());
}

TEST_F(MysqlReader, KeepsTheOrderOfMoreThanNineForeignKeys) {
    QString create = sql("CREATE TABLE c (");
    for (int n = 1; n <= 11; ++n) create += sql("c%1 int REFERENCES p (id), ").arg(n);
    run({sql("CREATE TABLE p (id int PRIMARY KEY)"), create.chopped(2) + u')'});
    const Keys keys = foreignKeys({u"", u"c"});
    ASSERT_EQ(keys.size(), 11U);
    for (std::size_t n = 0; n < keys.size(); ++n)
        EXPECT_EQ(keys[n].columns.front().first, u"c" + platform::decimal(n + 1));
}

TEST_F(MysqlReader, GivesWhatTablesNeedToBePutIntoAQueryAndJoined) {
    run({sql("CREATE TABLE aside.parent (id int PRIMARY KEY)"),
         sql("CREATE TABLE child (parent int, FOREIGN KEY (parent) REFERENCES aside.parent "
             "(id))")});
    const auto query = platform::makeRef<model::Query>();
    const auto added =
        reader::addTables(*query, schema(), {{u"", u"child"}, {u"aside", u"parent"}}, 12000);
    ASSERT_TRUE(added) << added.error().toStdString();
    ASSERT_EQ(query->Joins().Count(), 1);
    EXPECT_EQ(query->Joins().Item(1)->RightColumn()->Name(), u"id");
}
