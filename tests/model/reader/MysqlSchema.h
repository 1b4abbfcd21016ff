#pragma once

#include "OneMariaServer.h"

#include "model/reader/serverError.h"

#include <Zandor/DatabaseReader.h>

/// Each test has the databases `here` and `aside`, empty at its beginning, and reads in `here`.
class MysqlSchema : public testing::Test {
protected:
    void SetUp() override {
        if (const auto missing = MariaServer::missing()) GTEST_SKIP() << missing->toStdString();
        const QString drop = QStringLiteral("DROP DATABASE IF EXISTS ");
        const QString create = QStringLiteral("CREATE DATABASE ");
        const QString here = QStringLiteral("here"), aside = QStringLiteral("aside");
        runOnMaria({QStringLiteral("SET foreign_key_checks = 0"), drop + aside, drop + here,
                    create + here, create + aside});
    }

    /// Runs statements in `here`.
    static void run(const QStringList& statements) {
        runOnMaria(QStringList{QStringLiteral("USE here")} + statements);
    }

    zandor::reader::DatabaseReader& schema() {
        if (!mReader) open(mariaAddress(QStringLiteral("here")));
        return *mReader;
    }

    void open(const QString& address) {
        auto opened = zandor::reader::openDatabase(address);
        if (!opened) throw std::runtime_error(opened.error().toStdString());
        mReader.reset();
        mConnection = std::make_unique<zandor::reader::Connection>(std::move(*opened));
        mReader = zandor::reader::makeReader(mConnection->database());
    }

    const QSqlDatabase& database() {
        schema();
        return mConnection->database();
    }

    std::vector<zandor::reader::TableEntry> tables() {
        const auto tables = schema().tables();
        EXPECT_TRUE(tables) << tables.error().toStdString();
        return tables ? *tables : std::vector<zandor::reader::TableEntry>();
    }

    std::vector<zandor::model::ColumnDescription> columns(const zandor::reader::TableId& id) {
        const auto table = schema().table(id);
        EXPECT_TRUE(table) << table.error().toStdString();
        return table ? table->columns : std::vector<zandor::model::ColumnDescription>();
    }

    std::vector<zandor::reader::ForeignKey> foreignKeys(const zandor::reader::TableId& id) {
        const auto keys = schema().foreignKeys(id);
        EXPECT_TRUE(keys) << keys.error().toStdString();
        return keys ? *keys : std::vector<zandor::reader::ForeignKey>();
    }

private:
    std::unique_ptr<zandor::reader::Connection> mConnection;
    std::unique_ptr<zandor::reader::DatabaseReader> mReader;
};
