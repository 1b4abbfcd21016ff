#include "model/reader/columnType.h"

#include <gtest/gtest.h>

using namespace zandor;

using model::ColumnType;
using reader::columnType;

TEST(TheColumnType, IsThatOfTheDeclaredWord) {
    EXPECT_EQ(columnType(u"TEXT"), ColumnType::Text);
    EXPECT_EQ(columnType(u"INTEGER"), ColumnType::Integer);
    EXPECT_EQ(columnType(u"NUMERIC"), ColumnType::Decimal);
    EXPECT_EQ(columnType(u"REAL"), ColumnType::Decimal);
    EXPECT_EQ(columnType(u"DATE"), ColumnType::Date);
    EXPECT_EQ(columnType(u"TIME"), ColumnType::Time);
    EXPECT_EQ(columnType(u"TIMESTAMP"), ColumnType::Timestamp);
    EXPECT_EQ(columnType(u"DATETIME"), ColumnType::Timestamp);
    EXPECT_EQ(columnType(u"BOOLEAN"), ColumnType::Boolean);
    EXPECT_EQ(columnType(u"BLOB"), ColumnType::Blob);
    EXPECT_EQ(columnType(u"bytea"), ColumnType::Blob);
}

TEST(TheColumnType, DoesNotDependOnCaseOrLength) {
    EXPECT_EQ(columnType(u"varchar(40)"), ColumnType::Text);
    EXPECT_EQ(columnType(u"Decimal (10, 2)"), ColumnType::Decimal);
    EXPECT_EQ(columnType(u"timestamp with time zone"), ColumnType::Timestamp);
    EXPECT_EQ(columnType(u"  bool"), ColumnType::Boolean);
}

TEST(TheColumnType, OfAnUnknownWordFollowsItsParts) {
    EXPECT_EQ(columnType(u"UNSIGNED BIG INT"), ColumnType::Integer);
    EXPECT_EQ(columnType(u"NATIVE CHARACTER(70)"), ColumnType::Text);
    EXPECT_EQ(columnType(u"DOUBLE PRECISION"), ColumnType::Decimal);
    EXPECT_EQ(columnType(u"MEDIUMTEXT"), ColumnType::Text);
    EXPECT_EQ(columnType(u"clob"), ColumnType::Text);
    EXPECT_EQ(columnType(u"NCLOB(9)"), ColumnType::Text);
}

TEST(TheColumnType, IsUnknownForWhatIsNoneOfThese) {
    EXPECT_EQ(columnType(u""), ColumnType::Unknown);
    EXPECT_EQ(columnType(u"   "), ColumnType::Unknown);
    EXPECT_EQ(columnType(u"GEOMETRY"), ColumnType::Unknown);
    EXPECT_EQ(columnType(u"INTERVAL"), ColumnType::Unknown);
    EXPECT_EQ(columnType(u"POINT"), ColumnType::Unknown);
    EXPECT_EQ(columnType(u"bit varying(5)"), ColumnType::Unknown);
    EXPECT_EQ(columnType(u"größe"), ColumnType::Unknown);
}
