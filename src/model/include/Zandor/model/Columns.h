#pragma once

#include <Zandor/model/Layout.h>
#include <Zandor/model/export.h>

namespace zandor::model::layout {

/// Boxes in columns, which is how lines that leave a table at its sides run best: joined tables
/// come into neighbouring columns and to like heights, and lines pass neither below tables nor
/// across each other as far as a search among the neighbours of an arrangement finds it. The same
/// tables and links always give the same boxes. Tables that have a place in `standing` are moved
/// from it only where something is gained.
ZANDOR_MODEL_EXPORT std::vector<Box>
arrangeInColumns(const std::vector<Size>& sizes, const std::vector<Link>& links,
                 std::int32_t canvasWidth, const std::vector<std::optional<Place>>& standing = {});

} // namespace zandor::model::layout
