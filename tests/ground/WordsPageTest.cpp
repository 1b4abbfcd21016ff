#include "Sources.h"
#include "platform/Words.h"

#include <gtest/gtest.h>

TEST(ThePageOfTheWords, ListsEveryWordWithItsDefault) {
    const std::string page = sources::contentOf("docs/words.md");
    const platform::Words plain;
    for (const auto& [name, word] : platform::wordTable) {
        const std::string row =
            "| `" + platform::toUtf8(name) + "` | `" + platform::toUtf8(plain.*word) + "` |";
        EXPECT_NE(page.find(row), std::string::npos) << row;
    }
}
