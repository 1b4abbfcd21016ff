#include <Zandor/reader/dialectOf.h>

namespace zandor::reader {

model::sql::Dialect dialectOf(const QSqlDatabase& database) {
    using model::sql::Dialect;
    const QString driver = database.driverName();
    if (driver == QLatin1String("QPSQL")) return Dialect::PostgreSQL;
    if (driver == QLatin1String("QMYSQL")) return Dialect::MySQL;
    return driver == QLatin1String("QSQLITE") ? Dialect::SQLite : Dialect::Standard;
}

} // namespace zandor::reader
