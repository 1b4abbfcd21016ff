#include "OneServer.h"

#include <Zandor/DatabaseReader.h>

using namespace zandor;

TEST(AConnectionToPostgres, CannotWrite) {
    const auto opened = reader::openDatabase(serverAddress());
    ASSERT_TRUE(opened) << opened.error().toStdString();
    QSqlQuery query(opened->database());
    EXPECT_FALSE(query.exec(QStringLiteral("CREATE TABLE written (x int)")));
    EXPECT_TRUE(query.lastError().databaseText().contains(QStringLiteral("read-only")))
        << query.lastError().text().toStdString();
}

TEST(AConnectionToPostgres, SaysWhichDatabaseOrUserIsNotThere) {
    const auto noDatabase =
        reader::openDatabase(serverAddress(QStringLiteral("postgres"), QStringLiteral("gone")));
    EXPECT_TRUE(noDatabase.error().endsWith(QStringLiteral("check the name of the database.")))
        << noDatabase.error().toStdString();
    EXPECT_TRUE(noDatabase.error().startsWith(
        QStringLiteral("The database postgresql://postgres@localhost/gone cannot be opened (")))
        << noDatabase.error().toStdString();
    EXPECT_FALSE(noDatabase.error().contains(u'\n'));
    const auto noUser = reader::openDatabase(serverAddress(QStringLiteral("nobody")));
    EXPECT_TRUE(noUser.error().endsWith(QStringLiteral("check the user name.")))
        << noUser.error().toStdString();
}

TEST(AConnectionToPostgres, SaysThatTheServerEndedIt) {
    const auto opened = reader::openDatabase(serverAddress());
    ASSERT_TRUE(opened) << opened.error().toStdString();
    const auto schema = reader::makeReader(opened->database());
    ASSERT_TRUE(schema->tables());
    EXPECT_TRUE(reader::answers(*opened));
    runOnServer(
        {QStringLiteral("SELECT pg_terminate_backend(pid) FROM pg_stat_activity "
                        "WHERE pid <> pg_backend_pid() AND backend_type = 'client backend'")});
    EXPECT_FALSE(reader::answers(*opened));
    const auto tables = schema->tables();
    ASSERT_FALSE(tables);
    EXPECT_TRUE(tables.error().startsWith(QStringLiteral("The list of tables cannot be read (")))
        << tables.error().toStdString();
    EXPECT_TRUE(tables.error().endsWith(QStringLiteral("open the database afresh.")))
        << tables.error().toStdString();
    EXPECT_FALSE(tables.error().contains(u'\n'));
}

TEST(AConnectionToPostgres, IsWaitedForUnlessTheAddressSaysOtherwiseForTenSeconds) {
    const auto options = [](const char* more) {
        const auto opened = reader::openDatabase(serverAddress() + QString::fromLatin1(more));
        EXPECT_TRUE(opened) << opened.error().toStdString();
        return opened ? opened->database().connectOptions().toStdString() : std::string();
    };
    EXPECT_EQ(options(""), "connect_timeout=10");
    EXPECT_EQ(options("&connect_timeout=3"), "connect_timeout='3'");
}

TEST(AConnectionToPostgres, TellsTheGenericReaderOfEachKindOfColumn) {
    runOnServer({QStringLiteral("DROP TABLE IF EXISTS kinds"),
                 QStringLiteral("CREATE TABLE kinds (large bigint PRIMARY KEY, real double "
                                "precision, truth boolean, word text, \"on\" date, at time, "
                                "since timestamp, bytes bytea)")});
    const auto opened = reader::openDatabase(serverAddress());
    ASSERT_TRUE(opened) << opened.error().toStdString();
    const auto generic = reader::makeGenericReader(opened->database());
    const auto kinds = generic->table({u"", u"kinds"});
    ASSERT_TRUE(kinds) << kinds.error().toStdString();
    using model::ColumnType;
    std::vector<ColumnType> types;
    for (const auto& column : kinds->columns) types.push_back(column.type);
    EXPECT_EQ(types, (std::vector{ColumnType::Integer, ColumnType::Decimal, ColumnType::Boolean,
                                  ColumnType::Text, ColumnType::Date, ColumnType::Time,
                                  ColumnType::Timestamp, ColumnType::Blob}));
    EXPECT_TRUE(kinds->columns.front().primaryKey);
}
