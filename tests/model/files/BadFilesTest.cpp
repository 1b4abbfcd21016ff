#include "Files.h"

#include <map>
#include <set>

using namespace zandor;

// Every file in bad/ is refused with exactly the line that bad/expected.txt has for it.

namespace {

std::map<std::string, std::string> expectedLines() {
    std::ifstream file(testFile("bad/expected.txt"));
    std::map<std::string, std::string> lines;
    for (std::string line; std::getline(file, line);) {
        const auto colon = line.find(": ");
        EXPECT_NE(colon, std::string::npos) << line;
        EXPECT_TRUE(lines.emplace(line.substr(0, colon), line.substr(colon + 2)).second) << line;
    }
    return lines;
}

} // namespace

TEST(ABadFile, IsRefusedWithOneLineThatSaysWhereAndWhatToDo) {
    const auto expected = expectedLines();
    for (const auto& [name, line] : expected) {
        const std::string text = contentOf(testFile("bad/" + name));
        const auto document = files::fromJson(text);
        EXPECT_FALSE(document) << name;
        EXPECT_EQ(document.error(), line) << name;
    }
}

TEST(ABadFile, HasItsLineExpected) {
    std::set<std::string> files, expected;
    for (const auto& entry : std::filesystem::directory_iterator(testFile("bad")))
        if (entry.path().extension() == ".json") files.insert(entry.path().filename());
    for (const auto& [name, line] : expectedLines()) expected.insert(name);
    EXPECT_EQ(files, expected);
    EXPECT_GT(files.size(), 80U);
}

TEST(ABadFile, IsBrokenInAColumnThatCountsLetters) {
    EXPECT_EQ(files::fromJson("{\n \"\u00e4\u6f22\U0001f600\": x}").error(),
              "Line 2, column 9: invalid literal. Mend the file there, or restore it from a copy.");
}
