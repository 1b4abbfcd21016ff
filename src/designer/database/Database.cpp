#include "designer/database/Database.h"

#include "designer/database/Address.h"

#include <Zandor/reader/dialectOf.h>

#include <QCryptographicHash>
#include <QFileInfo>
#include <QSqlError>
#include <QSqlQuery>

namespace zandor::designer {

namespace {

/// All that an SQLite file says of its tables; nothing while it cannot be read.
std::optional<QByteArray> structureOf(const reader::Connection& connection) {
    QSqlQuery query(connection.database());
    query.setForwardOnly(true);
    if (!query.exec(QStringLiteral("SELECT type, name, sql FROM sqlite_master ORDER BY 1, 2")))
        return {};
    QCryptographicHash hash(QCryptographicHash::Sha1);
    while (query.next())
        for (int column = 0; column < 3; ++column)
            hash.addData(query.value(column).toString().toUtf8() + '\0');
    if (query.lastError().isValid()) return {};
    return hash.result();
}

} // namespace

Database::Database(QObject* parent) : QObject(parent) {}
Database::~Database() = default;

std::optional<reader::Error> Database::open(const QString& address, const QString& password) {
    return take(address, password, {});
}

std::optional<reader::Error> Database::open(const QString& address, const QString& password,
                                            Tables tables) {
    return take(address, password, std::move(tables));
}

std::optional<reader::Error> Database::renew() {
    return take(QString(mAddress), QString(mPassword), {});
}

std::optional<reader::Error> Database::renew(Tables tables) {
    return take(QString(mAddress), QString(mPassword), std::move(tables));
}

std::optional<reader::Error> Database::take(const QString& address, const QString& password,
                                            std::optional<Tables> tables) {
    const PartedAddress parted = partPassword(address);
    const QString& secret = password.isEmpty() ? parted.password : password;
    auto connection = reader::openDatabase(parted.address, secret);
    if (!connection) return connection.failure();
    auto reader = std::make_unique<RememberingReader>(reader::makeReader(connection->database()));
    if (!tables) {
        auto read = reader->tables();
        if (!read) return read.failure();
        tables = std::move(*read);
    }
    // The reader goes before the connection that it reads over.
    mReader = std::move(reader);
    mConnection = std::move(*connection);
    mTables = std::move(*tables);
    {
        const QMutexLocker lock(&mTarget);
        mAddress = lastingAddress(parted.address);
        mPassword = secret;
    }
    mLost = false;
    mOutdated = false;
    mMark = isServer() ? std::nullopt : FileMark::of(mAddress);
    mStructure = isServer() ? QByteArray() : structureOf(*mConnection).value_or(QByteArray());
    emit opened();
    return {};
}

void Database::close() {
    mReader.reset(); // before the connection that it reads over
    mConnection.reset();
    mTables.clear();
    {
        const QMutexLocker lock(&mTarget);
        mAddress.clear();
        mPassword.clear();
    }
    mLost = false;
    mOutdated = false;
    mMark.reset();
    emit opened();
}

QString Database::name() const { return nameOfDatabase(mAddress); }

model::sql::Dialect Database::dialect() const {
    return mConnection ? reader::dialectOf(mConnection->database()) : model::sql::Dialect::SQLite;
}

bool Database::isServer() const {
    return mConnection && mConnection->database().driverName() != QLatin1String("QSQLITE");
}

reader::Result<reader::Connection> Database::connect() const { return connector()(); }

Connector Database::connector() const {
    const QMutexLocker lock(&mTarget);
    return connectorTo(mAddress, mPassword);
}

Connector Database::connectorTo(const QString& address, const QString& password) {
    const PartedAddress parted = partPassword(address);
    return [address = parted.address, password = password.isEmpty() ? parted.password : password] {
        return reader::openDatabase(address, password);
    };
}

void Database::sayLost(const QString& message) {
    if (mLost || !isServer()) return;
    mLost = true;
    emit lost(message);
}

void Database::sayFound() {
    if (std::exchange(mLost, false)) emit found();
}

void Database::look() {
    if (mOutdated || !mMark) return;
    const auto change = changed();
    if (!change) return;
    mOutdated = true;
    emit outdated(*change);
}

std::optional<Database::Change> Database::changed() {
    const auto mark = FileMark::of(mAddress);
    if (!mark) return Change::gone;
    if (!mark->isOfSameFile(*mMark)) return Change::replaced;
    const bool hasLog = QFileInfo::exists(mAddress + QStringLiteral("-wal")); // changes go there
    if (*mark == *mMark && !hasLog) return {};
    // Rows come and go, which nobody here minds. Over a connection of its own, for the one that is
    // open remembers pages of a file that may have been written over.
    const auto connection = connect();
    const auto structure = connection ? structureOf(*connection) : std::nullopt;
    if (!structure) return {}; // it is being written; the next look tells
    mMark = mark;
    if (*structure == mStructure) return {};
    return Change::altered;
}

} // namespace zandor::designer
