#include "Databases.h"

#include "designer/database/Database.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QSqlError>
#include <QSqlQuery>

#include <cstdio>
#include <thread>

using namespace zandor;

using designer::Database;
using reader::TableId;

namespace {

class ADatabase : public testing::Test {
protected:
    QString make(const QString& name) {
        return folder.database(name, {QStringLiteral("CREATE TABLE a (id INTEGER PRIMARY KEY)"),
                                      QStringLiteral("CREATE VIEW b AS SELECT * FROM a")});
    }

    std::size_t columnsOf(const TableId& id) {
        const auto table = database.reader().table(id);
        return table ? table->columns.size() : 0;
    }

    /// What the database tells of its file, look after look.
    std::vector<Database::Change> looked() {
        std::vector<Database::Change> told;
        const auto connection =
            QObject::connect(&database, &Database::outdated,
                             [&](Database::Change change) { told.push_back(change); });
        database.look();
        database.look();
        QObject::disconnect(connection);
        return told;
    }

    DatabaseFolder folder;
    Database database;
};

} // namespace

TEST_F(ADatabase, IsOpenWithItsTablesAndItsName) {
    EXPECT_FALSE(database.isOpen());
    int opened = 0;
    QObject::connect(&database, &Database::opened, [&] { ++opened; });
    const QString path = make(QStringLiteral("year #1.sqlite"));
    EXPECT_EQ(database.open(path), std::nullopt);
    EXPECT_EQ(opened, 1);
    EXPECT_EQ(database.address(), path);
    EXPECT_EQ(database.name(), "year #1.sqlite");
    EXPECT_EQ(database.dialect(), model::sql::Dialect::SQLite);
    EXPECT_FALSE(database.isServer());
    ASSERT_EQ(database.tables().size(), 2U);
    EXPECT_TRUE(database.tables()[1].isView);
}

TEST_F(ADatabase, IsKnownByItsWholePathWhateverTheWorkingFolder) {
    const QString path = make(QStringLiteral("a.sqlite"));
    ASSERT_EQ(database.open(QDir().relativeFilePath(path)), std::nullopt);
    EXPECT_EQ(database.address(), path);
}

TEST_F(ADatabase, StaysAsItIsWhenAnotherCannotBeOpened) {
    const QString path = make(QStringLiteral("a.sqlite"));
    ASSERT_EQ(database.open(path), std::nullopt);
    int opened = 0;
    QObject::connect(&database, &Database::opened, [&] { ++opened; });
    const auto error = database.open(folder.path(QStringLiteral("none.sqlite")));
    ASSERT_TRUE(error);
    EXPECT_TRUE(error->message.is(reader::MessageCode::noDatabaseFile))
        << error->text().toStdString();
    EXPECT_EQ(opened, 0);
    EXPECT_EQ(database.address(), path);
    EXPECT_TRUE(database.reader().table({u"", u"a"}));
}

TEST_F(ADatabase, RefusesToBeWrittenTo) {
    ASSERT_EQ(database.open(make(QStringLiteral("a.sqlite"))), std::nullopt);
    const auto connection = database.connect();
    ASSERT_TRUE(connection);
    QSqlQuery query(connection->database());
    EXPECT_FALSE(query.exec(QStringLiteral("INSERT INTO a VALUES (1)")));
    EXPECT_TRUE(query.lastError().databaseText().contains(QStringLiteral("readonly")))
        << query.lastError().text().toStdString();
    EXPECT_FALSE(query.exec(QStringLiteral("CREATE TABLE c (x)")));
    EXPECT_FALSE(query.exec(QStringLiteral("DROP TABLE a")));
}

TEST_F(ADatabase, GivesConnectionsToOtherThreads) {
    ASSERT_EQ(database.open(make(QStringLiteral("a.sqlite"))), std::nullopt);
    bool answered = false;
    std::thread([&] {
        const auto connection = database.connect();
        answered = connection && reader::answers(*connection);
    }).join();
    EXPECT_TRUE(answered);
}

