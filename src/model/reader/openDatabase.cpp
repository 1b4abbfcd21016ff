#include <Zandor/reader/Connection.h>

#include "model/reader/serverError.h"

#include <Zandor/reader/rows.h>

#include <QSqlQuery>
#include <QUrl>
#include <QUrlQuery>
#include <QUuid>

#include <algorithm>
#include <array>
#include <optional>

namespace zandor::reader {

using model::say;

namespace {

struct Engine {
    const char* scheme;
    const char* driver;
    const char* name;
    const char* package; ///< of Debian, with the driver
    const char* options; ///< for the driver
    /// Makes the session one that cannot write.
    const char* readOnly;
};

constexpr std::array<Engine, 5> engines = {{
    {"postgresql", "QPSQL", "PostgreSQL", "libqt6sql6-psql", "",
     "SET default_transaction_read_only = on"},
    {"postgres", "QPSQL", "PostgreSQL", "libqt6sql6-psql", "",
     "SET default_transaction_read_only = on"},
    {"mysql", "QMYSQL", "MySQL", "libqt6sql6-mysql", "MYSQL_OPT_CONNECT_TIMEOUT=10",
     "SET SESSION TRANSACTION READ ONLY"},
    {"mariadb", "QMYSQL", "MariaDB", "libqt6sql6-mysql", "MYSQL_OPT_CONNECT_TIMEOUT=10",
     "SET SESSION TRANSACTION READ ONLY"},
    {"odbc", "QODBC", "ODBC", "libqt6sql6-odbc",
     "SQL_ATTR_ACCESS_MODE=SQL_MODE_READ_ONLY;SQL_ATTR_LOGIN_TIMEOUT=10", nullptr},
}};

const platform::String example = u"postgresql://user@host:5432/database";

/// The options of an address as the driver of PostgreSQL takes them, or what is wrong with them.
/// They go into a line that the driver makes, so only known names get there, and values in quotes.
Result<QString> postgresOptions(const QUrlQuery& query) {
    static const QStringList known = {
        QStringLiteral("sslmode"),         QStringLiteral("sslrootcert"),
        QStringLiteral("sslcert"),         QStringLiteral("sslkey"),
        QStringLiteral("connect_timeout"), QStringLiteral("application_name")};
    QString options;
    bool timed = false;
    for (auto [name, value] : query.queryItems(QUrl::FullyDecoded)) {
        if (name == QStringLiteral("host")) continue;
        if (!known.contains(name))
            return Error{
                say<MessageCode::unknownOption>(name.simplified().toStdU16String(),
                                                known.join(QStringLiteral(", ")).toStdU16String())};
        if (value.contains(u';'))
            return Error{say<MessageCode::semicolonInOption>(name.toStdU16String())};
        timed = timed || name == QStringLiteral("connect_timeout");
        value.replace(u'\\', QStringLiteral("\\\\")).replace(u'\'', QStringLiteral("\\'"));
        options += QStringLiteral("%1='%2';").arg(name, value);
    }
    if (!timed) options += QStringLiteral("connect_timeout=10");
    return options;
}

Result<Connection> openServer(const Engine& engine, const QUrl& url, const QString& password) {
    const QString driver = QLatin1String(engine.driver);
    if (!QSqlDatabase::isDriverAvailable(driver))
        return Error{say<MessageCode::driverMissing>(engine.name, engine.package)};
    QString options = QLatin1String(engine.options);
    const QUrlQuery query(url.query());
    if (driver == QStringLiteral("QPSQL")) {
        const auto made = postgresOptions(query);
        if (!made) return made.failure();
        options = *made;
    }

    Connection connection(
        QSqlDatabase::addDatabase(driver, QUuid::createUuid().toString(QUuid::WithoutBraces)));
    QSqlDatabase database = connection.database();
    const QString folder = query.queryItemValue(QStringLiteral("host"), QUrl::FullyDecoded);
    database.setHostName(folder.isEmpty() ? url.host() : folder);
    if (url.port() > 0) database.setPort(url.port());
    database.setDatabaseName(driver == QStringLiteral("QODBC") ? url.host() : url.path().mid(1));
    database.setUserName(url.userName());
    database.setPassword(password.isEmpty() ? url.password() : password);
    database.setConnectOptions(options);
    const auto opening = say<MessageCode::databaseNotOpened>(
        url.toDisplayString(QUrl::RemoveQuery).simplified().toStdU16String());
    if (!database.open()) return serverError(opening, database.lastError());
    if (engine.readOnly) {
        QSqlQuery statement(database);
        if (!statement.exec(QLatin1String(engine.readOnly)))
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
