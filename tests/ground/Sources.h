#pragma once

#include <filesystem>
#include <string>
#include <vector>

/// The project's own source files, for the tests that read them.
namespace sources {

struct Include {
    std::string name;
    bool angled = false; ///< <name> rather than "name"
};

/// The root of the source tree.
std::filesystem::path root();

/// Every .h and .cpp below a folder of the tree, as paths relative to the root, in order. An empty
/// result fails the test that asked: it would prove nothing.
std::vector<std::string> below(const std::string& folder);

/// What a file includes, in order.
std::vector<Include> includesOf(const std::string& file);

std::size_t lineCount(const std::string& file);

/// The whole of a file, as it stands.
std::string contentOf(const std::string& file);

} // namespace sources
