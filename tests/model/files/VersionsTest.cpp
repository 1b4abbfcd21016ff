#include "Files.h"

using namespace zandor;

TEST(AFileOfVersion1, IsTheQueryThatItsVersion2Is) {
    const auto old = documentOf(contentOf(testFile("version-1.json")));
    const auto next = documentOf(contentOf(testFile("version-2.json")));
    EXPECT_EQ(old.query->record(), next.query->record());
    // What version 1 did not know is kept over the step as well.
    EXPECT_EQ(jsonOf(old), jsonOf(next));
}

TEST(AFileOfVersion2, IsWrittenWithNothingButAnotherVersion) {
    std::string text = contentOf(testFile("version-2.json"));
    const std::string written = jsonOf(documentOf(text));
    const std::string version = "\"version\": 2";
    text.replace(text.find(version), version.size(), "\"version\": 3");
    EXPECT_EQ(written, text);
}

TEST(AFileOfVersion3, HasTotalsExpressionsAndWhatIsSaidOfTheQuery) {
    const auto query = documentOf(contentOf(testFile("version-3.json"))).query;
    EXPECT_TRUE(query->options().distinct);
    EXPECT_EQ(query->options().first, 10);
    EXPECT_EQ(query->options().description, u"What customers have ordered");
    const auto definition = [&](std::int32_t position) {
        return query->ColumnDefinitions().Item(position)->Column()->Name();
    };
    EXPECT_EQ(definition(2), u"different(orders.id)");
    EXPECT_EQ(definition(3), u"largest(Upper(customers.name))");
    query->renameTable(query->tableNamed(u"customers"), u"people");
    EXPECT_EQ(definition(3), u"largest(Upper(people.name))");
}

TEST(AFileOfVersion3, SaysHowValuesAreShown) {
    const auto query = documentOf(contentOf(testFile("version-3.json"))).query;
    const auto definition = [&](std::int32_t position) {
        return std::dynamic_pointer_cast<model::ColumnDefinition>(
            query->ColumnDefinitions().Item(position));
    };
    EXPECT_EQ(definition(2)->format(), model::Format::None);
    EXPECT_EQ(definition(2)->decimals(), model::asManyAsThereAre);
    EXPECT_EQ(definition(3)->format(), model::Format::Thousands);
    EXPECT_EQ(definition(3)->decimals(), 0);
}

TEST(AFileOfVersion1, IsGivenTheLastKeysOfWhatIsThere) {
    const auto last = documentOf(contentOf(testFile("version-1.json"))).query->record().lastKeys;
    EXPECT_EQ(last, (model::LastKeys{.table = 4, .column = 9, .join = 3, .definition = 2}));
}

TEST(AFileOfVersion1, IsGivenTheLastColumnOfWhicheverTableHasIt) {
    std::string text = contentOf(testFile("version-1.json"));
    const std::string key = "\"c3\"";
    for (std::size_t at; (at = text.find(key)) != std::string::npos;)
        text.replace(at, key.size(), "\"c30\"");
    EXPECT_EQ(documentOf(text).query->record().lastKeys.column, 30);
}

TEST(AFileOfVersion1, KeepsTheLastKeysThatSomebodyWroteIntoIt) {
    std::string text = contentOf(testFile("version-1.json"));
    const std::string version = "\"version\": 1,";
    text.insert(text.find(version) + version.size(),
                R"("lastKeys": {"table": 9, "column": 90, "join": 8, "definition": 7},)");
    const auto document = documentOf(text);
    EXPECT_EQ(document.query->record().lastKeys,
              (model::LastKeys{.table = 9, .column = 90, .join = 8, .definition = 7}));
    EXPECT_EQ(documentOf(jsonOf(document)).query->record(), document.query->record());
}

TEST(ATableInAFile, IsNotSelectedWhereNothingIsSaidOfIt) {
    std::string text = contentOf(testFile("version-2.json"));
    const std::string selected = "\"selected\": -1,";
    ASSERT_NE(text.find(selected), std::string::npos);
    EXPECT_EQ(documentOf(text).query->record().tables.front().selected, -1);
    text.erase(text.find(selected), selected.size());
    EXPECT_EQ(documentOf(text).query->record().tables.front().selected, 0);
}

TEST(ADefinitionInAFile, IsVisibleWhereNothingIsSaidOfIt) {
    std::string text = contentOf(testFile("version-2.json"));
    const std::string hidden = "\"visible\": false,";
    ASSERT_NE(text.find(hidden), std::string::npos);
    EXPECT_FALSE(documentOf(text).query->ColumnDefinitions().Item(2)->Visible());
    text.erase(text.find(hidden), hidden.size());
    EXPECT_TRUE(documentOf(text).query->ColumnDefinitions().Item(2)->Visible());
}

TEST(AFileOfVersion1, IsRefusedWithACodeThatIsNone) {
    std::string text = contentOf(testFile("version-1.json"));
    const std::string code = "\"type\": 1";
    ASSERT_NE(text.find(code), std::string::npos);
    text.replace(text.find(code), code.size(), "\"type\": 4");
    EXPECT_EQ(files::fromJson(text).error(),
              "/joins/0/type is not a whole number from 0 to 3. Mend the file there, or restore it "
              "from a copy.");
}

TEST(AFileOfTheCurrentVersion, IsWrittenAsItWasRead) {
    const std::string text = contentOf(testFile("version-3.json"));
    EXPECT_NE(text.find("\"version\": " + std::to_string(files::currentVersion)),
              std::string::npos);
    EXPECT_EQ(jsonOf(documentOf(text)), text);
}

TEST(ThePageAboutTheFormat, ShowsAFileAsItIsWritten) {
    const std::string page = contentOf(testFile("../../../docs/file-format.md"));
    const std::string begin = "```json\n";
    const auto at = page.find(begin);
    ASSERT_NE(at, std::string::npos);
    const std::string example =
        page.substr(at + begin.size(), page.find("```", at + 1) - at - begin.size());
    EXPECT_EQ(jsonOf(documentOf(example)), example);
}
