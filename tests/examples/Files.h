#pragma once

#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <string>

/// The project's own files, for tests that read them.
inline std::string contentOf(const std::string& path) {
    std::ifstream file(SOURCE_ROOT "/" + path);
    EXPECT_TRUE(file) << path;
    return {std::istreambuf_iterator<char>(file), {}};
}
