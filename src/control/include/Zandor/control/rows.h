#pragma once

#include <cstdint>

/// The rows of the grid that mean something of their own; criteria fill all from the first on.
namespace TalvikDBxZandor::row {

inline constexpr std::int32_t field = 0;
inline constexpr std::int32_t synonym = 1;
inline constexpr std::int32_t sort = 2;
inline constexpr std::int32_t visible = 3;
inline constexpr std::int32_t firstCriteria = 4;

} // namespace TalvikDBxZandor::row
