#include <Zandor/reader/dialectOf.h>

#include <QSqlDriver>
#include <QSqlQuery>

namespace zandor::reader {

using model::sql::Dialect;

namespace {

/// What only one engine understands, for those that the driver of ODBC does not know by name.
constexpr std::pair<const char*, Dialect> ownWords[] = {
    {"SELECT sqlite_version()", Dialect::SQLite}, {"SELECT CONNECTION_ID()", Dialect::MySQL}};

} // namespace

Dialect dialectOf(const QSqlDatabase& database) {
    switch (database.driver()->dbmsType()) {
    case QSqlDriver::SQLite: return Dialect::SQLite;
    case QSqlDriver::PostgreSQL: return Dialect::PostgreSQL;
    case QSqlDriver::MySqlServer: return Dialect::MySQL;
    case QSqlDriver::MSSqlServer: return Dialect::SqlServer;
    default: break;
    }
    if (database.driverName() == QLatin1String("QODBC"))
        for (const auto& [words, dialect] : ownWords)
            if (QSqlQuery(database).exec(QLatin1String(words))) return dialect;
    return Dialect::Standard;
}

} // namespace zandor::reader
