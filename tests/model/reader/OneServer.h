#pragma once

#include "OneServerOf.h"
#include "support/PostgresServer.h"

[[maybe_unused]] inline auto& oneServer = OneServerOf<PostgresServer>::instance();

/// Runs statements that may write.
inline void runOnServer(const QStringList& statements) {
    const zandor::reader::Connection connection(
        oneServer.server().connect(QStringLiteral("statements")));
    runOver(connection,
            QStringList{QStringLiteral("SET client_min_messages = warning")} + statements);
}

/// The address of the server's database, as this user or that.
inline QString serverAddress(const QString& user = QStringLiteral("postgres"),
                             const QString& database = QStringLiteral("postgres")) {
    return QStringLiteral("postgresql://%1@localhost/%2?host=%3")
        .arg(user, database, oneServer.server().folder());
}
