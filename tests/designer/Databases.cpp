#include "Databases.h"

#include "designer/database/Database.h"

#include <gtest/gtest.h>

#include <QFile>
#include <QSqlDatabase>
#include <QSqlError>
#include <QSqlQuery>

using namespace zandor;

QString sampleDatabase() { return QStringLiteral(ZANDOR_SAMPLE_DATABASE); }

QStringList sampleTables() {
    designer::Database database;
    EXPECT_EQ(database.open(sampleDatabase()), std::nullopt);
    QStringList names;
    for (const auto& entry : database.tables()) names << QString::fromStdU16String(entry.id.name);
    return names;
}

designer::OpenedQuery openedSample(const QStringList& tables) {
    const auto opened =
        openDatabaseFile(sampleDatabase(), {.names = tables, .example = tables.isEmpty()});
    if (!opened) {
        ADD_FAILURE() << opened.error().toStdString();
        return {platform::makeRef<model::Query>(), {}};
    }
    return *opened;
}

reader::Result<designer::OpenedQuery> openDatabaseFile(const QString& file,
                                                       const designer::FirstTables& wanted) {
    designer::Database database;
    if (const auto error = database.open(file)) return *error;
    return designer::openQuery(database.reader(), database.tables(), wanted);
}

QString DatabaseFolder::database(const QString& name, const QStringList& statements) {
    const QString connection = QStringLiteral("made for a test");
    {
        auto database = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), connection);
        database.setDatabaseName(path(name));
        EXPECT_TRUE(database.open()) << database.lastError().text().toStdString();
        QSqlQuery query(database);
        for (const QString& statement : statements)
            EXPECT_TRUE(query.exec(statement)) << query.lastError().text().toStdString();
    }
    QSqlDatabase::removeDatabase(connection);
    return path(name);
}

QString DatabaseFolder::file(const QString& name, const QByteArray& content) {
    QFile file(path(name));
    EXPECT_TRUE(file.open(QIODevice::WriteOnly));
    file.write(content);
    return path(name);
}
