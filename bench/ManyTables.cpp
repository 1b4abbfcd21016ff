#include "ManyTables.h"

#include <Zandor/reader/Connection.h>

#include <QSqlError>
#include <QSqlQuery>

#include <utility>

namespace manytables {

namespace {

void must(QSqlQuery& query, const QString& statement) {
    if (!query.exec(statement)) qFatal("%s", qPrintable(query.lastError().text()));
}

} // namespace

void make(const QSqlDatabase& database) {
    QSqlQuery query(database);
    for (int n = 0; n < count; ++n) {
        if (n % 500 == 0) must(query, QStringLiteral("BEGIN"));
        must(query, QStringLiteral("CREATE TABLE table_%1 (id INTEGER PRIMARY KEY, name "
                                   "VARCHAR(40), other INTEGER REFERENCES table_0 (id))")
                        .arg(n));
        if (n % 500 == 499) must(query, QStringLiteral("COMMIT"));
    }
}

void makeSqlite(const QString& path) {
    QSqlDatabase database =
        QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), QStringLiteral("making"));
    database.setDatabaseName(path);
    if (!database.open()) qFatal("%s", qPrintable(database.lastError().text()));
    const zandor::reader::Connection closes(std::exchange(database, {}));
    make(closes.database());
}

void listOwn(const QSqlDatabase& database) {
    const bool sqlite = database.driverName() == QStringLiteral("QSQLITE");
    QSqlQuery query(database);
    query.setForwardOnly(sqlite);
    must(query,
         sqlite
             ? QStringLiteral("SELECT name FROM sqlite_master WHERE type = 'table' ORDER BY name")
             : QStringLiteral("SELECT relname FROM pg_class WHERE relkind = 'r' ORDER BY relname"));
    int names = 0;
    while (query.next()) names += !query.value(0).toString().isEmpty();
    if (names < count) qFatal("only %d names", names);
}

} // namespace manytables
