#pragma once

#include "designer/OpenedQuery.h"

#include <QString>
#include <QStringList>
#include <QTemporaryDir>

/// The sample database, and folders with databases of a test's own.
QString sampleDatabase();

/// The query that the designer opens with these arguments over the sample; fails the test when it
/// opens none.
designer::OpenedQuery openedSample(const designer::Arguments& arguments = {});

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
