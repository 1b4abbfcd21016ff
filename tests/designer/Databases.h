#pragma once

#include "designer/OpenedQuery.h"

#include <QString>
#include <QStringList>
#include <QTemporaryDir>

/// The sample database, and folders with databases of a test's own.
QString sampleDatabase();
/// The names of its sixteen tables and views.
QStringList sampleTables();

/// The query that the designer opens with over the sample, or one of these tables; fails the test
/// when it opens none.
zandor::designer::OpenedQuery openedSample(const QStringList& tables = {});
/// The query that the designer opens with over a database.
zandor::reader::Result<zandor::designer::OpenedQuery>
openDatabaseFile(const QString& file, const zandor::designer::FirstTables& wanted = {});

class DatabaseFolder {
public:
    /// Makes an SQLite file by statements and returns its path.
    QString database(const QString& name, const QStringList& statements);
    /// A file with any content.
    QString file(const QString& name, const QByteArray& content);
    QString path(const QString& name) const { return mFolder.filePath(name); }

private:
    QTemporaryDir mFolder;
};
