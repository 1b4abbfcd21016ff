#include <gtest/gtest.h>

#include <array>
#include <cstdio>
#include <memory>
#include <regex>
#include <string>
#include <vector>

namespace {

std::string outputOf(const std::string& command) {
    const auto close = [](FILE* pipe) { pclose(pipe); };
    const std::unique_ptr<FILE, decltype(close)> pipe(popen(command.c_str(), "r"), close);
    std::string output;
    std::array<char, 4096> buffer;
    while (pipe && fgets(buffer.data(), buffer.size(), pipe.get())) output += buffer.data();
    return output;
}

/// The shared libraries that a program asks the loader for.
std::vector<std::string> neededBy(const std::string& program) {
    const std::string section = outputOf("LC_ALL=C '" ZANDOR_READELF "' -d '" + program + "'");
    static const std::regex pattern(R"(\(NEEDED\)[^\[]*\[([^\]]+)\])");
    std::vector<std::string> libraries;
    for (std::sregex_iterator it(section.begin(), section.end(), pattern), end; it != end; ++it)
        libraries.push_back((*it)[1]);
    return libraries;
}

} // namespace

TEST(TheControlsLibrary, NeedsTheLanguagesRuntimeAndNothingElse) {
    // Sanitizers and the loader belong to the compiler, not to the core.
    static const std::regex runtime(
        R"((libstdc\+\+|libc\+\+|libc\+\+abi|libm|libgcc_s|libc|libasan|libubsan|ld-linux.*)\.so\.\d+)");
    const auto libraries = neededBy(ZANDOR_CORE_ALONE);
    ASSERT_FALSE(libraries.empty()) << "readelf showed nothing of " ZANDOR_CORE_ALONE;
    for (const std::string& library : libraries)
        EXPECT_TRUE(std::regex_match(library, runtime)) << library;
}
