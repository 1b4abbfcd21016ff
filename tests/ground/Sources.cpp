#include "Sources.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <iterator>
#include <regex>

namespace sources {

namespace fs = std::filesystem;

fs::path root() { return ZANDOR_SOURCE_DIR; }

std::vector<std::string> below(const std::string& folder) {
    std::vector<std::string> files;
    if (fs::is_directory(root() / folder)) {
        for (const auto& entry : fs::recursive_directory_iterator(root() / folder)) {
            const fs::path& path = entry.path();
            if (path.extension() == ".h" || path.extension() == ".cpp")
                files.push_back(path.lexically_relative(root()).generic_string());
        }
    }
    if (files.empty()) ADD_FAILURE() << "no source file below " << folder;
    std::sort(files.begin(), files.end());
    return files;
}

std::vector<Include> includesOf(const std::string& file) {
    static const std::regex pattern(R"re(^[ \t]*#[ \t]*include[ \t]*([<"])([^>"]+)[>"].*)re");
    std::vector<Include> includes;
    std::ifstream in(root() / file);
    std::smatch match;
    for (std::string line; std::getline(in, line);)
        if (std::regex_match(line, match, pattern)) includes.push_back({match[2], match[1] == "<"});
    return includes;
}

std::size_t lineCount(const std::string& file) {
    const std::string text = contentOf(file);
    return static_cast<std::size_t>(std::count(text.begin(), text.end(), '\n'));
}

std::string contentOf(const std::string& file) {
    std::ifstream in(root() / file, std::ios::binary);
    if (!in) ADD_FAILURE() << "cannot read " << file;
    return {std::istreambuf_iterator<char>(in), {}};
}

} // namespace sources
