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
    runOnServer(
        {QStringLiteral("SELECT pg_terminate_backend(pid) FROM pg_stat_activity "
                        "WHERE pid <> pg_backend_pid() AND backend_type = 'client backend'")});
    const auto tables = schema->tables();
    ASSERT_FALSE(tables);
    EXPECT_TRUE(tables.error().startsWith(QStringLiteral("The list of tables cannot be read (")))
        << tables.error().toStdString();
    EXPECT_TRUE(tables.error().endsWith(QStringLiteral("open the database afresh.")))
        << tables.error().toStdString();
    EXPECT_FALSE(tables.error().contains(u'\n'));
}
