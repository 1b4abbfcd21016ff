#pragma once

#include <Zandor/model/export.h>

#include <cstddef>
#include <cstdint>
#include <optional>
#include <utility>
#include <vector>

/// Places for new tables on the canvas. All lengths are twips.
namespace zandor::model::layout {

inline constexpr std::int32_t margin = 300;          ///< left of and above the first table
inline constexpr std::int32_t betweenColumns = 1200; ///< room for the join marks of both sides
inline constexpr std::int32_t betweenRows = 450;     ///< from one table to the one below

/// Of a table.
struct Size {
    std::int32_t width = 0;  ///< the border included
    std::int32_t height = 0; ///< title and border included
};

/// Of a table's upper left corner.
struct Place {
    std::int32_t left = 0; ///< from the canvas's left edge
    std::int32_t top = 0;  ///< from its upper edge
};

/// A place and a size.
struct Box {
    std::int32_t left = 0;   ///< as Place::left
    std::int32_t top = 0;    ///< as Place::top
    std::int32_t width = 0;  ///< as Size::width
    std::int32_t height = 0; ///< as Size::height
};

/// The size of a table with this many entries, the longest of which (or the title) has this many
/// characters: all entries show up to ten, behind that the list scrolls.
ZANDOR_MODEL_EXPORT Size fittedSize(std::size_t entries, std::size_t longestText);

/// A pair of tables that a join connects: positions from 0 in `sizes`, or behind them in `taken`.
using Link = std::pair<std::size_t, std::size_t>;

/// Boxes for tables of these sizes, in their order. Joined tables come near each other; no box
/// comes closer to another or to one of `taken` than the distances above. They are as wide together
/// as `canvasWidth` allows (one column at least) and as deep as they need. Where nothing is taken
/// they stand in columns by their joins (arrangeInColumns); otherwise to the right of what they are
/// joined to, or to the left of it, and where neither is free in the cells, as large as the largest
/// table, of a grid.
ZANDOR_MODEL_EXPORT std::vector<Box> arrange(const std::vector<Size>& sizes,
                                             const std::vector<Link>& links,
                                             const std::vector<Box>& taken,
                                             std::int32_t canvasWidth);

/// Boxes for all tables of a drawing that has grown: in columns, as above, but so that those with a
/// place in `standing` move no further than it is worth, for somebody knows by now where they are,
/// and that all columns begin at the top, where they are seen. A table is new where `standing` has
/// nothing, or ends before it.
ZANDOR_MODEL_EXPORT std::vector<Box> arrangeAgain(const std::vector<Size>& sizes,
                                                  const std::vector<Link>& links,
                                                  const std::vector<std::optional<Place>>& standing,
                                                  std::int32_t canvasWidth);

} // namespace zandor::model::layout
