#include "Files.h"

namespace {

/// What stands between two lines "// [name]" of a file.
std::string part(const std::string& file, const std::string& name) {
    const std::string text = contentOf(file);
    const std::string mark = "// [" + name + "]\n";
    const auto begin = text.find(mark);
    const auto end = text.find(mark, begin + 1);
    EXPECT_NE(end, std::string::npos) << file << " has no part " << name;
    return end == std::string::npos ? std::string()
                                    : text.substr(begin + mark.size(), end - begin - mark.size());
}

} // namespace

TEST(ThePageAboutAModelOfOnesOwn, ShowsTheCodeThatIsCompiled) {
    const std::string page = contentOf("docs/your-own-model.md");
    const std::string report = "examples/own_model/Report.h";
    for (const std::string& code :
         {part(report, "field"), part(report, "link"), part(report, "report"),
          part(report, "library"), contentOf("examples/own_model/main.cpp")})
        EXPECT_NE(page.find("```cpp\n" + code + "```"), std::string::npos) << code;
}
