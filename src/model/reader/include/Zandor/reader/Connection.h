#pragma once

#include <Zandor/reader/Result.h>
#include <Zandor/reader/export.h>

#include <QSqlDatabase>

namespace zandor::reader {

/// An open database under a connection name of its own, closed when the object goes.
class ZANDOR_READER_EXPORT Connection {
public:
    /// Takes over an open database that nobody else uses.
    // By value, as what is taken over, though a QSqlDatabase can only be copied.
    // NOLINTNEXTLINE(performance-unnecessary-value-param,performance-move-const-arg)
    explicit Connection(QSqlDatabase database) : mDatabase(std::move(database)) {}
    /// The other one has no database then.
    Connection(Connection&& other) noexcept { std::swap(mDatabase, other.mDatabase); }
    /// The databases change places.
    Connection& operator=(Connection&& other) noexcept {
        std::swap(mDatabase, other.mDatabase);
        return *this;
    }
    ~Connection();

    /// For Qt's own classes; open as long as this is there.
    const QSqlDatabase& database() const { return mDatabase; }

private:
    QSqlDatabase mDatabase;
};

/// Opens an SQLite file for reading only; the file is never written or created. Needs a
/// QCoreApplication.
ZANDOR_READER_EXPORT Result<Connection> openSqlite(const QString& path);

/// Opens a database for reading only: a path of an SQLite file, or an address
///
///     postgresql://user@host:port/database        also postgres://
///     mysql://user@host:port/database             also mariadb://
///     odbc://user@data-source
///
/// each part but the scheme as far as the engine needs it. Behind a "?" an address may have
/// options: connect_timeout (seconds; 10 unless given); sslrootcert, sslcert and sslkey of
/// PostgreSQL and MySQL; sslmode and application_name of PostgreSQL; and host, the folder of
/// PostgreSQL's socket or the socket of MySQL's server, which takes the place of the host. The
/// password is `password`, or that of the address when it is empty; no message shows it. Needs a
/// QCoreApplication.
///
/// Behind ODBC an engine that is none of the others can write when a view calls a function that
/// does; its data source should have a user who may only read.
ZANDOR_READER_EXPORT Result<Connection> openDatabase(const QString& address,
                                                     const QString& password = {});

/// Whether the engine still answers; after a failure this tells a connection that has broken down
/// from a statement that was refused. Takes a way to the server and back.
ZANDOR_READER_EXPORT bool answers(const Connection& connection);

} // namespace zandor::reader
