#include "Files.h"

#include <algorithm>
#include <filesystem>

TEST(TheFoldersOfExamples, AreListedAndRunAsInstalled) {
    const std::string listed = contentOf("examples/README.md");
    const std::string run = contentOf("tests/package/examples/CMakeLists.txt");
    std::size_t folders = 0;
    for (const auto& entry : std::filesystem::directory_iterator(SOURCE_ROOT "/examples")) {
        if (!entry.is_directory()) continue;
        ++folders;
        const std::string name = entry.path().filename().string();
        EXPECT_NE(listed.find("| [" + name + "](" + name + ") |"), std::string::npos) << name;
        if (!std::filesystem::exists(entry.path() / "CMakeLists.txt")) continue;
        EXPECT_NE(run.find("package_example_says(" + name + " "), std::string::npos) << name;
        const std::string project = contentOf("examples/" + name + "/CMakeLists.txt");
        EXPECT_NE(project.find("project(zandor_example_" + name + " "), std::string::npos) << name;
        EXPECT_NE(project.find("find_package(Zandor "), std::string::npos) << name;
    }
    EXPECT_GE(folders, 6U);
}

TEST(TheFirstExample, IsUnderFortyLines) {
    const std::string text = contentOf("examples/first/main.cpp");
    EXPECT_LT(std::count(text.begin(), text.end(), '\n'), 40);
}
