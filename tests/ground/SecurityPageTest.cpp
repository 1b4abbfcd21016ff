#include "Sources.h"

#include <gtest/gtest.h>

#include <cctype>
#include <regex>
#include <set>

namespace {

/// Suite and name of every test, "ASuite.HasAName".
std::set<std::string> testNames() {
    std::set<std::string> names;
    for (const std::string& file : sources::below("tests")) {
        const std::string text = sources::contentOf(file);
        for (const std::string macro : {"\nTEST(", "\nTEST_F(", "\nTEST_P("}) {
            for (auto at = text.find(macro); at != std::string::npos; at = text.find(macro, at)) {
                at += macro.size();
                std::string name;
                for (; at < text.size() && text[at] != ')'; ++at)
                    if (std::isspace(static_cast<unsigned char>(text[at])) == 0)
                        name += text[at] == ',' ? '.' : text[at];
                names.insert(name);
            }
        }
    }
    return names;
}

} // namespace

TEST(TheSecurityPage, NamesTestsThatThereAre) {
    const std::string page = sources::contentOf("SECURITY.md");
    const auto tests = testNames();
    const std::regex named(R"(`(\w+)\.(\w+)`)");
    int found = 0;
    for (std::sregex_iterator it(page.begin(), page.end(), named), end; it != end; ++it, ++found) {
        const std::string suite = (*it)[1];
        const std::string test = (*it)[2];
        if (suite == "fuzz")
            EXPECT_TRUE(std::filesystem::exists(sources::root() / "fuzz" / (test + ".cpp")))
                << test;
        else
            EXPECT_TRUE(tests.contains(suite + '.' + test)) << suite << '.' << test;
    }
    EXPECT_GT(found, 50);
}

TEST(TheSecurityPage, HasATestBehindEachSentenceOfItsLists) {
    const std::string page = sources::contentOf("SECURITY.md");
    const std::regex item(R"(\n- ([^\n]*))");
    const std::regex named(R"(`\w+\.\w+`)");
    int items = 0;
    for (std::sregex_iterator it(page.begin(), page.end(), item), end; it != end; ++it, ++items) {
        const std::string sentence = (*it)[1];
        EXPECT_TRUE(std::regex_search(sentence, named)) << sentence;
    }
    EXPECT_GT(items, 20);
}
