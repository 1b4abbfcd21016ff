#include "designer/run/keepToOne.h"

#include "designer/run/driverFunction.h"

#include <QSqlDatabase>
#include <QSqlDriver>
#include <QVariant>

namespace zandor::designer {

namespace {

void* connectionOf(const QSqlDatabase& database) {
    const QVariant handle = database.driver()->handle();
    return handle.isValid() ? *static_cast<void* const*>(handle.constData()) : nullptr;
}

/// What is prepared over the wire is one statement; SQL's own PREPARE would take what follows too.
std::optional<QString> preparedByPostgres(const QSqlDatabase& database, const QString& statement) {
    void* (*prepare)(void*, const char*, const char*, int, const unsigned*) = nullptr;
    int (*status)(const void*) = nullptr;
    const char* (*field)(const void*, int) = nullptr;
    void (*clear)(void*) = nullptr;
    void* const connection = connectionOf(database);
    const bool found = connection && findInDriver(database, "PQprepare", prepare) &&
                       findInDriver(database, "PQresultStatus", status) &&
                       findInDriver(database, "PQresultErrorField", field) &&
                       findInDriver(database, "PQclear", clear);
    if (!found) return QStringLiteral("PQprepare");
    constexpr int commandOk = 1;
    void* const result = prepare(connection, "", statement.toUtf8().constData(), 0, nullptr);
    const bool well = status(result) == commandOk;
    const QString said = QString::fromUtf8(field(result, 'M'));
    const QString hint = QString::fromUtf8(field(result, 'H'));
    clear(result);
    if (well) return {};
    return hint.isEmpty() ? said : QStringLiteral("%1 (%2)").arg(said, hint);
}

std::optional<QString> toldToMysql(const QSqlDatabase& database) {
    int (*tell)(void*, int) = nullptr;
    const char* (*words)(void*) = nullptr;
    void* const connection = connectionOf(database);
    const bool found = connection && findInDriver(database, "mysql_set_server_option", tell) &&
                       findInDriver(database, "mysql_error", words);
    if (!found) return QStringLiteral("mysql_set_server_option");
    constexpr int severalOff = 1;
    if (tell(connection, severalOff) == 0) return {};
    return QString::fromUtf8(words(connection));
}

} // namespace

std::optional<QString> keepToOne(const QSqlDatabase& database, const QString& statement) {
    if (database.driverName() == QLatin1String("QPSQL"))
        return preparedByPostgres(database, statement);
    if (database.driverName() == QLatin1String("QMYSQL")) return toldToMysql(database);
    return {};
}

} // namespace zandor::designer
