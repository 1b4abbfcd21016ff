#include <Zandor/reader/Connection.h>

#include "model/reader/sqliteError.h"

#include <QFile>
#include <QFileInfo>
#include <QSqlError>
#include <QSqlQuery>
#include <QUuid>

#include <optional>

namespace zandor::reader {

using model::say;

namespace {

/// Nothing when the file may be one of SQLite, as far as its kind and its first bytes tell. The
/// driver would open a file of any content and complain at the first query only.
std::optional<Error> complaintAboutFile(const QString& path) {
    const platform::String name = path.toStdU16String();
    const QFileInfo info(path);
    if (!info.exists()) return say<MessageCode::noDatabaseFile>(name);
    if (info.isDir()) return say<MessageCode::folderForDatabase>(name);
    if (!info.isFile()) return say<MessageCode::deviceForDatabase>(name);

    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return say<MessageCode::databaseFileNotRead>(name, file.errorString().toStdU16String());
    const QByteArray signature("SQLite format 3\0", 16);
    const QByteArray start = file.read(signature.size());
    if (start.isEmpty()) return say<MessageCode::databaseFileEmpty>(name);
    if (start != signature) return say<MessageCode::notADatabaseFile>(name);
    return {};
}

} // namespace

Connection::~Connection() {
    const QString name = mDatabase.connectionName();
    if (name.isEmpty()) return;
    mDatabase = {}; // the connection may be removed only when no handle is left
    QSqlDatabase::removeDatabase(name);
}

Result<Connection> openSqlite(const QString& path) {
    if (auto complaint = complaintAboutFile(path)) return std::move(*complaint);
    if (!QSqlDatabase::isDriverAvailable(QStringLiteral("QSQLITE")))
        return Error{say<MessageCode::driverMissing>("SQLite", "libqt6sql6-sqlite")};

    Connection connection(QSqlDatabase::addDatabase(
        QStringLiteral("QSQLITE"), QUuid::createUuid().toString(QUuid::WithoutBraces)));
    QSqlDatabase database = connection.database();
    database.setDatabaseName(path);
    database.setConnectOptions(QStringLiteral("QSQLITE_OPEN_READONLY;QSQLITE_BUSY_TIMEOUT=500"));
    const auto opening =
        say<MessageCode::databaseNotOpened>(QStringLiteral("\"%1\"").arg(path).toStdU16String());
    if (!database.open()) return sqliteError(opening, database.lastError());

    // Opening touches nothing; these read the first page and the schema.
    for (const auto* statement : {"PRAGMA schema_version", "SELECT count(*) FROM sqlite_master"}) {
        QSqlQuery query(database);
        if (!query.exec(QString::fromLatin1(statement)))
            return sqliteError(opening, query.lastError());
    }
    return connection;
}

// By trying, for the words of the engines are in any language, and not all of them give a code.
bool answers(const Connection& connection) {
    return QSqlQuery(connection.database()).exec(QStringLiteral("SELECT 1"));
}

} // namespace zandor::reader
