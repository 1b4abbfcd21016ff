#include <Zandor/model/Columns.h>

#include <algorithm>
#include <cstdlib>
#include <numeric>
#include <optional>

namespace zandor::model::layout {

namespace {

using Cost = std::int64_t;
using Columns = std::vector<std::vector<std::size_t>>;
using Standing = std::vector<std::optional<Place>>;

// What spoils a drawing, in twips of a line that is longer for it.
constexpr Cost sameColumn = 9000;    // the line bends around its own tables
constexpr Cost columnBetween = 3000; // the line passes other tables
constexpr Cost belowTable = 6000;    // the line is hidden
constexpr Cost crossing = 2500;
constexpr Cost tooWide = 1'000'000;
/// The part of a table's way from where it stood that counts.
constexpr Cost wayWeight = 4;

/// Pairs of lines and tables to look at, some tenths of a second. Beyond it, what was found by then
/// is taken.
constexpr std::size_t mostWork = 8'000'000;

struct Point {
    Cost x = 0;
    Cost y = 0;
};

struct Line {
    Point from;
    Point to;
};

Point middle(const Box& box) { return {box.left + box.width / 2, box.top + box.height / 2}; }

/// On which side of a line a point is: negative, 0 on it, positive.
Cost side(const Line& line, const Point& point) {
    return (line.to.x - line.from.x) * (point.y - line.from.y) -
           (line.to.y - line.from.y) * (point.x - line.from.x);
}

bool cross(const Line& a, const Line& b) {
    const auto apart = [](Cost one, Cost other) { return (one < 0) != (other < 0); };
    return side(a, b.from) != 0 && side(a, b.to) != 0 && side(b, a.from) != 0 &&
           side(b, a.to) != 0 && apart(side(a, b.from), side(a, b.to)) &&
           apart(side(b, a.from), side(b, a.to));
}

/// The height of a line, which runs from left to right, at a place.
Cost heightAt(const Line& line, Cost x) {
    return line.from.y + (line.to.y - line.from.y) * (x - line.from.x) / (line.to.x - line.from.x);
}

bool runsBelow(const Line& line, const Box& box) {
    const Cost right = box.left + box.width;
    if (box.left <= line.from.x || right >= line.to.x) return false;
    const Cost entering = heightAt(line, box.left);
    const Cost leaving = heightAt(line, right);
    return std::max(entering, leaving) > box.top &&
           std::min(entering, leaving) < box.top + box.height;
}

class Drawing {
public:
    Drawing(const std::vector<Size>& sizes, const std::vector<Link>& links,
            std::int32_t canvasWidth, const Standing& standing)
        : mSizes(sizes), mLinks(links), mCanvasWidth(canvasWidth), mStanding(standing),
          mBoxes(sizes.size()), mColumnOf(sizes.size()), mJoined(sizes.size()) {
        for (const auto& [a, b] : links) mJoined[a] = mJoined[b] = true;
    }

    const std::vector<Box>& boxes() const { return mBoxes; }
    bool isJoined(std::size_t table) const { return mJoined[table]; }

    Cost cost(const Columns& columns) {
        const std::int32_t right = place(columns);
        Cost sum = right > mCanvasWidth ? tooWide + right : 0;
        for (const Box& box : mBoxes) sum += (box.top + box.height) / 4; // nobody likes to scroll
        mLines.clear();
        for (std::size_t table = 0; table < mStanding.size(); ++table) sum += costOfWay(table);
        for (const auto& [a, b] : mLinks) sum += costOfLink(a, b);
        for (std::size_t n = 0; n < mLines.size(); ++n)
            for (std::size_t m = 0; m < n; ++m)
                if (cross(mLines[n], mLines[m])) sum += crossing;
        return sum;
    }

private:
    /// Columns begin at the top; those of fewer joined tables than another has stand in the middle
    /// of the height of the tallest, unless the drawing grows: they would move down each time.
    /// Returns where the columns end.
    std::int32_t place(const Columns& columns) {
        std::int32_t tallest = 0;
        std::size_t most = 0;
        for (const auto& column : columns) {
            tallest = std::max(tallest, heightOf(column));
            most = std::max(most, joinedOf(column));
        }
        std::int32_t left = margin;
        for (std::size_t n = 0; n < columns.size(); ++n) {
            const bool fewer = mStanding.empty() && joinedOf(columns[n]) < most;
            std::int32_t top = margin + (fewer ? (tallest - heightOf(columns[n])) / 2 : 0);
            std::int32_t width = 0;
            for (const std::size_t table : columns[n]) {
                const auto& [own, height] = mSizes[table];
                mBoxes[table] = {left, top, own, height};
                mColumnOf[table] = n;
                width = std::max(width, own);
                top += height + betweenRows;
            }
            if (!columns[n].empty()) left += width + betweenColumns;
        }
        return left - betweenColumns + margin;
    }

