#pragma once

#include <Zandor/DatabaseReader.h>
#include <Zandor/reader/Connection.h>

#include <QTemporaryDir>

#include <memory>

/// A database file made of SQL statements, opened as a user opens one.
class TemporaryDatabase {
public:
    /// One statement each.
    explicit TemporaryDatabase(const QStringList& statements);

    QString path() const { return mDirectory.filePath(QStringLiteral("test.sqlite")); }
    zandor::reader::DatabaseReader& reader() { return *mReader; }

private:
    QTemporaryDir mDirectory;
    std::unique_ptr<zandor::reader::Connection> mConnection;
    std::unique_ptr<zandor::reader::DatabaseReader> mReader;
};

/// Writes statements into a database file, which is made when it is not there.
void writeSqlite(const QString& path, const QStringList& statements);
