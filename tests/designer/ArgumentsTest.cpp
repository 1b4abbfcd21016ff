#include "designer/Arguments.h"

#include <gtest/gtest.h>

using namespace zandor;

using designer::readArguments;

TEST(TheDesignersArguments, MayAllBeLeftOut) {
    const auto read = readArguments({});
    ASSERT_TRUE(read);
    EXPECT_TRUE(read->file.isEmpty());
    EXPECT_TRUE(read->tables.isEmpty());
    EXPECT_TRUE(read->screenshot.isEmpty());
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

TEST(TheDesignersArguments, TakeAScreenshotAndDarkColours) {
    const auto read = readArguments({"--screenshot", "out.png", "--dark"});
    ASSERT_TRUE(read);
    EXPECT_EQ(read->screenshot, "out.png");
    EXPECT_TRUE(read->dark);
}

TEST(TheDesignersArguments, TakeAQueryAndAPictureOfIt) {
    const auto read = readArguments({"--picture", "query.json", "out.svg"});
    ASSERT_TRUE(read);
    EXPECT_EQ(read->drawing, "query.json");
    EXPECT_EQ(read->picture, "out.svg");
    EXPECT_EQ(read->file, "");
}

TEST(TheDesignersArguments, RefuseAPictureOfAWindow) {
    EXPECT_EQ(readArguments({"--picture", "query.json", "out.svg", "--tables", "a"}).error(),
              "--picture opens no window; leave out what is for one.");
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
    EXPECT_EQ(readArguments({"--screenshot="}).error(),
              "--screenshot names no file; write --screenshot window.png.");
    for (const QStringList& given :
         {QStringList{"--picture="}, {"--picture", "query.json"}, {"--picture=", "out.svg"}})
        EXPECT_EQ(readArguments(given).error(),
                  "--picture takes two files; write --picture query.json out.svg.");
}

TEST(TheDesignersArguments, RefuseAnOptionThatThereIsNot) {
    EXPECT_EQ(readArguments({"--tabels", "a"}).error(), "Unknown option 'tabels'. See --help.");
}

TEST(TheDesignersArguments, TakeATaskThatNeedsNoWindow) {
    const auto printed = readArguments({"--sql", "q.json", "--dialect", "mysql"});
    ASSERT_TRUE(printed) << printed.error().toStdString();
    ASSERT_TRUE(printed->task);
    EXPECT_EQ(printed->task->kind, designer::shell::Task::Kind::printStatement);
    EXPECT_EQ(printed->task->query, "q.json");
    EXPECT_EQ(printed->task->dialect, model::sql::Dialect::MySQL);

    const auto run = readArguments({"--run=q.json", "--format", "json", "--database", "a.db",
                                    "--limit", "5", "--set", "a=1=2", "--set", "b="});
    ASSERT_TRUE(run) << run.error().toStdString();
    ASSERT_TRUE(run->task);
    EXPECT_EQ(run->task->kind, designer::shell::Task::Kind::runQuery);
    EXPECT_EQ(run->task->format, designer::shell::Format::json);
    EXPECT_EQ(run->task->database, "a.db");
    EXPECT_EQ(run->task->limit, 5);
    EXPECT_EQ(run->task->values, (QMap<QString, QString>{{"a", "1=2"}, {"b", ""}}));
    const auto window = readArguments({"a.db"});
    ASSERT_TRUE(window);
    EXPECT_FALSE(window->task);
}

TEST(TheDesignersArguments, TellHelpVersionAndPictureBeforeAnyScreen) {
    EXPECT_TRUE(designer::asksForHelp({"x.db", "--help"}));
    EXPECT_TRUE(designer::asksForHelp({"-h"}));
    EXPECT_TRUE(designer::asksForVersion({"--version"}));
    EXPECT_TRUE(designer::asksForPicture({"--screenshot=a.png"}));
    EXPECT_TRUE(designer::asksForPicture({"--picture", "query.json", "a.png"}));
    EXPECT_FALSE(designer::asksForPicture({"picture"}));
    EXPECT_TRUE(designer::asksForTask({"--run=q.json"}));
    EXPECT_TRUE(designer::asksForTask({"--format", "csv", "--sql", "q.json"}));
    EXPECT_FALSE(designer::asksForTask({"--", "--run"}));
}