    std::size_t joinedOf(const std::vector<std::size_t>& column) const {
        return static_cast<std::size_t>(
            std::ranges::count_if(column, [this](std::size_t table) { return mJoined[table]; }));
    }

    std::int32_t heightOf(const std::vector<std::size_t>& column) const {
        std::int32_t height = -betweenRows;
        for (const std::size_t table : column)
            if (mJoined[table]) height += mSizes[table].height + betweenRows;
        return std::max(height, 0);
    }

    Cost costOfWay(std::size_t table) const {
        const auto& stood = mStanding[table];
        if (!stood) return 0;
        const Box& box = mBoxes[table];
        return (std::abs(box.left - stood->left) + std::abs(box.top - stood->top)) / wayWeight;
    }

    Cost costOfLink(std::size_t a, std::size_t b) {
        if (mColumnOf[a] > mColumnOf[b]) std::swap(a, b);
        const Box& left = mBoxes[a];
        const Box& right = mBoxes[b];
        const std::size_t columns = mColumnOf[b] - mColumnOf[a];
        Cost sum = std::abs(middle(left).y - middle(right).y);
        if (columns == 0) return sum + sameColumn + belowTable * tablesBetween(left, right);
        const Line line{{left.left + left.width, middle(left).y}, {right.left, middle(right).y}};
        mLines.push_back(line);
        sum += columnBetween * static_cast<Cost>(columns - 1);
        if (columns == 1) return sum;
        for (const Box& box : mBoxes)
            if (runsBelow(line, box)) sum += belowTable;
        return sum;
    }

    /// Of one column.
    Cost tablesBetween(const Box& a, const Box& b) const {
        const std::int32_t upper = std::min(a.top, b.top);
        const std::int32_t lower = std::max(a.top, b.top);
        return std::ranges::count_if(mBoxes, [&](const Box& box) {
            return box.left == a.left && box.top > upper && box.top < lower;
        });
    }

    const std::vector<Size>& mSizes;
    const std::vector<Link>& mLinks;
    const std::int32_t mCanvasWidth;
    const Standing& mStanding;
    std::vector<Box> mBoxes;
    std::vector<std::size_t> mColumnOf;
    std::vector<bool> mJoined;
    std::vector<Line> mLines;
};

/// The tables in the order of their distance from the first, in links, with this distance; tables
/// of another group follow behind.
std::vector<std::pair<std::size_t, std::size_t>> byDistance(const std::vector<std::size_t>& tables,
                                                            const std::vector<Link>& links,
                                                            std::size_t first) {
    std::vector<std::pair<std::size_t, std::size_t>> order{{first, 0}};
    const auto reached = [&](std::size_t table) {
        return std::ranges::any_of(order, [&](const auto& each) { return each.first == table; });
    };
    for (std::size_t n = 0; n < tables.size(); ++n) {
        if (n == order.size()) order.emplace_back(*std::ranges::find_if_not(tables, reached), 0);
        const auto [table, distance] = order[n];
        for (const auto& [a, b] : links) {
            if (a != table && b != table) continue;
            const std::size_t other = a == table ? b : a;
            if (!reached(other)) order.emplace_back(other, distance + 1);
        }
    }
    return order;
}

/// Each table in the column of its distance from the first, where there are so many.
Columns layered(const std::vector<std::size_t>& tables, const std::vector<Link>& links,
                std::size_t first, std::size_t columnCount) {
    Columns columns(columnCount);
    const std::size_t deepest = tables.size() / columnCount + 2;
    for (const auto& [table, distance] : byDistance(tables, links, first)) {
        std::size_t column = distance % columnCount;
        while (columns[column].size() >= deepest) column = (column + 1) % columnCount;
        columns[column].push_back(table);
    }
    return columns;
}

/// Changes an arrangement as long as moving one table or exchanging two makes it better.
class Search {
public:
    Search(Drawing& drawing, Columns columns, int& trials)
        : mDrawing(drawing), mColumns(std::move(columns)), mLeast(mDrawing.cost(mColumns)),
          mTrials(trials) {}

