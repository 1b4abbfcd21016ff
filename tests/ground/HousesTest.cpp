#include "Sources.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>

// Who may know whom, as docs/architecture.md states it.

namespace {

using Houses = std::set<std::string>;

/// The house that a file below src/ lives in.
std::string houseOf(const std::string& file) {
    const auto startsWith = [&](const char* prefix) { return file.rfind(prefix, 0) == 0; };
    if (startsWith("platform/headless/")) return "headless";
    if (startsWith("platform/qt/")) return "qt";
    if (startsWith("platform/")) return "platform";
    if (startsWith("comforts/")) return "comforts";
    if (startsWith("model/reader/")) return "reader";
    if (startsWith("model/files/")) return "files";
    if (startsWith("model/")) return "model";
    if (startsWith("designer/")) return "designer";
    return "control";
}

const std::map<std::string, Houses> mayInclude = {
    {"platform", {"platform"}},
    {"control", {"control", "platform"}},
    {"comforts", {"comforts", "control", "platform"}},
    {"headless", {"headless", "comforts", "platform"}},
    {"qt", {"qt", "comforts", "control", "platform"}},
    {"model", {"model", "platform"}},
    {"reader", {"reader", "model", "platform"}},
    {"files", {"files", "model", "platform"}},
    {"designer", {"designer", "files", "reader", "model", "qt", "comforts", "control", "platform"}},
};

/// The houses that use the standard library and nothing else.
const Houses toolkitFree = {"platform", "control", "comforts", "headless", "model"};

const std::set<std::string> standardHeaders = {"algorithm",
                                               "any",
                                               "array",
                                               "atomic",
                                               "barrier",
                                               "bit",
                                               "bitset",
                                               "cassert",
                                               "cctype",
                                               "cerrno",
                                               "cfenv",
                                               "cfloat",
                                               "charconv",
                                               "chrono",
                                               "cinttypes",
                                               "climits",
                                               "clocale",
                                               "cmath",
                                               "codecvt",
                                               "compare",
                                               "complex",
                                               "concepts",
                                               "condition_variable",
                                               "coroutine",
                                               "csetjmp",
                                               "csignal",
                                               "cstdarg",
                                               "cstddef",
                                               "cstdint",
                                               "cstdio",
                                               "cstdlib",
                                               "cstring",
                                               "ctime",
                                               "cuchar",
                                               "cwchar",
                                               "cwctype",
                                               "deque",
                                               "exception",
                                               "execution",
                                               "filesystem",
                                               "format",
                                               "forward_list",
                                               "fstream",
                                               "functional",
                                               "future",
                                               "initializer_list",
                                               "iomanip",
                                               "ios",
                                               "iosfwd",
                                               "iostream",
                                               "istream",
                                               "iterator",
                                               "latch",
                                               "limits",
                                               "list",
                                               "locale",
                                               "map",
                                               "memory",
                                               "memory_resource",
                                               "mutex",
                                               "new",
                                               "numbers",
                                               "numeric",
                                               "optional",
                                               "ostream",
                                               "queue",
                                               "random",
                                               "ranges",
                                               "ratio",
                                               "regex",
                                               "scoped_allocator",
                                               "semaphore",
                                               "set",
                                               "shared_mutex",
                                               "source_location",
                                               "span",
                                               "sstream",
                                               "stack",
                                               "stdexcept",
                                               "stop_token",
                                               "streambuf",
                                               "string",
                                               "string_view",
                                               "strstream",
                                               "syncstream",
                                               "system_error",
                                               "thread",
                                               "tuple",
                                               "type_traits",
                                               "typeindex",
                                               "typeinfo",
                                               "unordered_map",
                                               "unordered_set",
                                               "utility",
                                               "valarray",
                                               "variant",
                                               "vector",
                                               "version"};

/// A quoted include as a path below src/: from there, or from beside the file that includes it.
std::string resolved(const std::string& file, const std::string& name) {
    namespace fs = std::filesystem;
    const fs::path src = sources::root() / "src";
    const fs::path beside = fs::path(file).parent_path() / name;
    if (fs::exists(src / name)) return fs::path(name).lexically_normal().generic_string();
    if (fs::exists(src / beside)) return beside.lexically_normal().generic_string();
    return {};
}

std::vector<std::string> filesBelowSrc() {
    std::vector<std::string> files = sources::below("src");
    for (std::string& file : files) file.erase(0, std::string("src/").size());
    return files;
}

} // namespace

TEST(TheHouses, KnowOnlyThoseTheyMay) {
    for (const std::string& file : filesBelowSrc()) {
        const Houses& allowed = mayInclude.at(houseOf(file));
        for (const auto& [name, angled] : sources::includesOf("src/" + file)) {
            if (angled) continue;
            const std::string target = resolved(file, name);
            if (target.empty()) continue; // made by the build, as a .moc file is
            EXPECT_TRUE(allowed.contains(houseOf(target)))
                << file << " of the house " << houseOf(file) << " includes " << name;
        }
    }
}

TEST(TheHouses, OfTheCoreIncludeStandardHeadersOnly) {
    for (const std::string& file : filesBelowSrc()) {
        if (!toolkitFree.contains(houseOf(file))) continue;
        for (const auto& [name, angled] : sources::includesOf("src/" + file)) {
            if (angled)
                EXPECT_TRUE(standardHeaders.contains(name)) << file << " includes <" << name << ">";
            else
                EXPECT_FALSE(resolved(file, name).empty())
                    << file << " includes \"" << name << "\", which is none of ours";
        }
    }
}

TEST(TheHouses, OfTheCoreAskForNoToolkitWithTheirPreprocessor) {
    for (const std::string& file : filesBelowSrc()) {
        if (!toolkitFree.contains(houseOf(file))) continue;
        const std::string text = sources::contentOf("src/" + file);
        for (const char* directive : {"#if ", "#ifdef ", "#ifndef ", "#elif "})
            EXPECT_EQ(text.find(directive), std::string::npos) << file << " has " << directive;
    }
}

TEST(TheHouses, HaveNoFileOfMoreThan600Lines) {
    for (const char* folder : {"src", "tests"})
        for (const std::string& file : sources::below(folder))
            EXPECT_LE(sources::lineCount(file), 600U) << file;
}

TEST(TheReaderOfSources, SeesIncludesOfBothForms) {
    const auto includes = sources::includesOf("tests/ground/HousesTest.cpp");
    ASSERT_GE(includes.size(), 2U);
    EXPECT_EQ(includes[0].name, "Sources.h");
    EXPECT_FALSE(includes[0].angled);
    EXPECT_EQ(includes[1].name, "gtest/gtest.h");
    EXPECT_TRUE(includes[1].angled);
}

TEST(ASourceWithAHeaderOfItsName, IncludesThatFirst) {
    // So the header is compiled with nothing before it that it could lean on.
    std::size_t pairs = 0;
    for (const std::string& file : sources::below("src")) {
        if (!file.ends_with(".cpp")) continue;
        const std::string header = file.substr(0, file.size() - 3) + "h";
        if (!std::filesystem::exists(sources::root() / header)) continue;
        ++pairs;
        const auto includes = sources::includesOf(file);
        ASSERT_FALSE(includes.empty()) << file;
        EXPECT_EQ("src/" + includes.front().name, header) << file;
    }
    EXPECT_GT(pairs, 100U);
}
