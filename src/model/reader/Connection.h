#pragma once

#include "model/reader/Result.h"

#include <QSqlDatabase>

namespace reader {

/// An open database under a connection name of its own, closed when the object goes.
class Connection {
public:
    /// Takes over an open database that nobody else uses.
    explicit Connection(QSqlDatabase database) : mDatabase(std::move(database)) {}
    Connection(Connection&& other) noexcept { std::swap(mDatabase, other.mDatabase); }
    Connection& operator=(Connection&& other) noexcept {
        std::swap(mDatabase, other.mDatabase);
        return *this;
    }
    ~Connection();

    const QSqlDatabase& database() const { return mDatabase; }

private:
    QSqlDatabase mDatabase;
};

/// Opens an SQLite file for reading only; the file is never written or created. Needs a
/// QCoreApplication.
Result<Connection> openSqlite(const QString& path);

} // namespace reader
