#include <Zandor/reader/rows.h>

#include "model/reader/serverError.h"
#include "model/reader/sqliteError.h"

#include <Zandor/reader/dialectOf.h>

namespace zandor::reader {

QString toQt(const platform::String& text) { return QString::fromStdU16String(text); }

platform::String textAt(const QSqlQuery& row, int column) {
    return row.value(column).toString().toStdU16String();
}

namespace {

/// Behind ODBC a driver guesses what type a parameter has, and tells the world when it guessed
/// wrong; so the values, all of them texts, are written out. No reader's statement has another "?".
QString withValues(QString statement, const QVariantList& values, model::sql::Dialect dialect) {
    qsizetype at = 0;
    for (const QVariant& value : values) {
        const QString text = toQt(model::sql::literal(
            {model::ColumnType::Text, value.toString().toStdU16String()}, dialect));
        at = statement.indexOf(u'?', at);
        statement.replace(at, 1, text);
        at += text.size();
    }
    return statement;
}

} // namespace

std::optional<Error> readRows(const QSqlDatabase& database, const model::Message& failed,
                              const QString& statement, const QVariantList& parameters,
                              const std::function<void(const QSqlQuery&)>& use) {
    QSqlQuery query(database);
    // SQLite then keeps no rows. From a server they come one by one, which takes longer.
    query.setForwardOnly(database.driverName() == QStringLiteral("QSQLITE"));
    // Without parameters it goes to the engine in one step.
    bool done = false;
    if (parameters.isEmpty()) {
        done = query.exec(statement);
    } else if (database.driverName() == QStringLiteral("QODBC")) {
        done = query.exec(withValues(statement, parameters, dialectOf(database)));
    } else {
        done = query.prepare(statement);
        for (const QVariant& parameter : parameters) query.addBindValue(parameter);
        done = done && query.exec();
    }
    while (done && query.next()) use(query);
    // A failure between two rows ends the loop like the last row does.
    if (done && !query.lastError().isValid()) return {};
    return databaseError(database, failed, query.lastError());
}

Error databaseError(const QSqlDatabase& database, const model::Message& failed,
                    const QSqlError& error) {
    if (database.driverName() == QStringLiteral("QSQLITE")) return sqliteError(failed, error);
    return serverError(failed, error);
}

} // namespace zandor::reader
