#include <Zandor/reader/Connection.h>

#include "model/reader/serverError.h"

#include <Zandor/reader/dialectOf.h>
#include <Zandor/reader/rows.h>

#include <QSqlQuery>
#include <QUrl>
#include <QUrlQuery>
#include <QUuid>

#include <algorithm>
#include <array>
#include <span>
#include <vector>

namespace zandor::reader {

using model::say;

namespace {

/// An option of an address, and what the driver calls it.
struct Option {
    const char* name;
    const char* driverName;
};

// The time that connecting may take, which is last, is given to the driver in any case.
constexpr Option postgresOptions[] = {{"sslmode", "sslmode"},
                                      {"sslrootcert", "sslrootcert"},
                                      {"sslcert", "sslcert"},
                                      {"sslkey", "sslkey"},
                                      {"application_name", "application_name"},
                                      {"connect_timeout", "connect_timeout"}};
constexpr Option mysqlOptions[] = {{"sslrootcert", "SSL_CA"},
                                   {"sslcert", "SSL_CERT"},
                                   {"sslkey", "SSL_KEY"},
                                   {"connect_timeout", "MYSQL_OPT_CONNECT_TIMEOUT"}};
constexpr Option odbcOptions[] = {{"connect_timeout", "SQL_ATTR_LOGIN_TIMEOUT"}};

/// What makes a session one that cannot write, and that reads what the dialect writes. Behind ODBC
/// drivers take no notice of being told to read only, so the engine is told.
std::vector<const char*> beginOf(model::sql::Dialect dialect) {
    using model::sql::Dialect;
    switch (dialect) {
    case Dialect::SQLite: return {"PRAGMA query_only = 1"};
    case Dialect::PostgreSQL: return {"SET default_transaction_read_only = on"};
    case Dialect::MySQL:
        return {"SET SESSION TRANSACTION READ ONLY",
                "SET SESSION sql_mode = REPLACE(@@SESSION.sql_mode, 'NO_BACKSLASH_ESCAPES', '')",
                // Seconds; rows are taken as slowly as somebody reads them in a pipe.
                "SET SESSION net_write_timeout = 86400"};
    case Dialect::SqlServer: // has no such session
    case Dialect::Standard: break;
    }
    return {};
}

struct Engine {
    const char* scheme;
    const char* driver;
    const char* name;
    const char* package; ///< of Debian, with the driver
    std::span<const Option> options;
};

constexpr std::array<Engine, 5> engines = {{
    {"postgresql", "QPSQL", "PostgreSQL", "libqt6sql6-psql", postgresOptions},
    {"postgres", "QPSQL", "PostgreSQL", "libqt6sql6-psql", postgresOptions},
    {"mysql", "QMYSQL", "MySQL", "libqt6sql6-mysql", mysqlOptions},
    {"mariadb", "QMYSQL", "MariaDB", "libqt6sql6-mysql", mysqlOptions},
    {"odbc", "QODBC", "ODBC", "libqt6sql6-odbc", odbcOptions},
}};

const platform::String example = u"postgresql://user@host:5432/database";
const QString hostOption = QStringLiteral("host");

/// The options of an address as the driver takes them, or what is wrong with them. They go into a
/// line that the driver takes apart, so only known names get there.
Result<QStringList> driverOptions(const Engine& engine, const QUrlQuery& query) {
    QStringList options;
    const Option& timeout = engine.options.back();
    bool timed = false;
    for (const auto& item : query.queryItems(QUrl::FullyDecoded)) {
        const QString& name = item.first;
        QString value = item.second;
        const auto known = std::ranges::find_if(
            engine.options, [&](const Option& each) { return name == QLatin1String(each.name); });
        if (known == engine.options.end() && name != hostOption) {
            QStringList names;
            for (const Option& each : engine.options) names << QLatin1String(each.name);
            return Error{
                say<MessageCode::unknownOption>(name.simplified().toStdU16String(),
                                                names.join(QStringLiteral(", ")).toStdU16String())};
        }
        if (value.contains(u';'))
            return Error{say<MessageCode::semicolonInOption>(name.toStdU16String())};
        if (name == hostOption) continue;
        if (engine.options.data() == postgresOptions) { // whose driver reads quotes
            value.replace(u'\\', QStringLiteral("\\\\")).replace(u'\'', QStringLiteral("\\'"));
            value = u'\'' + value + u'\'';
        }
        timed = timed || name == QLatin1String(timeout.name);
        options << QStringLiteral("%1=%2").arg(QLatin1String(known->driverName), value);
    }
    if (!timed) options << QStringLiteral("%1=10").arg(QLatin1String(timeout.driverName));
    return options;
}

Result<Connection> openServer(const Engine& engine, const QUrl& url, const QString& password) {
    const QString driver = QLatin1String(engine.driver);
    if (!QSqlDatabase::isDriverAvailable(driver))
        return Error{say<MessageCode::driverMissing>(engine.name, engine.package)};
    const QUrlQuery query(url.query());
    const auto made = driverOptions(engine, query);
    if (!made) return made.failure();
    QStringList options = *made;

    Connection connection(
        QSqlDatabase::addDatabase(driver, QUuid::createUuid().toString(QUuid::WithoutBraces)));
    QSqlDatabase database = connection.database();
    const QString socket = query.queryItemValue(hostOption, QUrl::FullyDecoded);
    database.setHostName(socket.isEmpty() ? url.host() : socket);
    if (driver == QStringLiteral("QMYSQL") && !socket.isEmpty()) {
        database.setHostName(QStringLiteral("localhost"));
        options << QStringLiteral("UNIX_SOCKET=") + socket;
    }
    if (url.port() > 0) database.setPort(url.port());
    database.setDatabaseName(driver == QStringLiteral("QODBC") ? url.host() : url.path().mid(1));
    if (driver == QStringLiteral("QODBC"))
        options << QStringLiteral("SQL_ATTR_ACCESS_MODE=SQL_MODE_READ_ONLY");
    database.setUserName(url.userName());
    database.setPassword(password.isEmpty() ? url.password() : password);
    database.setConnectOptions(options.join(u';'));
    const auto opening = say<MessageCode::databaseNotOpened>(
        url.toDisplayString(QUrl::RemoveQuery).simplified().toStdU16String());
    if (!database.open()) return serverError(opening, database.lastError());
    for (const char* begin : beginOf(dialectOf(database))) {
        QSqlQuery statement(database);
        if (!statement.exec(QLatin1String(begin)))
            return serverError(opening, statement.lastError());
    }
    return connection;
}

} // namespace

Result<Connection> openDatabase(const QString& address, const QString& password) {
    if (!address.contains(QStringLiteral("://"))) return openSqlite(address);
    const QUrl url(address, QUrl::StrictMode);
    if (url.isLocalFile()) return openSqlite(url.toLocalFile());
    const auto engine = std::find_if(engines.begin(), engines.end(), [&](const Engine& each) {
        return url.scheme() == QLatin1String(each.scheme);
    });
    // Not the address itself: what cannot be read may have a password at any place.
    if (!url.isValid()) return Error{say<MessageCode::addressNotRead>(example)};
    if (engine == engines.end())
        return Error{say<MessageCode::unknownEngine>(url.scheme().toStdU16String(), example)};
    return openServer(*engine, url, password);
}

} // namespace zandor::reader
