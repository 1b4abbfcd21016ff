#include "Sources.h"

#include <gtest/gtest.h>

#include <regex>

// Text from files and databases is shown as it is, whoever writes the next dialog.

TEST(TheDesigner, ShowsNoMessageBoxesButPlainOnes) {
    const std::regex made(
        R"(\bQMessageBox(::(warning|information|about|critical|question)\b| \w+\())");
    for (const std::string& file : sources::below("src/designer"))
        if (file.find("PlainBox") == std::string::npos) {
            EXPECT_FALSE(std::regex_search(sources::contentOf(file), made)) << file;
        }
}

TEST(TheDesigner, HandsNoTextToATooltipThatMayHoldMarkup) {
    const std::regex tip(R"(setToolTip\(\s*([^;]*)\);)");
    const std::regex own(R"(^(\w+, )?(tr|asToolTip|platform::qt::asToolTip)\()");
    int tips = 0;
    for (const std::string& file : sources::below("src/designer")) {
        const std::string text = sources::contentOf(file);
        for (std::sregex_iterator it(text.begin(), text.end(), tip), end; it != end; ++it, ++tips) {
            const std::string argument = (*it)[1];
            EXPECT_TRUE(std::regex_search(argument, own)) << file << ": " << argument;
        }
    }
    EXPECT_GT(tips, 10);
}
