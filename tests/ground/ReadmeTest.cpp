#include "Sources.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <regex>

TEST(TheReadme, ShowsTheFirstExampleAsItIsCompiled) {
    EXPECT_NE(sources::contentOf("README.md")
                  .find("```cpp\n" + sources::contentOf("examples/first/main.cpp") + "```"),
              std::string::npos);
}

TEST(ThePages, LinkToFilesThatAreThere) {
    static const std::regex link(R"re((?:\]\(|src=")([^)"#:]+)(?:#[^)"]*)?[)"])re");
    for (const char* page : {"README.md", "CONTRIBUTING.md", "docs/architecture.md"}) {
        const std::string text = sources::contentOf(page);
        const auto folder = (sources::root() / page).parent_path();
        int links = 0;
        for (std::sregex_iterator it(text.begin(), text.end(), link), end; it != end; ++it) {
            ++links;
            EXPECT_TRUE(std::filesystem::exists(folder / (*it)[1].str()))
                << page << " links to " << (*it)[1];
        }
        EXPECT_GT(links, 0) << page;
    }
}
