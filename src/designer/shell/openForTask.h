#pragma once

#include <Zandor/reader/Connection.h>

#include <QString>

namespace zandor::designer::shell {

/// A database, and what it takes to connect to it again.
struct OpenedForTask {
    reader::Connection connection;
    QString address; ///< without the password
    QString password;
};

/// Opens a database; asks for a password on the terminal where the server does.
reader::Result<OpenedForTask> openForTask(const QString& address);

} // namespace zandor::designer::shell
