#include "Files.h"

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