TEST_F(ADatabase, ReadsEveryTableOnceAndAfreshWhenItIsRenewed) {
    const QString path = make(QStringLiteral("a.sqlite"));
    ASSERT_EQ(database.open(path), std::nullopt);
    const TableId a{u"", u"a"};
    EXPECT_FALSE(database.reader().knowsTable(a));
    ASSERT_TRUE(database.reader().table(a));
    EXPECT_TRUE(database.reader().knowsTable(a));
    QFile::remove(path);
    folder.database(QStringLiteral("a.sqlite"), {QStringLiteral("CREATE TABLE a (x, y, z)"),
                                                 QStringLiteral("CREATE TABLE c (x)")});
    EXPECT_EQ(columnsOf(a), 1U);
    EXPECT_EQ(database.renew(), std::nullopt);
    EXPECT_EQ(columnsOf(a), 3U);
    EXPECT_EQ(database.tables().size(), 2U);
}

TEST_F(ADatabase, OfAFileCannotBeLost) {
    const QString path = make(QStringLiteral("a.sqlite"));
    ASSERT_EQ(database.open(path), std::nullopt);
    int lost = 0;
    QObject::connect(&database, &Database::lost, [&] { ++lost; });
    QFile::remove(path);
    database.sayLost(QStringLiteral("gone"));
    EXPECT_EQ(lost, 0);
    EXPECT_TRUE(database.reader().table({u"", u"a"}));
}

TEST_F(ADatabase, SaysNothingWhileOthersWriteRows) {
    const QString path = make(QStringLiteral("a.sqlite"));
    ASSERT_EQ(database.open(path), std::nullopt);
    EXPECT_TRUE(looked().empty());
    folder.database(QStringLiteral("a.sqlite"), {QStringLiteral("INSERT INTO a VALUES (1)")});
    EXPECT_TRUE(looked().empty());
}

TEST_F(ADatabase, SaysOnceThatAnotherFileHasTakenItsPlace) {
    const QString path = make(QStringLiteral("a.sqlite"));
    const QString other = make(QStringLiteral("b.sqlite"));
    ASSERT_EQ(database.open(path), std::nullopt);
    ASSERT_EQ(::rename(other.toLocal8Bit().constData(), path.toLocal8Bit().constData()), 0);
    EXPECT_EQ(looked(), std::vector{Database::Change::replaced});
    ASSERT_EQ(database.renew(), std::nullopt);
    EXPECT_TRUE(looked().empty());
}

TEST_F(ADatabase, SaysThatItIsWrittenOverByAnother) {
    const QString path = make(QStringLiteral("a.sqlite"));
    const QString other =
        folder.database(QStringLiteral("b.sqlite"), {QStringLiteral("CREATE TABLE other (id)"),
                                                     QStringLiteral("CREATE TABLE more (id)")});
    ASSERT_EQ(database.open(path), std::nullopt);
    QFile from(other), into(path);
    ASSERT_TRUE(from.open(QIODevice::ReadOnly) && into.open(QIODevice::WriteOnly));
    into.write(from.readAll());
    into.close();
    EXPECT_EQ(looked(), std::vector{Database::Change::altered});
}

TEST_F(ADatabase, SaysThatItsTablesAreOthersInALogTooAndThatItIsGone) {
    const QString path = make(QStringLiteral("a.sqlite"));
    folder.database(QStringLiteral("a.sqlite"), {QStringLiteral("PRAGMA journal_mode = WAL")});
    ASSERT_EQ(database.open(path), std::nullopt);
    folder.database(QStringLiteral("a.sqlite"), {QStringLiteral("CREATE TABLE c (id)")});
    EXPECT_EQ(looked(), std::vector{Database::Change::altered});
    ASSERT_EQ(database.renew(), std::nullopt);
    ASSERT_TRUE(QFile::remove(path));
    EXPECT_EQ(looked(), std::vector{Database::Change::gone});
}
