#include "model/TemporaryDatabase.h"

#include "model/reader/sqliteError.h"

#include <Zandor/reader/Messages.h>
#include <Zandor/reader/rows.h>

#include <gtest/gtest.h>

using namespace zandor;

namespace {

const model::Message failed =
    model::say<reader::MessageCode::tableNotRead>(platform::String(u"orders"));

std::string adviceOn(const char* code) {
    const QSqlError error(QString(), QStringLiteral("so it is"), QSqlError::StatementError,
                          QString::fromLatin1(code));
    return reader::sqliteError(failed, error).text().toStdString();
}

} // namespace

TEST(ReadingRows, FailsWhereverItStops) {
    const TemporaryDatabase database({QStringLiteral("CREATE TABLE t (x INTEGER)")});
    const auto opened = reader::openSqlite(database.path());
    ASSERT_TRUE(opened) << opened.error().toStdString();
    int rows = 0;
    const auto error =
        reader::readRows(opened->database(), failed,
                         QStringLiteral("SELECT 1 UNION ALL SELECT abs(-9223372036854775807 - 1)"),
                         {}, [&](const QSqlQuery&) { ++rows; });
    EXPECT_EQ(rows, 1) << "the engine says so behind the first row only";
    ASSERT_TRUE(error);
}

TEST(WhatSqliteSays, IsAdvisedOnByTheLowByteOfItsCode) {
    EXPECT_EQ(adviceOn("261"), adviceOn("5")) << "busy, while it recovers";
    EXPECT_EQ(adviceOn("262"), adviceOn("6")) << "locked, by the same program";
    EXPECT_EQ(adviceOn("5"), adviceOn("6"));
    EXPECT_EQ(adviceOn("267"), adviceOn("11")) << "damaged, in a virtual table";
    EXPECT_NE(adviceOn("5"), adviceOn("1"));
    EXPECT_NE(adviceOn("11"), adviceOn("1"));
}
