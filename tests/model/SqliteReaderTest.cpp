#include "model/TemporaryDatabase.h"

#include <gtest/gtest.h>

using namespace zandor;

using model::ColumnDescription;
using model::ColumnType;
using reader::ForeignKey;
using reader::TableEntry;
using reader::TableId;

namespace {

using Pairs = std::vector<std::pair<platform::String, platform::String>>;

std::vector<ForeignKey> keysOf(TemporaryDatabase& database, const platform::String& table) {
    const auto keys = database.reader().foreignKeys({u"", table});
    EXPECT_TRUE(keys) << keys.error().toStdString();
    return keys ? *keys : std::vector<ForeignKey>();
}

} // namespace

TEST(TheSqliteReader, ListsTablesAndViewsByName) {
    TemporaryDatabase database({"CREATE TABLE b (x INTEGER PRIMARY KEY AUTOINCREMENT)",
                                "CREATE VIEW Ansicht AS SELECT x FROM b", "CREATE TABLE C (y)",
                                "CREATE INDEX i ON C (y)", "ANALYZE"});
    const auto tables = database.reader().tables();
    ASSERT_TRUE(tables) << tables.error().toStdString();
    EXPECT_EQ(*tables, (std::vector<TableEntry>{
                           {{u"", u"Ansicht"}, true}, {{u"", u"b"}, false}, {{u"", u"C"}, false}}));
}

TEST(TheSqliteReader, ListsATableWhoseNameOnlyBeginsLikeThoseOfSqlite) {
    TemporaryDatabase database({"CREATE TABLE sqlitex (y)"});
    const auto tables = database.reader().tables();
    ASSERT_TRUE(tables);
    ASSERT_EQ(tables->size(), 1U);
}

TEST(TheSqliteReader, OrdersTablesByNameWithoutRegardToTheCaseOfLetters) {
    TemporaryDatabase database(
        {"CREATE TABLE prefix_b (y)", "CREATE TABLE PREFIX_C (y)", "CREATE VIEW prefix AS SELECT 1",
         "CREATE TABLE Prefix_a (y)", "CREATE TABLE prefix_bcdefghijk (y)",
         "CREATE TABLE prefix_bcdefghij_ (y)", "CREATE TABLE PREFIX_BCDEFGHIJL (y)",
         QStringLiteral("CREATE TABLE \"prefix_\uFFFD\" (y)"),
         QStringLiteral("CREATE TABLE \"prefix_\U0001F600\" (y)"), "CREATE TABLE \"a\nb\" (y)"});
    const auto tables = database.reader().tables();
    ASSERT_TRUE(tables) << tables.error().toStdString();
    std::vector<platform::String> names;
    for (const auto& entry : *tables) names.push_back(entry.id.name);
    EXPECT_EQ(names, (std::vector<platform::String>{
                         u"a\nb", u"prefix", u"Prefix_a", u"prefix_b", u"prefix_bcdefghij_",
                         u"prefix_bcdefghijk", u"PREFIX_BCDEFGHIJL", u"PREFIX_C", u"prefix_\uFFFD",
                         u"prefix_\U0001F600"})); // by character, and not by unit
}

TEST(TheSqliteReader, ListsNothingInAnEmptyFile) {
    TemporaryDatabase database({"VACUUM"});
    const auto tables = database.reader().tables();
    ASSERT_TRUE(tables) << tables.error().toStdString();
    EXPECT_TRUE(tables->empty());
}

TEST(TheSqliteReader, ReadsColumnsWithTypeAndPrimaryKey) {
    TemporaryDatabase database({"CREATE TABLE line (amount DECIMAL(8, 2), pos smallint, doc INT, "
                                "free, PRIMARY KEY (doc, pos))"});
    const auto table = database.reader().table({u"", u"line"});
    ASSERT_TRUE(table) << table.error().toStdString();
    EXPECT_EQ(table->name, u"line");
    EXPECT_EQ(table->columns, (std::vector<ColumnDescription>{
                                  {u"amount", ColumnType::Decimal, u"DECIMAL(8, 2)", false},
                                  {u"pos", ColumnType::Integer, u"smallint", true},
                                  {u"doc", ColumnType::Integer, u"INT", true},
                                  {u"free", ColumnType::Unknown, u"", false}}));
}

TEST(TheSqliteReader, ReadsTheColumnsOfAView) {
    TemporaryDatabase database(
        {"CREATE TABLE t (x DATE)", "CREATE VIEW v AS SELECT x, x || '!' AS loud FROM t"});
    const auto view = database.reader().table({u"", u"v"});
    ASSERT_TRUE(view);
    ASSERT_EQ(view->columns.size(), 2U);
    EXPECT_EQ(view->columns[0].type, ColumnType::Date);
    EXPECT_EQ(view->columns[1].name, u"loud");
}

TEST(TheSqliteReader, ReadsGeneratedColumns) {
    TemporaryDatabase database({"CREATE TABLE t (x INTEGER, twice INTEGER AS (x * 2), "
                                "thrice INTEGER AS (x * 3) STORED)"});
    const auto table = database.reader().table({u"", u"t"});
    ASSERT_TRUE(table);
    EXPECT_EQ(table->columns.size(), 3U);
}

TEST(TheSqliteReader, KnowsOfAVirtualTableWhatAUserMaySee) {
    TemporaryDatabase database(
        {"CREATE VIRTUAL TABLE notes USING fts5(body)", "CREATE TABLE t (x)"});
    const auto tables = database.reader().tables();
    ASSERT_TRUE(tables) << tables.error().toStdString();
    EXPECT_EQ(*tables, (std::vector<TableEntry>{{{u"", u"notes"}, false}, {{u"", u"t"}, false}}))
        << "and not what it keeps for itself";
    const auto notes = database.reader().table({u"", u"notes"});
    ASSERT_TRUE(notes) << notes.error().toStdString();
    ASSERT_EQ(notes->columns.size(), 1U) << "and not those that only searches have";
    EXPECT_EQ(notes->columns.front().name, u"body");
}

