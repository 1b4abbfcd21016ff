#pragma once

#include <Zandor/reader/Connection.h>

#include <QSqlError>
#include <QSqlQuery>

#include <gtest/gtest.h>

#include <memory>

/// The server of this program, started when first asked for and ended by the last test's end.
template <class Server>
class OneServerOf : public testing::Environment {
public:
    void TearDown() override { mServer.reset(); }

    Server& server() {
        if (!mServer) mServer = std::make_unique<Server>();
        return *mServer;
    }

    /// Registered with the first use, which has to be before the first test runs.
    static OneServerOf& instance() {
        static auto* environment =
            static_cast<OneServerOf*>(testing::AddGlobalTestEnvironment(new OneServerOf));
        return *environment;
    }

private:
    std::unique_ptr<Server> mServer;
};

/// Runs statements over a connection.
inline void runOver(const zandor::reader::Connection& connection, const QStringList& statements) {
    for (const QString& statement : statements) {
        QSqlQuery query(connection.database());
        ASSERT_TRUE(query.exec(statement))
            << statement.toStdString() << ": " << query.lastError().text().toStdString();
    }
}
