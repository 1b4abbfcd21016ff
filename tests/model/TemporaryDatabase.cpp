#include "model/TemporaryDatabase.h"

#include <QSqlError>
#include <QSqlQuery>

#include <gtest/gtest.h>

using namespace zandor;

void writeSqlite(const QString& path, const QStringList& statements) {
    QSqlDatabase database = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), path);
    database.setDatabaseName(path);
    ASSERT_TRUE(database.open());
    const reader::Connection closes(std::exchange(database, {}));
    for (const QString& statement : statements) {
        QSqlQuery query(closes.database());
        ASSERT_TRUE(query.exec(statement))
            << statement.toStdString() << ": " << query.lastError().text().toStdString();
    }
}

TemporaryDatabase::TemporaryDatabase(const QStringList& statements) {
    writeSqlite(path(), statements);
    auto connection = reader::openSqlite(path());
    if (!connection) throw std::runtime_error(connection.error().toStdString());
    mConnection = std::make_unique<reader::Connection>(std::move(*connection));
    mReader = reader::makeSqliteReader(mConnection->database());
}
