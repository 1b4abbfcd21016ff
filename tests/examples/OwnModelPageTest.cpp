#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <string>

namespace {

std::string contentOf(const std::string& path) {
    std::ifstream file(SOURCE_ROOT "/" + path);
    EXPECT_TRUE(file) << path;
    return {std::istreambuf_iterator<char>(file), {}};
}

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
    const std::string folder = "examples/own_model/";
    for (const std::string& code :
         {part(folder + "ReportModel.h", "column"), part(folder + "ReportModel.h", "library"),
          part(folder + "ReportModel.cpp", "join"), part(folder + "ReportModel.cpp", "model"),
          contentOf(folder + "main.cpp")})
        EXPECT_NE(page.find("```cpp\n" + code + "```"), std::string::npos) << code;
}
