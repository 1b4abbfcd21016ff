#include "designer/database/Database.h"

#include <QFileInfo>
#include <QUrl>

namespace designer {

Database::Database(QObject* parent) : QObject(parent) {}
Database::~Database() = default;

std::optional<QString> Database::open(const QString& address, const QString& password) {
    auto connection = reader::openDatabase(address, password);
    if (!connection) return connection.error();
    auto reader = reader::makeReader(connection->database());
    const auto tables = reader->tables();
    if (!tables) return tables.error();
    mReader = std::move(reader);
    mConnection = std::move(*connection);
    mTables = *tables;
    mAddress = address;
    mPassword = password;
    emit opened();
    return {};
}

std::optional<QString> Database::renew() { return open(QString(mAddress), QString(mPassword)); }

bool Database::isOpen() const { return mConnection.has_value(); }

QString Database::name() const { return QFileInfo(QUrl(mAddress).path()).fileName(); }

model::sql::Dialect Database::dialect() const {
    using model::sql::Dialect;
    if (!mConnection) return Dialect::SQLite;
    const QString driver = mConnection->database().driverName();
    if (driver == QLatin1String("QPSQL")) return Dialect::PostgreSQL;
    if (driver == QLatin1String("QMYSQL")) return Dialect::MySQL;
    return driver == QLatin1String("QSQLITE") ? Dialect::SQLite : Dialect::Standard;
}

reader::Result<reader::Connection> Database::connect() const {
    return reader::openDatabase(mAddress, mPassword);
}

} // namespace designer
