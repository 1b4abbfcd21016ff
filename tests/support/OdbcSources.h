#pragma once

#include <QString>
#include <QStringList>
#include <QTemporaryDir>

#include <optional>

/// The file of a driver, and the package of Debian that has it.
struct OdbcDriver {
    const char* file;
    const char* package;
};

inline constexpr OdbcDriver odbcOfPostgres{"psqlodbcw.so", "odbc-postgresql"};
inline constexpr OdbcDriver odbcOfMaria{"libmaodbc.so", "odbc-mariadb"};
inline constexpr OdbcDriver odbcOfSqlite{"libsqlite3odbc.so", "libsqliteodbc"};

/// Data sources of ODBC that only this program sees, as long as the object is there.
class OdbcSources {
public:
    /// What has to be installed first for a driver, if anything.
    static std::optional<QString> missing(const OdbcDriver& driver);

    OdbcSources();
    ~OdbcSources();
    OdbcSources(const OdbcSources&) = delete;
    OdbcSources& operator=(const OdbcSources&) = delete;

    /// Adds a source with settings like "Database=postgres", and returns its name, which no other
    /// has: what was read of a source is remembered.
    QString add(const OdbcDriver& driver, const QStringList& settings);

private:
    QTemporaryDir mFolder;
};
