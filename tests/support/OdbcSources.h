#pragma once

#include <QString>
#include <QStringList>
#include <QTemporaryDir>

#include <optional>

/// Data sources of ODBC that only this program sees, as long as the object is there.
class OdbcSources {
public:
    /// What has to be installed first for a driver, if anything: the file of the driver, and the
    /// package of Debian that has it.
    static std::optional<QString> missing(const QString& driver, const QString& package);

    OdbcSources();
    ~OdbcSources();
    OdbcSources(const OdbcSources&) = delete;
    OdbcSources& operator=(const OdbcSources&) = delete;

    /// Adds a source with settings like "Database=postgres", and returns its name, which no other
    /// has: what was read of a source is remembered. The driver is a file's name.
    QString add(const QString& driver, const QStringList& settings);

private:
    QTemporaryDir mFolder;
};
