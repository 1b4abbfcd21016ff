#pragma once

#include "designer/database/Database.h"

class QWidget;

namespace zandor::designer {

/// How opening a database ended. Neither opened nor with an error: the user has cancelled it.
struct Opening {
    bool opened = false;
    QString error = {};           ///< in words for the user
    bool asksForPassword = false; ///< the server wants one, or another one
};

/// Database::open for windows: the server is tried on another thread, and the user may cancel.
Opening openPatiently(Database& database, const QString& address, const QString& password,
                      QWidget* window);
/// The same, and asks for a password as long as the server wants one. For addresses that come
/// without: from the command line, from the list of recent ones.
Opening openAskingForPassword(Database& database, const QString& address, QWidget* window);
/// Database::renew for windows.
Opening renewPatiently(Database& database, QWidget* window);

/// Asks the user for the password of an address. `why` is what the server said, or empty. Nothing
/// when the user has none to give.
std::optional<QString> askForPassword(const QString& address, const QString& why, QWidget* window);

} // namespace zandor::designer
