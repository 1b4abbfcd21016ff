#include <Zandor/model/Layout.h>

#include <Zandor/model/Columns.h>

#include <algorithm>
#include <cstdlib>
#include <optional>

namespace zandor::model::layout {

namespace {

bool tooClose(const Box& a, const Box& b) {
    return a.left < b.left + b.width + betweenColumns &&
           b.left < a.left + a.width + betweenColumns && a.top < b.top + b.height + betweenRows &&
           b.top < a.top + a.height + betweenRows;
}

std::int64_t distance(const Box& a, const Box& b) {
    const std::int64_t across = std::abs(2 * a.left + a.width - 2 * b.left - b.width);
    const std::int64_t down = std::abs(2 * a.top + a.height - 2 * b.top - b.height);
    // A line between tables side by side is straight, one to a table below bends.
    return 2 * across + 3 * down;
}

/// Gives out the cells of one grid.
class Grid {
public:
    Grid(const std::vector<Size>& sizes, const std::vector<Box>& taken, std::int32_t canvasWidth)
        : mTaken(taken), mCanvasWidth(canvasWidth) {
        for (const Size& size : sizes) {
            mCell.width = std::max(mCell.width, size.width);
            mCell.height = std::max(mCell.height, size.height);
        }
        const auto count = static_cast<std::int32_t>(sizes.size() + taken.size());
        const std::int32_t pitch = mCell.width + betweenColumns;
        mColumns = std::clamp((canvasWidth - 2 * margin + betweenColumns) / pitch, 1, count);
        mRows = (count + mColumns - 1) / mColumns;
    }

    /// A free place for a table of this size beside one of `neighbours`, rather to its right. Takes
    /// it.
    std::optional<Box> takeBeside(const std::vector<Box>& neighbours, const Size& size) {
        for (const bool right : {true, false})
            for (const Box& each : neighbours) {
                const std::int32_t left = right ? each.left + each.width + betweenColumns
                                                : each.left - betweenColumns - size.width;
                const Box box{left, each.top, size.width, size.height};
                if (left < margin || left + size.width + margin > mCanvasWidth || !isFree(box))
                    continue;
                mGiven.push_back(box);
                return box;
            }
        return {};
    }

    /// The free cell with the least sum of distances to `neighbours`; without any, the one nearest
    /// to the middle, where a table has room for neighbours on all sides. Takes it.
    Box take(const std::vector<Box>& neighbours) {
        const std::vector<Box> middle = {box((mColumns - 1) / 2, (mRows - 1) / 2)};
        const auto& targets = neighbours.empty() ? middle : neighbours;
        std::optional<Box> best;
        std::int64_t least = 0;
        while (!best) {
            for (std::int32_t row = 0; row < mRows; ++row) {
                for (std::int32_t column = 0; column < mColumns; ++column) {
                    const Box cell = box(column, row);
                    if (!isFree(cell)) continue;
                    std::int64_t sum = 0;
                    for (const Box& target : targets) sum += distance(cell, target);
                    if (best && sum >= least) continue;
                    best = cell;
                    least = sum;
                }
            }
            if (!best) ++mRows; // what is taken already reaches into the grid
        }
        mGiven.push_back(*best);
        return *best;
    }

private:
    Box box(std::int32_t column, std::int32_t row) const {
        return {margin + column * (mCell.width + betweenColumns),
                margin + row * (mCell.height + betweenRows), mCell.width, mCell.height};
    }

    bool isFree(const Box& cell) const {
        const auto close = [&](const Box& other) { return tooClose(cell, other); };
        return std::none_of(mGiven.begin(), mGiven.end(), close) &&
               std::none_of(mTaken.begin(), mTaken.end(), close);
    }

    const std::vector<Box>& mTaken;
    const std::int32_t mCanvasWidth;
    Size mCell;
    std::int32_t mColumns = 1;
    std::int32_t mRows = 1;
    std::vector<Box> mGiven;
};

} // namespace

Size fittedSize(std::size_t entries, std::size_t longestText) {
    constexpr std::int32_t character = 105;
    constexpr std::int32_t besideText = 750; // border, key mark and output mark
    constexpr std::int32_t scrollBar = 210;
    constexpr std::int32_t entry = 270;
    constexpr std::int32_t aroundEntries = 480; // title bar and border
    constexpr std::size_t mostEntries = 10;
    const auto text = static_cast<std::int32_t>(std::min<std::size_t>(longestText, 100));
    const auto shown = static_cast<std::int32_t>(std::clamp<std::size_t>(entries, 2, mostEntries));
    const std::int32_t beside = entries > mostEntries ? besideText + scrollBar : besideText;
    return {std::clamp(beside + text * character, 1800, 3300), aroundEntries + shown * entry};
}

std::vector<Box> arrange(const std::vector<Size>& sizes, const std::vector<Link>& links,
                         const std::vector<Box>& taken, std::int32_t canvasWidth) {
    const std::size_t count = sizes.size();
    std::vector<Box> boxes(count);
    if (count == 0) return boxes;
    if (taken.empty()) return arrangeInColumns(sizes, links, canvasWidth);

    std::vector<std::vector<std::size_t>> neighbours(count + taken.size());
    for (const auto& [a, b] : links) {
        if (a == b) continue;
        neighbours.at(a).push_back(b);
        neighbours.at(b).push_back(a);
    }

    Grid grid(sizes, taken, canvasWidth);
    std::vector<std::optional<Box>> cells(count);
    cells.insert(cells.end(), taken.begin(), taken.end());
    const auto placedNeighbours = [&](std::size_t table) {
        std::vector<Box> placed;
        for (const std::size_t other : neighbours[table])
            if (cells[other]) placed.push_back(*cells[other]);
        return placed;
    };
    // Always the table with the most joins to what stands already; among those, the best joined.
    for (std::size_t step = 0; step < count; ++step) {
        std::optional<std::size_t> next;
        std::pair<std::size_t, std::size_t> most;
        for (std::size_t table = 0; table < count; ++table) {
            if (cells[table]) continue;
            const std::pair joined(placedNeighbours(table).size(), neighbours[table].size());
            if (next && joined <= most) continue;
            next = table;
            most = joined;
        }
        const auto near = placedNeighbours(*next);
        const auto beside = grid.takeBeside(near, sizes[*next]);
        cells[*next] = beside ? *beside : grid.take(near);
    }

    for (std::size_t table = 0; table < count; ++table)
        boxes[table] = {cells[table]->left, cells[table]->top, sizes[table].width,
                        sizes[table].height};
    return boxes;
}

std::vector<Box> arrangeAgain(const std::vector<Size>& sizes, const std::vector<Link>& links,
                              const std::vector<std::optional<Place>>& standing,
                              std::int32_t canvasWidth) {
    if (sizes.empty()) return {};
    return arrangeInColumns(sizes, links, canvasWidth, standing);
}

} // namespace zandor::model::layout
