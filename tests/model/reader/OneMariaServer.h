#pragma once

#include "OneServerOf.h"
#include "support/MariaServer.h"

#include <QUrl>

[[maybe_unused]] inline auto& oneMariaServer = OneServerOf<MariaServer>::instance();

/// Runs statements that may write, in one session.
inline void runOnMaria(const QStringList& statements) {
    const zandor::reader::Connection connection(
        oneMariaServer.server().connect(QStringLiteral("statements")));
    runOver(connection, statements);
}

/// The address of one of the server's databases, as this user or that.
inline QString mariaAddress(const QString& database, const QString& user = QStringLiteral("root")) {
    return QStringLiteral("mariadb://%1@localhost/%2?host=%3")
        .arg(user, QString::fromLatin1(QUrl::toPercentEncoding(database)),
             oneMariaServer.server().socket());
}
