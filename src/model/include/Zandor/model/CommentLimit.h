#pragma once

#include <cstddef>

namespace zandor::model {

/// So many comments a query file holds, and the reader of statements takes.
inline constexpr std::size_t mostComments = 10'000;

} // namespace zandor::model