TEST(TheSqliteReader, SaysWhenATableIsNotThere) {
    TemporaryDatabase database({"CREATE TABLE t (x)"});
    EXPECT_EQ(database.reader().table({u"", u"gone"}).error().toStdString(),
              "The table \"gone\" is not in the database; read the list of tables afresh.");
    EXPECT_TRUE(keysOf(database, u"gone").empty());
}

TEST(TheSqliteReader, SaysWhenAViewIsBroken) {
    TemporaryDatabase database({"CREATE TABLE t (x)", "CREATE VIEW v AS SELECT x FROM t",
                                "PRAGMA legacy_alter_table = ON", "DROP TABLE t"});
    const auto view = database.reader().table({u"", u"v"});
    ASSERT_FALSE(view);
    EXPECT_EQ(view.error().toStdString(),
              "The table \"v\" cannot be read (no such table: main.t): open the database afresh.");
    EXPECT_TRUE(database.reader().tables()); // the list is not spoilt by it
}

TEST(TheSqliteReader, ReadsForeignKeysInTheOrderOfTheirDeclaration) {
    TemporaryDatabase database({"CREATE TABLE a (id INTEGER PRIMARY KEY)",
                                "CREATE TABLE b (id INTEGER PRIMARY KEY)",
                                "CREATE TABLE c (b_id REFERENCES b (id), a_id REFERENCES a (id))"});
    EXPECT_EQ(keysOf(database, u"c"),
              (std::vector<ForeignKey>{{{u"", u"c"}, {u"", u"b"}, Pairs{{u"b_id", u"id"}}},
                                       {{u"", u"c"}, {u"", u"a"}, Pairs{{u"a_id", u"id"}}}}));
}

TEST(TheSqliteReader, ReadsACompositeForeignKeyPairByPair) {
    TemporaryDatabase database(
        {"CREATE TABLE line (doc, pos, PRIMARY KEY (doc, pos))",
         "CREATE TABLE part (line_pos, line_doc, other REFERENCES line (doc), "
         "FOREIGN KEY (line_pos, line_doc) REFERENCES line (pos, doc))"});
    const auto keys = keysOf(database, u"part");
    ASSERT_EQ(keys.size(), 2U);
    EXPECT_EQ(keys[0].columns, (Pairs{{u"other", u"doc"}}));
    EXPECT_EQ(keys[1].columns, (Pairs{{u"line_pos", u"pos"}, {u"line_doc", u"doc"}}));
}

TEST(TheSqliteReader, TakesTheParentsPrimaryKeyWhenNoColumnIsNamed) {
    TemporaryDatabase database({"CREATE TABLE line (pos, doc, PRIMARY KEY (doc, pos))",
                                "CREATE TABLE part (d, p, FOREIGN KEY (d, p) REFERENCES line)",
                                "CREATE TABLE note (line_id REFERENCES line)",
                                "CREATE TABLE lost (x REFERENCES nowhere)"});
    const auto keys = keysOf(database, u"part");
    ASSERT_EQ(keys.size(), 1U);
    EXPECT_EQ(keys[0].columns, (Pairs{{u"d", u"doc"}, {u"p", u"pos"}}));
    EXPECT_TRUE(keysOf(database, u"note").empty()); // one column against two
    EXPECT_TRUE(keysOf(database, u"lost").empty());
}

TEST(TheSqliteReader, ReadsAForeignKeyOfATableToItself) {
    TemporaryDatabase database(
        {"CREATE TABLE staff (id INTEGER PRIMARY KEY, boss REFERENCES staff)"});
    EXPECT_EQ(
        keysOf(database, u"staff"),
        (std::vector<ForeignKey>{{{u"", u"staff"}, {u"", u"staff"}, Pairs{{u"boss", u"id"}}}}));
}

TEST(TheSqliteReader, ReadsNamesWithQuotesSpacesAndOtherLetters) {
    const platform::String parent = u"Größe \"XL\" o'clock; --";
    TemporaryDatabase database(
        {QStringLiteral("CREATE TABLE \"Größe \"\"XL\"\" o'clock; --\" "
                        "(\"a\"\"b 'c'\" INTEGER PRIMARY KEY, \"日本\" TEXT, \"%1?\" TEXT)"),
         QStringLiteral("CREATE TABLE [my child] (\"the x\" REFERENCES "
                        "\"Größe \"\"XL\"\" o'clock; --\" (\"a\"\"b 'c'\"))")});
    const auto tables = database.reader().tables();
    ASSERT_TRUE(tables);
    ASSERT_EQ(tables->size(), 2U);
    EXPECT_EQ((*tables)[0].id.name, parent);
    const auto table = database.reader().table({u"", parent});
    ASSERT_TRUE(table) << table.error().toStdString();
    ASSERT_EQ(table->columns.size(), 3U);
    EXPECT_EQ(table->columns[0].name, u"a\"b 'c'");
    EXPECT_EQ(table->columns[1].name, u"日本");
    EXPECT_EQ(table->columns[2].name, u"%1?");
    const auto keys = keysOf(database, u"my child");
    ASSERT_EQ(keys.size(), 1U);
    EXPECT_EQ(keys[0].parent, (TableId{u"", parent}));
    EXPECT_EQ(keys[0].columns, (Pairs{{u"the x", u"a\"b 'c'"}}));
}
