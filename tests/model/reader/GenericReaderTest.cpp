#include "model/TemporaryDatabase.h"

#include <gtest/gtest.h>

using namespace zandor;

// On SQLite, whose Qt driver can be had everywhere: the reader asks the driver only.

namespace {

using model::ColumnType;

struct Opened {
    explicit Opened(const QStringList& statements) : database(statements) {
        auto opened = reader::openDatabase(database.path());
        if (!opened) throw std::runtime_error(opened.error().toStdString());
        connection = std::make_unique<reader::Connection>(std::move(*opened));
        generic = reader::makeGenericReader(connection->database());
    }

    TemporaryDatabase database;
    std::unique_ptr<reader::Connection> connection;
    std::unique_ptr<reader::DatabaseReader> generic;
};

} // namespace

TEST(TheGenericReader, ListsTablesAndViewsByName) {
    const Opened opened({QStringLiteral("CREATE TABLE b (x INTEGER)"),
                         QStringLiteral("CREATE TABLE \"C d\" (x INTEGER)"),
                         QStringLiteral("CREATE VIEW a AS SELECT x FROM b")});
    const auto tables = opened.generic->tables();
    ASSERT_TRUE(tables) << tables.error().toStdString();
    EXPECT_EQ(*tables, (std::vector<reader::TableEntry>{
                           {{u"", u"a"}, true}, {{u"", u"b"}, false}, {{u"", u"C d"}, false}}));
}

TEST(TheGenericReader, ReadsColumnsWithTheirTypesAndTheKey) {
    const Opened opened({QStringLiteral(
        "CREATE TABLE t (b INTEGER, a VARCHAR(9), d BLOB, e DOUBLE, PRIMARY KEY (a, b))")});
    const auto table = opened.generic->table({u"", u"t"});
    ASSERT_TRUE(table) << table.error().toStdString();
    EXPECT_EQ(table->columns,
              (std::vector<model::ColumnDescription>{{u"b", ColumnType::Integer, u"", true},
                                                     {u"a", ColumnType::Text, u"", true},
                                                     {u"d", ColumnType::Blob, u"", false},
                                                     {u"e", ColumnType::Decimal, u"", false}}));
}

TEST(TheGenericReader, SaysWhichTableIsNotThere) {
    const Opened opened({QStringLiteral("CREATE TABLE t (b INTEGER)")});
    EXPECT_EQ(opened.generic->table({u"", u"gone"}).error(),
              QStringLiteral("The table \"gone\" is not in the database; read the list of tables "
                             "afresh."));
}

TEST(TheGenericReader, SaysThatTheConnectionIsClosed) {
    const auto closed = reader::makeGenericReader(QSqlDatabase());
    EXPECT_EQ(closed->tables().error(),
              QStringLiteral("The list of tables cannot be read (the connection is closed): open "
                             "the database afresh."));
}
