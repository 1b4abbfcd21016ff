#include "designer/Arguments.h"

#include <gtest/gtest.h>

using designer::readArguments;

TEST(TheDesignersArguments, MayAllBeLeftOut) {
    const auto read = readArguments({});
    ASSERT_TRUE(read);
    EXPECT_TRUE(read->file.isEmpty());
    EXPECT_TRUE(read->tables.isEmpty());
    EXPECT_TRUE(read->picture.isEmpty());
    EXPECT_FALSE(read->dark);
}

TEST(TheDesignersArguments, ListTablesWithCommasAndBlanksBetween) {
    const auto read = readArguments({"shop.db", "--tables", "orders, order lines,,stock"});
    ASSERT_TRUE(read);
    EXPECT_EQ(read->file, "shop.db");
    EXPECT_EQ(read->tables, QStringList({"orders", "order lines", "stock"}));
}

TEST(TheDesignersArguments, ListTablesInSeveralOptionsToo) {
    const auto read = readArguments({"--tables=a", "--tables=b"});
    ASSERT_TRUE(read);
    EXPECT_EQ(read->tables, QStringList({"a", "b"}));
}

TEST(TheDesignersArguments, TakeAPictureAndDarkColours) {
    const auto read = readArguments({"--picture", "out.png", "--dark"});
    ASSERT_TRUE(read);
    EXPECT_EQ(read->picture, "out.png");
    EXPECT_TRUE(read->dark);
}

TEST(TheDesignersArguments, TakeWhatFollowsTwoDashesForAFile) {
    const auto read = readArguments({"--", "--help"});
    ASSERT_TRUE(read);
    EXPECT_EQ(read->file, "--help");
    EXPECT_FALSE(designer::asksForHelp({"--", "--help"}));
}

TEST(TheDesignersArguments, RefuseASecondFile) {
    EXPECT_EQ(readArguments({"a.db", "b.db"}).error(), "There are 2 files; name one.");
}

TEST(TheDesignersArguments, RefuseAListOfNoTables) {
    EXPECT_EQ(readArguments({"--tables", ", ,"}).error(),
              "--tables names no table; write --tables customers,orders.");
}

TEST(TheDesignersArguments, RefuseAPictureWithoutAName) {
    EXPECT_EQ(readArguments({"--picture="}).error(),
              "--picture names no file; write --picture query.png.");
}

TEST(TheDesignersArguments, RefuseAnOptionThatThereIsNot) {
    EXPECT_EQ(readArguments({"--tabels", "a"}).error(), "Unknown option 'tabels'. See --help.");
}

TEST(TheDesignersArguments, TellHelpVersionAndPictureBeforeAnyScreen) {
    EXPECT_TRUE(designer::asksForHelp({"x.db", "--help"}));
    EXPECT_TRUE(designer::asksForHelp({"-h"}));
    EXPECT_TRUE(designer::asksForVersion({"--version"}));
    EXPECT_TRUE(designer::asksForPicture({"--picture=a.png"}));
    EXPECT_TRUE(designer::asksForPicture({"--picture", "a.png"}));
    EXPECT_FALSE(designer::asksForPicture({"picture"}));
}
