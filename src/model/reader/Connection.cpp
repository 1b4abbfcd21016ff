#include <Zandor/reader/Connection.h>

#include "model/reader/sqliteError.h"

#include <QFile>
#include <QFileInfo>
#include <QSqlError>
#include <QSqlQuery>
#include <QUuid>

namespace zandor::reader {

namespace {

/// Nothing when the file may be one of SQLite, as far as its kind and its first bytes tell. The
/// driver would open a file of any content and complain at the first query only.
QString complaintAboutFile(const QString& path) {
    const QString named = QStringLiteral("\"%1\"").arg(path);
    const QFileInfo info(path);
    if (!info.exists()) return QStringLiteral("There is no file %1; check the path.").arg(named);
    if (info.isDir())
        return QStringLiteral("%1 is a folder; choose a database file in it.").arg(named);
    if (!info.isFile())
        return QStringLiteral("%1 is a device, not a file; choose a database file.").arg(named);

    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return QStringLiteral("The file %1 cannot be read (%2); ask its owner for permission.")
            .arg(named, file.errorString());
    const QByteArray signature("SQLite format 3\0", 16);
    const QByteArray start = file.read(signature.size());
    if (start.isEmpty())
        return QStringLiteral("The file %1 is empty; choose a file that holds a database.")
            .arg(named);
    if (start != signature)
        return QStringLiteral("The file %1 is not an SQLite database, or it is encrypted; choose "
                              "another file.")
            .arg(named);
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
    const QString complaint = complaintAboutFile(path);
    if (!complaint.isEmpty()) return Error{complaint};
    if (!QSqlDatabase::isDriverAvailable(QStringLiteral("QSQLITE")))
        return Error{QStringLiteral("The Qt driver for SQLite is missing; install it (Debian: "
                                    "apt install libqt6sql6-sqlite).")};

    Connection connection(QSqlDatabase::addDatabase(
        QStringLiteral("QSQLITE"), QUuid::createUuid().toString(QUuid::WithoutBraces)));
    QSqlDatabase database = connection.database();
    database.setDatabaseName(path);
    database.setConnectOptions(QStringLiteral("QSQLITE_OPEN_READONLY;QSQLITE_BUSY_TIMEOUT=500"));
    const QString opening = QStringLiteral("The database \"%1\" cannot be opened").arg(path);
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
