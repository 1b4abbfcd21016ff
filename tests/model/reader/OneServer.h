#pragma once

#include "support/PostgresServer.h"

#include <Zandor/reader/Connection.h>

#include <QSqlError>
#include <QSqlQuery>

#include <gtest/gtest.h>

/// The server of this program, started when first asked for and ended by the last test's end.
class OneServer : public testing::Environment {
public:
    void TearDown() override { mServer.reset(); }

    PostgresServer& server() {
        if (!mServer) mServer = std::make_unique<PostgresServer>();
        return *mServer;
    }

    /// Registered with the first use.
    static OneServer& instance() {
        static auto* environment =
            static_cast<OneServer*>(testing::AddGlobalTestEnvironment(new OneServer));
        return *environment;
    }

private:
    std::unique_ptr<PostgresServer> mServer;
};

/// Here, because an environment has to be there before the first test runs.
[[maybe_unused]] inline OneServer& oneServer = OneServer::instance();

/// Runs statements that may write.
inline void runOnServer(const QStringList& statements) {
    const zandor::reader::Connection connection(
        oneServer.server().connect(QStringLiteral("statements")));
    const QStringList quiet{QStringLiteral("SET client_min_messages = warning")};
    for (const QString& statement : quiet + statements) {
        QSqlQuery query(connection.database());
        ASSERT_TRUE(query.exec(statement))
            << statement.toStdString() << ": " << query.lastError().text().toStdString();
    }
}

/// The address of the server's database, as this user or that.
inline QString serverAddress(const QString& user = QStringLiteral("postgres"),
                             const QString& database = QStringLiteral("postgres")) {
    const zandor::reader::Connection connection(
        oneServer.server().connect(QStringLiteral("address")));
    return QStringLiteral("postgresql://%1@localhost/%2?host=%3")
        .arg(user, database, connection.database().hostName());
}
