#include "Databases.h"

#include <Zandor/platform/KeyedCollection.h>

#include <gmock/gmock.h>

using namespace zandor;

using testing::ElementsAre;
using testing::HasSubstr;

namespace {

std::vector<std::string> tablesOf(const designer::OpenedQuery& opened) {
    std::vector<std::string> names;
    for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(opened.query->Tables()))
        names.push_back(platform::toUtf8(table->Name()));
    return names;
}

QStringList emptyTables(int count) {
    QStringList statements;
    for (int n = 0; n < count; ++n)
        statements << QStringLiteral("CREATE TABLE t%1 (id INTEGER PRIMARY KEY)")
                          .arg(n, 2, 10, QLatin1Char('0'));
    return statements;
}

reader::Result<designer::OpenedQuery> open(const QString& file, const QStringList& tables = {}) {
    return openDatabaseFile(file, {.names = tables, .database = file});
}

} // namespace

TEST(TheDesignerWithoutAFile, OpensTheExampleOverTheSample) {
    const auto opened = openedSample();
    EXPECT_THAT(tablesOf(opened),
                ElementsAre("customers", "orders", "order_lines", "products", "categories"));
    EXPECT_EQ(opened.query->Joins().Count(), 4);
    EXPECT_EQ(opened.query->ColumnDefinitions().Count(), 5);
    EXPECT_EQ(opened.message, "");
}

TEST(TheDesignerWithoutAFile, PlacesTheExampleFromLeftToRight) {
    const auto opened = openedSample();
    std::int32_t right = 0;
    for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(opened.query->Tables())) {
        EXPECT_GT(table->Left(), right);
        EXPECT_EQ(table->Top(), 300);
        right = table->Left() + table->Width();
    }
    EXPECT_LT(right, 18000);
}

TEST(TheDesignerWithoutAFile, LeavesTheGridEmptyWhenTablesAreNamed) {
    const auto opened = openedSample({"orders"});
    EXPECT_THAT(tablesOf(opened), ElementsAre("orders"));
    EXPECT_EQ(opened.query->ColumnDefinitions().Count(), 0);
}

TEST(TheDesignerWithAFile, ShowsTheTablesNamedInTheirOrder) {
    const auto opened = open(sampleDatabase(), {"orders", "Customers"});
    ASSERT_TRUE(opened) << opened.error().toStdString();
    EXPECT_THAT(tablesOf(*opened), ElementsAre("orders", "customers"));
    EXPECT_EQ(opened->query->Joins().Count(), 1);
    EXPECT_EQ(opened->query->ColumnDefinitions().Count(), 0);
}

TEST(TheDesignerWithAFile, ShowsATableTwiceWhenItIsNamedTwice) {
    const auto opened = open(sampleDatabase(), {"employees", "employees"});
    ASSERT_TRUE(opened) << opened.error().toStdString();
    EXPECT_THAT(tablesOf(*opened), ElementsAre("employees", "employees_1"));
}

TEST(TheDesignerWithAFile, BeginsWithAnEmptyDrawing) {
    const auto opened = open(sampleDatabase());
    ASSERT_TRUE(opened) << opened.error().toStdString();
    EXPECT_EQ(opened->query->Tables().Count(), 0);
    EXPECT_EQ(opened->query->Joins().Count(), 0);
    EXPECT_EQ(opened->message, "");
}

TEST(TheDesignerWithAFile, OpensADatabaseWithoutTables) {
    DatabaseFolder folder;
    const auto opened = open(folder.database("none.db", {"PRAGMA user_version = 1"}));
    ASSERT_TRUE(opened) << opened.error().toStdString();
    EXPECT_EQ(opened->query->Tables().Count(), 0);
}

TEST(TheDesignerWithAFile, RefusesMoreThanSixteenNames) {
    DatabaseFolder folder;
    const QString file = folder.database("many.db", emptyTables(1));
    EXPECT_EQ(open(file, QStringList(17, "t00")).error(),
              "17 tables are too many; the canvas takes 16.");
    EXPECT_TRUE(open(file, QStringList(16, "t00")));
}

TEST(TheDesignerWithAFile, RefusesMoreJoinsThanTheCanvasTakes) {
    // One key of so many columns.
    const auto references = [](int count) {
        QStringList columns;
        for (int n = 0; n < count; ++n) columns << QStringLiteral("c%1").arg(n);
        const QString all = columns.join(", ");
        return QStringList{QStringLiteral("CREATE TABLE parent (%1, PRIMARY KEY (%1))").arg(all),
                           QStringLiteral("CREATE TABLE child (%1, FOREIGN KEY (%1) REFERENCES "
                                          "parent)")
                               .arg(all)};
    };
    const QStringList both{"parent", "child"};
    DatabaseFolder folder;
    EXPECT_TRUE(open(folder.database("64.db", references(64)), both));
    EXPECT_EQ(open(folder.database("65.db", references(65)), both).error(),
              "These tables have 65 joins, and the canvas takes 64; choose fewer tables with "
              "--tables.");
}

TEST(TheDesignerWithAFile, NamesTheTableThatIsNotThere) {
    EXPECT_THAT(open(sampleDatabase(), {"orders", "ordres"}).error().toStdString(),
                HasSubstr("There is no table \"ordres\" in "));
}
