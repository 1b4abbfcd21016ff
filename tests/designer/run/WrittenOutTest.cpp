#include "designer/run/writtenOut.h"

#include <gtest/gtest.h>

using zandor::designer::writtenOut;

TEST(AStatementWrittenOut, HasItsValuesAsLiterals) {
    EXPECT_EQ(writtenOut("a = ? AND b = ? AND c IN (?, ?)",
                         {QVariant(5LL), QVariant(true), QVariant("1.25"), QVariant("it's \\")}),
              "a = 5 AND b = TRUE AND c IN ('1.25', 'it''s \\\\')");
    EXPECT_EQ(writtenOut("a = ?", {QVariant(QByteArray("\x00\xff", 2))}), "a = x'00ff'");
}

TEST(AStatementWrittenOut, LeavesQuestionMarksInTextsAndNamesAlone) {
    EXPECT_EQ(writtenOut("`a?``?` = 'x''?' AND '\\'?' = ? AND '\\\\' = ?",
                         {QVariant("?"), QVariant(7LL)}),
              "`a?``?` = 'x''?' AND '\\'?' = '?' AND '\\\\' = 7");
}

TEST(AStatementWrittenOut, IsTheStatementItselfWithoutValues) {
    EXPECT_EQ(writtenOut("a = '?' AND `it's`.b = 1", {}), "a = '?' AND `it's`.b = 1");
}
