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
    if (startsWith("model/reader/")) return "reader";
    if (startsWith("model/files/")) return "files";
    if (startsWith("model/sql_reader/")) return "sql_reader";
    if (startsWith("frontends/windows/automation/")) return "frontends/windows/automation";
    if (startsWith("frontends/windows/toolkit/")) return "frontends/windows/toolkit";
    if (startsWith("frontends/")) return file.substr(0, file.find('/', sizeof "frontends"));
    return file.substr(0, file.find('/'));
}

const std::map<std::string, Houses> mayInclude = {
    {"platform", {"platform"}},
    {"control", {"control", "platform"}},
    {"comforts", {"comforts", "control", "platform"}},
    {"frontends/headless", {"frontends/headless", "comforts", "control", "platform"}},
    {"frontends/qt", {"frontends/qt", "comforts", "control", "platform"}},
    {"frontends/windows/toolkit", {"frontends/windows/toolkit", "comforts", "control", "platform"}},
    {"frontends/windows/automation",
     {"frontends/windows/automation", "frontends/windows/toolkit", "model", "comforts", "control",
      "platform"}},
    {"frontends/qt_designer",
     {"frontends/qt_designer", "frontends/qt", "model", "comforts", "control", "platform"}},
    {"model", {"model", "platform"}},
    {"reader", {"reader", "model", "platform"}},
    {"files", {"files", "model", "platform"}},
    {"sql_reader", {"sql_reader", "model", "platform"}},
    {"designer",
     {"designer", "files", "reader", "sql_reader", "model", "frontends/qt", "comforts", "control",
      "platform"}},
};

/// The houses that use the standard library and nothing else.
const Houses toolkitFree = {"platform", "control", "comforts", "frontends/headless", "model"};

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

/// What is handed out stands in a folder of its house: include/Zandor, and is included as it is
/// from the installed ones.
bool isHandedOut(const sources::Include& include) {
    return include.angled && include.name.starts_with("Zandor/");
}

/// The folders that <Zandor/...> is looked for in.
const std::vector<std::string>& foldersHandedOut() {
    static const std::vector<std::string> folders = [] {
        std::vector<std::string> found;
        const std::filesystem::path src = sources::root() / "src";
        for (const auto& entry : std::filesystem::recursive_directory_iterator(src))
            if (entry.is_directory() && entry.path().filename() == "include")
                found.push_back(entry.path().lexically_relative(src).generic_string());
        return found;
    }();
    return folders;
}

/// An include of ours as a path below src/: handed out, from there, or from beside the file that
/// includes it. Empty for one that is not ours.
std::string resolved(const std::string& file, const sources::Include& include) {
    namespace fs = std::filesystem;
    const fs::path src = sources::root() / "src";
    if (include.angled) {
        for (const std::string& folder : foldersHandedOut())
            if (isHandedOut(include) && fs::exists(src / folder / include.name))
                return folder + "/" + include.name;
        return {};
    }
    const fs::path beside = fs::path(file).parent_path() / include.name;
    if (fs::exists(src / include.name))
        return fs::path(include.name).lexically_normal().generic_string();
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
    std::size_t arrows = 0;
    for (const std::string& file : filesBelowSrc()) {
        ASSERT_TRUE(mayInclude.contains(houseOf(file))) << file << " lives in no house";
        const Houses& allowed = mayInclude.at(houseOf(file));
        for (const sources::Include& include : sources::includesOf("src/" + file)) {
            const std::string target = resolved(file, include);
            if (target.empty()) continue; // of a library, or made by the build as a .moc file is
            if (houseOf(target) != houseOf(file)) ++arrows;
            EXPECT_TRUE(allowed.contains(houseOf(target)))
                << file << " of the house " << houseOf(file) << " includes " << include.name;
        }
    }
    EXPECT_GT(arrows, 200U);
}

TEST(TheHouses, ReachEachOtherByWhatIsHandedOut) {
    // The designer is of this tree, and its pages and dialogs may use what is not promised. The
    // reader of statements is a wing of the model's, built apart for the parser that it needs.
    const std::set<std::pair<std::string, std::string>> wings = {{"sql_reader", "model"}};
    for (const std::string& file : filesBelowSrc()) {
        if (houseOf(file) == "designer") continue;
        for (const sources::Include& include : sources::includesOf("src/" + file)) {
            const std::string target = resolved(file, include);
            if (target.empty() || isHandedOut(include)) continue;
            if (wings.contains({houseOf(file), houseOf(target)})) continue;
            EXPECT_EQ(houseOf(target), houseOf(file)) << file << " includes " << include.name;
        }
    }
}

TEST(WhatIsHandedOut, NeedsNothingThatIsNot) {
    std::size_t headers = 0;
    for (const std::string& file : filesBelowSrc()) {
        if (file.find("/include/Zandor/") == std::string::npos) continue;
        ++headers;
        for (const sources::Include& include : sources::includesOf("src/" + file))
            EXPECT_TRUE(include.angled) << file << " includes \"" << include.name << "\"";
    }
    EXPECT_GT(headers, 50U);
}

TEST(TheHouses, OfTheCoreIncludeStandardHeadersOnly) {
    for (const std::string& file : filesBelowSrc()) {
        if (!toolkitFree.contains(houseOf(file))) continue;
        for (const sources::Include& include : sources::includesOf("src/" + file)) {
            if (include.name.ends_with("/export.h")) continue; // made by the build
            if (include.angled && !isHandedOut(include))
                EXPECT_TRUE(standardHeaders.contains(include.name))
                    << file << " includes <" << include.name << ">";
            else
                EXPECT_FALSE(resolved(file, include).empty())
                    << file << " includes " << include.name << ", which is none of ours";
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
    std::map<std::string, std::string> handedOut; // by house and name
    for (const std::string& file : filesBelowSrc())
        if (file.find("/include/Zandor/") != std::string::npos)
            handedOut[houseOf(file) + "/" + std::filesystem::path(file).filename().string()] = file;
    std::size_t pairs = 0;
    for (const std::string& file : filesBelowSrc()) {
        if (!file.ends_with(".cpp")) continue;
        std::string header = file.substr(0, file.size() - 3) + "h";
        const auto found =
            handedOut.find(houseOf(file) + "/" + std::filesystem::path(header).filename().string());
        if (found != handedOut.end()) header = found->second;
        if (!std::filesystem::exists(sources::root() / "src" / header)) continue;
        ++pairs;
        const auto includes = sources::includesOf("src/" + file);
        ASSERT_FALSE(includes.empty()) << file;
        EXPECT_EQ(resolved(file, includes.front()), header) << file;
    }
    EXPECT_GT(pairs, 100U);
}
