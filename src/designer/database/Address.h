#pragma once

#include <QString>

#include <optional>

namespace zandor::designer {

enum class Engine { SQLite, PostgreSQL, MySQL, ODBC };

/// The parts of an address (see reader::openDatabase), as a form asks for them.
struct Address {
    Engine engine = Engine::SQLite;
    QString file; ///< of SQLite, which has nothing else
    QString host; ///< of PostgreSQL also the folder of a socket; of ODBC the data source
    int port = 0; ///< 0: the engine's usual one
    QString user;
    QString database;
    QString options; ///< what stands behind the "?", but for the host

    friend bool operator==(const Address&, const Address&) = default;
};

/// Nothing for the address of an unknown engine or one that cannot be read.
std::optional<Address> parseAddress(const QString& text);
QString textOf(const Address& address);

/// An address and the password that was in it.
struct PartedAddress {
    QString address;
    QString password;
};

/// Takes the password out of an address, wherever it stands in it and whether or not the rest can
/// be read. A file has none.
PartedAddress partPassword(const QString& address);

/// The same address in every working folder: a file's path is absolute.
QString lastingAddress(const QString& address);

/// What a title calls a database: the file's or the database's name, the data source.
QString nameOfDatabase(const QString& address);

} // namespace zandor::designer
