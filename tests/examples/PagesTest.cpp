#include "Files.h"

namespace {

/// What stands between two lines "// [name]" of a file, or others of its comments.
std::string part(const std::string& file, const std::string& name,
                 const std::string& comment = "//") {
    const std::string text = contentOf(file);
    const std::string mark = comment + " [" + name + "]\n";
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

TEST(ThePageAboutEmbedding, ShowsTheCodeThatIsCompiled) {
    const std::string page = contentOf("docs/embedding.md");
    const auto shows = [&](const std::string& language, const std::string& code) {
        EXPECT_NE(page.find("```" + language + "\n" + code + "```"), std::string::npos) << code;
    };
    shows("cmake", contentOf("examples/first/CMakeLists.txt"));
    shows("cpp", contentOf("examples/first/main.cpp"));
    shows("cmake", part("tests/package/fetched/CMakeLists.txt", "fetched", "#"));
    shows("make", contentOf("tests/package/makefile/Makefile"));
    for (const char* name : {"sql", "text", "twips", "showing", "errors"})
        shows("cpp", part("tests/examples/EmbeddingTest.cpp", name));
    shows("cpp", part("examples/read_only/main.cpp", "rules"));
    // Nothing is shown that is not among these.
    std::size_t shown = 0;
    for (const std::string fence : {"```cpp\n", "```cmake\n", "```make\n"})
        for (auto at = page.find(fence); at != std::string::npos; at = page.find(fence, at + 1))
            ++shown;
    EXPECT_EQ(shown, 10U);
}
