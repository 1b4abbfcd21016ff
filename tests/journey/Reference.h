#pragma once

#include <QSqlDatabase>
#include <QSqlError>
#include <QSqlQuery>
#include <QStringList>

#include <gtest/gtest.h>

/// The rows of a statement of two columns, written by hand, over the sample database; as the
/// designer shows them.
inline QStringList reference(const QString& statement) {
    QStringList rows;
    {
        auto database = QSqlDatabase::addDatabase("QSQLITE", "reference");
        database.setDatabaseName(QStringLiteral(ZANDOR_SAMPLE_DATABASE));
        EXPECT_TRUE(database.open());
        QSqlQuery query(statement, database);
        EXPECT_TRUE(query.isActive()) << query.lastError().text().toStdString();
        while (query.next()) rows += query.value(0).toString() + " | " + query.value(1).toString();
    }
    QSqlDatabase::removeDatabase("reference");
    return rows;
}
