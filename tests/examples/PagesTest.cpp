#include "Files.h"

#include <filesystem>
#include <regex>

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

TEST(ThePageAboutFrontEnds, NamesWhatAToolkitMakes) {
    const std::string page = contentOf("docs/front-ends.md");
    const std::string header = contentOf("src/platform/include/Zandor/platform/Toolkit.h");
    static const std::regex made(R"(\bmake[A-Z]\w+)");
    std::size_t names = 0;
    for (std::sregex_iterator it(header.begin(), header.end(), made), end; it != end; ++it) {
        ++names;
        EXPECT_NE(page.find('`' + it->str() + '`'), std::string::npos) << it->str();
    }
    EXPECT_GE(names, 14U);
}

TEST(ThePageAboutFrontEnds, NamesWhatTheHeadersHave) {
    const std::string page = contentOf("docs/front-ends.md");
    std::string headers;
    for (const char* folder : {"platform", "control", "comforts"})
        for (const auto& entry : std::filesystem::recursive_directory_iterator(
                 SOURCE_ROOT "/src/" + std::string(folder) + "/include"))
            if (entry.path().extension() == ".h")
                headers += contentOf(std::filesystem::relative(entry.path(), SOURCE_ROOT).string());
    // Whatever stands alone between backticks and begins as a type or a member does.
    static const std::regex name(R"(`(?:[A-Za-z]+::)*([A-Za-z_]{4,})(?:\(\))?`)");
    std::size_t names = 0;
    for (std::sregex_iterator it(page.begin(), page.end(), name), end; it != end; ++it) {
        ++names;
        EXPECT_NE(headers.find((*it)[1].str()), std::string::npos) << (*it)[1];
    }
    EXPECT_GE(names, 40U);
}
