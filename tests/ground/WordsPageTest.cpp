#include "Sources.h"

#include <Zandor/platform/Words.h>

#include <gtest/gtest.h>

using namespace zandor;

TEST(ThePageOfTheWords, ListsEveryWordWithItsDefault) {
    const std::string page = sources::contentOf("docs/words.md");
    const platform::Words plain;
    for (const auto& [name, word] : platform::wordTable) {
        const std::string row =
            "| `" + platform::toUtf8(name) + "` | `" + platform::toUtf8(plain.*word) + "` |";
        EXPECT_NE(page.find(row), std::string::npos) << row;
    }
}