    void run() {
        while (mTrials > 0 && (moveOne() || exchangeTwo())) {
        }
    }
    Cost cost() const { return mLeast; }
    const Columns& columns() const { return mColumns; }

private:
    bool better(Columns& changed) {
        --mTrials;
        const Cost cost = mDrawing.cost(changed);
        if (cost >= mLeast) return false;
        mLeast = cost;
        mColumns.swap(changed);
        return true;
    }

    bool moveOne() {
        bool moved = false;
        for (std::size_t from = 0; from < mColumns.size(); ++from)
            for (std::size_t n = 0; n < mColumns[from].size(); ++n)
                for (std::size_t to = 0; to < mColumns.size(); ++to)
                    for (std::size_t m = 0; m <= mColumns[to].size() && mTrials > 0; ++m) {
                        if (n >= mColumns[from].size()) break; // moved away
                        Columns changed = mColumns;
                        const std::size_t table = changed[from][n];
                        std::erase(changed[from], table);
                        auto& column = changed[to];
                        const std::size_t at = std::min(m, column.size());
                        column.insert(column.begin() + static_cast<std::ptrdiff_t>(at), table);
                        moved |= better(changed);
                    }
        return moved;
    }

    bool exchangeTwo() {
        bool exchanged = false;
        const auto all = places();
        for (std::size_t i = 0; i < all.size(); ++i)
            for (std::size_t j = 0; j < i && mTrials > 0; ++j) {
                Columns changed = mColumns;
                std::swap(changed[all[i].first][all[i].second],
                          changed[all[j].first][all[j].second]);
                exchanged |= better(changed);
            }
        return exchanged;
    }

    std::vector<std::pair<std::size_t, std::size_t>> places() const {
        std::vector<std::pair<std::size_t, std::size_t>> all;
        for (std::size_t column = 0; column < mColumns.size(); ++column)
            for (std::size_t n = 0; n < mColumns[column].size(); ++n) all.emplace_back(column, n);
        return all;
    }

