#pragma once

#include <Zandor/QueryDocument.h>

#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <iterator>

inline std::filesystem::path testFile(const std::string& name) {
    return std::filesystem::path(FILES_FOLDER) / name;
}

inline std::string contentOf(const std::filesystem::path& path) {
    std::ifstream file(path, std::ios::binary);
    EXPECT_TRUE(file) << path;
    return {std::istreambuf_iterator<char>(file), {}};
}

inline std::string jsonOf(const zandor::files::QueryDocument& document) {
    const auto text = zandor::files::toJson(document);
    EXPECT_TRUE(text) << text.error();
    return text ? *text : std::string();
}

inline zandor::files::QueryDocument documentOf(std::string_view text) {
    auto document = zandor::files::fromJson(text);
    EXPECT_TRUE(document) << document.error();
    return document ? *document : zandor::files::QueryDocument();
}

/// A folder of its own that is deleted with all it holds.
class TemporaryFolder {
public:
    TemporaryFolder() {
        std::string name = std::filesystem::temp_directory_path() / "zandor-files-XXXXXX";
        if (!::mkdtemp(name.data())) throw std::runtime_error("no folder for the test");
        mPath = name;
    }
    TemporaryFolder(const TemporaryFolder&) = delete;
    TemporaryFolder& operator=(const TemporaryFolder&) = delete;
    ~TemporaryFolder() { std::filesystem::remove_all(mPath); }

    std::filesystem::path operator/(const std::string& name) const { return mPath / name; }
    /// The names of all that is in the folder.
    std::vector<std::string> names() const {
        std::vector<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(mPath))
            names.push_back(entry.path().filename());
        return names;
    }

private:
    std::filesystem::path mPath;
};
