#include "designer/database/Database.h"

#include "designer/database/Address.h"
#include "model/reader/dialectOf.h"

#include <QFileInfo>

namespace designer {

namespace {

/// Good in every working folder.
QString lasting(const QString& address) {
    const auto parts = parseAddress(address);
    return parts && parts->engine == Engine::SQLite ? QFileInfo(parts->file).absoluteFilePath()
                                                    : address;
}

} // namespace

Database::Database(QObject* parent) : QObject(parent) {}
Database::~Database() = default;

std::optional<QString> Database::open(const QString& address, const QString& password) {
    return take(address, password, {});
}

std::optional<QString> Database::open(const QString& address, const QString& password,
                                      Tables tables) {
    return take(address, password, std::move(tables));
}

std::optional<QString> Database::renew() { return take(QString(mAddress), QString(mPassword), {}); }

std::optional<QString> Database::renew(Tables tables) {
    return take(QString(mAddress), QString(mPassword), std::move(tables));
}

std::optional<QString> Database::take(const QString& address, const QString& password,
                                      std::optional<Tables> tables) {
    const PartedAddress parted = partPassword(address);
    const QString& secret = password.isEmpty() ? parted.password : password;
    auto connection = reader::openDatabase(parted.address, secret);
    if (!connection) return connection.error();
    auto reader = std::make_unique<RememberingReader>(reader::makeReader(connection->database()));
    if (!tables) {
        auto read = reader->tables();
        if (!read) return read.error();
        tables = std::move(*read);
    }
    // The reader goes before the connection that it reads over.
    mReader = std::move(reader);
    mConnection = std::move(*connection);
    mTables = std::move(*tables);
    {
        const QMutexLocker lock(&mTarget);
        mAddress = lasting(parted.address);
        mPassword = secret;
    }
    mLost = false;
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

} // namespace designer
