#pragma once

#include <Zandor/model/CommentLimit.h>

#include <cstddef>

/// What a query file may have. The counts are far above what a person draws, and low enough that
/// no file takes long or much memory.
namespace zandor::files::limits {

inline constexpr std::size_t fileSize = std::size_t{64} * 1024 * 1024; ///< bytes
inline constexpr std::size_t depth = 64;           ///< arrays and objects within each other
inline constexpr std::size_t values = 2'000'000;   ///< in the whole file
inline constexpr std::size_t textLength = 100'000; ///< UTF-16 code units of one text
inline constexpr std::size_t tables = 1'000;
inline constexpr std::size_t columnsOfTable = 5'000;
inline constexpr std::size_t columns = 100'000; ///< of all tables
inline constexpr std::size_t joins = 10'000;
inline constexpr std::size_t definitions = 10'000;
inline constexpr std::size_t comments = model::mostComments;

} // namespace zandor::files::limits
