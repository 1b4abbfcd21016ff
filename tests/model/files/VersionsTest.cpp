#include "Files.h"

using namespace zandor;

TEST(AFileOfVersion1, IsTheQueryThatItsVersion2Is) {
    const auto old = documentOf(contentOf(testFile("version-1.json")));
    const auto current = documentOf(contentOf(testFile("version-2.json")));
    EXPECT_EQ(old.query->record(), current.query->record());
    // What version 1 did not know is kept over the step as well.
    EXPECT_EQ(jsonOf(old), contentOf(testFile("version-2.json")));
}

TEST(AFileOfVersion1, IsGivenTheLastKeysOfWhatIsThere) {
    const auto last = documentOf(contentOf(testFile("version-1.json"))).query->record().lastKeys;
    EXPECT_EQ(last, (model::LastKeys{.table = 4, .column = 9, .join = 3, .definition = 2}));
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
    const std::string text = contentOf(testFile("version-2.json"));
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