    Drawing& mDrawing;
    Columns mColumns;
    Cost mLeast;
    int& mTrials;
};

/// Columns of the widest table that a canvas has room for.
std::size_t columnsFitting(const std::vector<Size>& sizes, std::int32_t canvasWidth) {
    std::int32_t widest = 0;
    for (const Size& size : sizes) widest = std::max(widest, size.width);
    const std::int32_t fitting =
        (canvasWidth - 2 * margin + betweenColumns) / (widest + betweenColumns);
    return static_cast<std::size_t>(
        std::clamp(fitting, 1, static_cast<std::int32_t>(sizes.size())));
}

/// The tables in the columns where they stood, each new one right of what it is joined to.
Columns asTheyStood(const std::vector<std::size_t>& tables, const std::vector<Link>& links,
                    const Standing& standing, std::size_t columnCount) {
    std::vector<std::size_t> stood;
    std::vector<std::int32_t> lefts;
    for (const std::size_t table : tables)
        if (table < standing.size() && standing[table]) stood.push_back(table);
    for (const auto& place : standing)
        if (place) lefts.push_back(place->left);
    std::ranges::sort(lefts);
    lefts.erase(std::unique(lefts.begin(), lefts.end()), lefts.end());
    std::ranges::sort(stood, {}, [&](std::size_t table) { return standing[table]->top; });

    Columns columns(columnCount);
    std::vector<std::optional<std::size_t>> columnOf(
        tables.empty() ? 0 : *std::ranges::max_element(tables) + 1);
    const auto put = [&](std::size_t table, std::size_t column) {
        columnOf[table] = std::min(column, columnCount - 1);
        columns[*columnOf[table]].push_back(table);
    };
    for (const std::size_t table : stood) {
        const auto rank = std::ranges::lower_bound(lefts, standing[table]->left) - lefts.begin();
        put(table, static_cast<std::size_t>(rank));
    }
    for (const std::size_t table : tables) {
        if (columnOf[table]) continue;
        std::size_t column = 0;
        for (const auto& [a, b] : links)
            if (a == table || b == table)
                if (const auto& of = columnOf[a == table ? b : a])
                    column = std::max(column, *of + 1);
        put(table, column);
    }
    return columns;
}

/// The joined tables, from how they stood, if they did, and from several arrangements by distance.
Columns joinedInColumns(Drawing& drawing, const std::vector<std::size_t>& tables,
                        const std::vector<Link>& links, std::size_t columnCount,
                        const Standing& standing) {
    Columns best(columnCount);
    std::optional<Cost> least;
    const std::size_t perTrial = (links.size() + 1) * (links.size() + tables.size() + 1);
    auto trials = static_cast<int>(mostWork / perTrial);
    const auto tryFrom = [&](Columns columns) {
        Search search(drawing, std::move(columns), trials);
        search.run();
        if (least && search.cost() >= *least) return;
        least = search.cost();
        best = search.columns();
    };
    if (!standing.empty()) tryFrom(asTheyStood(tables, links, standing, columnCount));
    for (const std::size_t first : tables) {
        if (trials <= 0 && least) break;
        tryFrom(layered(tables, links, first, columnCount));
    }
    return best;
}

/// A table that is joined to nothing, below others.
void addBelow(Drawing& drawing, Columns& columns, std::size_t table) {
    std::optional<Cost> least;
    std::size_t best = 0;
    for (std::size_t column = 0; column < columns.size(); ++column) {
        columns[column].push_back(table);
        const Cost cost = drawing.cost(columns);
        columns[column].pop_back();
        if (least && cost >= *least) continue;
        least = cost;
        best = column;
    }
    columns[best].push_back(table);
}

} // namespace

std::vector<Box> arrangeInColumns(const std::vector<Size>& sizes, const std::vector<Link>& links,
                                  std::int32_t canvasWidth, const Standing& standing) {
    std::vector<Link> proper; // of several joins between two tables one counts
    for (const auto& [a, b] : links) {
        const Link link(std::min(a, b), std::max(a, b));
        if (a != b && std::ranges::find(proper, link) == proper.end()) proper.push_back(link);
    }
    Drawing drawing(sizes, proper, canvasWidth, standing);
    std::vector<std::size_t> joined;
    for (std::size_t table = 0; table < sizes.size(); ++table)
        if (drawing.isJoined(table)) joined.push_back(table);

    const std::size_t fitting = columnsFitting(sizes, canvasWidth);
    std::optional<Cost> least;
    std::vector<Box> best;
    // One more may fit, for not every column has a table of the largest width.
    for (const std::size_t count : {fitting, fitting + 1}) {
        Columns columns = joinedInColumns(drawing, joined, proper, count, standing);
        for (std::size_t table = 0; table < sizes.size(); ++table)
            if (!drawing.isJoined(table)) addBelow(drawing, columns, table);
        const Cost cost = drawing.cost(columns);
        if (least && cost >= *least) continue;
        least = cost;
        best = drawing.boxes();
    }
    return best;
}

} // namespace zandor::model::layout
