#include <Zandor/model/Layout.h>

#include <gtest/gtest.h>

#include <cstdlib>

using namespace zandor;

using namespace model::layout;

namespace {

/// Whether no two boxes come closer than the distances kept free for joins.
bool apart(const std::vector<Box>& boxes) {
    for (std::size_t i = 0; i < boxes.size(); ++i) {
        for (std::size_t j = 0; j < i; ++j) {
            const Box& a = boxes[i];
            const Box& b = boxes[j];
            const bool beside =
                a.left >= b.left + b.width + 900 || b.left >= a.left + a.width + 900;
            const bool below = a.top >= b.top + b.height + 300 || b.top >= a.top + a.height + 300;
            if (!beside && !below) return false;
        }
    }
    return true;
}

int stepsBetween(const Box& a, const Box& b, Size cell) {
    return std::abs(a.left - b.left) / (cell.width + betweenColumns) +
           std::abs(a.top - b.top) / (cell.height + betweenRows);
}

const Size cell{2000, 2000};

} // namespace

TEST(ATableSize, ShowsAllEntriesUpToTen) {
    EXPECT_LT(fittedSize(3, 10).height, fittedSize(4, 10).height);
    EXPECT_LT(fittedSize(9, 10).height, fittedSize(10, 10).height);
    EXPECT_EQ(fittedSize(10, 10).height, fittedSize(200, 10).height);
}

TEST(ATableSize, GrowsWithItsLongestTextWithinBounds) {
    EXPECT_LT(fittedSize(3, 12).width, fittedSize(3, 20).width);
    EXPECT_EQ(fittedSize(3, 0).width, fittedSize(3, 1).width);
    EXPECT_EQ(fittedSize(3, 60).width, fittedSize(3, 1000000).width);
}

TEST(ATableSize, HasRoomForTheScrollBarBesideTheTexts) {
    EXPECT_EQ(fittedSize(10, 15).width, fittedSize(3, 15).width);
    EXPECT_GT(fittedSize(11, 15).width, fittedSize(10, 15).width);
}

TEST(TheLayout, BeginsAtTheMargin) {
    const auto boxes = arrange({cell}, {}, {}, 16000);
    ASSERT_EQ(boxes.size(), 1U);
    EXPECT_EQ(boxes[0].left, 300);
    EXPECT_EQ(boxes[0].top, 300);
    EXPECT_EQ(boxes[0].width, 2000);
    EXPECT_EQ(boxes[0].height, 2000);
}

TEST(TheLayout, OfNoTablesIsEmpty) { EXPECT_TRUE(arrange({}, {}, {}, 16000).empty()); }

TEST(TheLayout, KeepsTablesOfAllSizesApartAndWithinTheCanvas) {
    std::vector<Size> sizes;
    for (std::int32_t n = 0; n < 16; ++n) sizes.push_back({1800 + n * 90, 700 + n % 5 * 600});
    const auto boxes = arrange(sizes, {{0, 5}, {5, 9}, {1, 2}}, {}, 16000);
    EXPECT_TRUE(apart(boxes));
    for (std::size_t n = 0; n < boxes.size(); ++n) {
        EXPECT_GE(boxes[n].left, 300);
        EXPECT_GE(boxes[n].top, 300);
        EXPECT_LE(boxes[n].left + boxes[n].width, 16000 - 300);
        EXPECT_EQ(boxes[n].width, sizes[n].width);
        EXPECT_EQ(boxes[n].height, sizes[n].height);
    }
}

TEST(TheLayout, PutsTablesBelowEachOtherOnANarrowCanvas) {
    const auto boxes = arrange({cell, cell, cell}, {}, {}, 1000);
    EXPECT_TRUE(apart(boxes));
    for (const Box& box : boxes) EXPECT_EQ(box.left, 300);
}

TEST(TheLayout, PutsJoinedTablesNextToEachOther) {
    // A chain that runs criss-cross through the order of the tables.
    const std::vector<std::size_t> chain = {3, 11, 0, 7, 5, 9, 2, 10, 1, 8, 4, 6};
    std::vector<Link> links;
    for (std::size_t n = 1; n < chain.size(); ++n) links.emplace_back(chain[n - 1], chain[n]);
    const auto boxes = arrange(std::vector<Size>(12, cell), links, {}, 4 * 3200);
    int steps = 0;
    for (const auto& [a, b] : links) steps += stepsBetween(boxes[a], boxes[b], cell);
    EXPECT_LE(steps, 18); // 11 at best; in the order of the tables it is 26
}

TEST(TheLayout, PutsTheTablesOfAHubAroundIt) {
    std::vector<Link> links;
    for (std::size_t n = 0; n < 5; ++n) links.emplace_back(n, 5);
    const auto boxes = arrange(std::vector<Size>(6, cell), links, {}, 3 * 3200);
    for (std::size_t n = 0; n < 5; ++n) EXPECT_LE(stepsBetween(boxes[n], boxes[5], cell), 2);
}

TEST(TheLayout, LeavesThePlacesThatAreTaken) {
    const std::vector<Box> taken = {{500, 400, 2500, 1800}, {7000, 3000, 2000, 4000}};
    auto boxes = arrange(std::vector<Size>(5, cell), {}, taken, 13000);
    boxes.insert(boxes.end(), taken.begin(), taken.end());
    EXPECT_TRUE(apart(boxes));
}

TEST(TheLayout, PutsANewTableBesideATakenOneItIsJoinedTo) {
    const std::vector<Box> taken = {{300, 300, 2000, 2000}, {9900, 300, 2000, 2000}};
    const auto boxes = arrange({cell}, {{0, 2}}, taken, 13000);
    EXPECT_EQ(boxes[0].left, 300 + 2 * 3200);
    EXPECT_EQ(boxes[0].top, 300);
}

TEST(TheLayout, PutsANewTableToTheRightWhileThereIsRoom) {
    const Box taken{300, 500, 2000, 2000};
    auto boxes = arrange({cell}, {{0, 1}}, {taken}, 13000);
    EXPECT_EQ(boxes[0].left, 300 + 3200);
    EXPECT_EQ(boxes[0].top, 500);
    // On a narrow canvas there is none.
    boxes = arrange({cell}, {{0, 1}}, {taken}, 5000);
    EXPECT_EQ(boxes[0].left, 300);
    EXPECT_GE(boxes[0].top, 2500);
}

TEST(TheLayout, ThatGrowsByAChainGoesToTheRightAndLeavesTheEarlierTables) {
    std::vector<Size> sizes;
    std::vector<Link> links;
    std::vector<std::optional<Place>> standing;
    for (std::size_t n = 0; n < 5; ++n) {
        sizes.push_back(cell);
        if (n > 0) links.emplace_back(n - 1, n);
        const auto boxes = arrangeAgain(sizes, links, standing, 5 * 3200);
        for (std::size_t table = 0; table < standing.size(); ++table) {
            EXPECT_EQ(boxes[table].left, standing[table]->left) << n << " " << table;
            EXPECT_EQ(boxes[table].top, 300);
        }
        EXPECT_EQ(boxes[n].left, 300 + static_cast<std::int32_t>(n) * 3200);
        standing.clear();
        for (const Box& box : boxes) standing.push_back(Place{box.left, box.top});
    }
}

TEST(TheLayout, ThatGrowsByASecondRowLeavesTheFirstAtTheTop) {
    // A chain as wide as the canvas, and one table more at its end.
    std::vector<std::optional<Place>> standing;
    std::vector<Link> links;
    for (std::int32_t n = 0; n < 4; ++n) standing.push_back(Place{300 + n * 3200, 300});
    for (std::size_t n = 1; n < 5; ++n) links.emplace_back(n - 1, n);
    const auto boxes = arrangeAgain(std::vector<Size>(5, cell), links, standing, 4 * 3200);
    for (std::size_t n = 0; n < 4; ++n) {
        EXPECT_EQ(boxes[n].left, standing[n]->left) << n;
        EXPECT_EQ(boxes[n].top, 300) << n;
    }
    EXPECT_GT(boxes[4].top, 2300);
}

TEST(TheLayout, ThatGrowsPutsTablesWithoutJoinsToTheRightToo) {
    std::vector<std::optional<Place>> standing{Place{300, 300}, Place{3500, 300}};
    const auto boxes = arrangeAgain(std::vector<Size>(3, cell), {}, standing, 4 * 3200);
    EXPECT_EQ(boxes[0].left, 300);
    EXPECT_EQ(boxes[1].left, 3500);
    EXPECT_EQ(boxes[2].left, 6700);
    EXPECT_EQ(boxes[2].top, 300);
}

TEST(TheLayout, ThatGrowsMovesATableThatStandsInAnothersWay) {
    // Two that are joined by a third which comes between them.
    std::vector<std::optional<Place>> standing{Place{300, 300}, Place{3500, 300}};
    const auto boxes =
        arrangeAgain(std::vector<Size>(3, cell), {{0, 2}, {1, 2}}, standing, 4 * 3200);
    EXPECT_TRUE(apart(boxes));
    EXPECT_EQ(std::abs(boxes[0].left - boxes[2].left), 3200);
    EXPECT_EQ(std::abs(boxes[1].left - boxes[2].left), 3200);
}

TEST(TheLayout, OfOneRowBeginsAtTheTopWhateverTheHeights) {
    const auto boxes =
        arrange({{2000, 700}, {2000, 2900}, {2000, 1500}}, {{0, 1}, {1, 2}}, {}, 4 * 3200);
    for (const Box& box : boxes) EXPECT_EQ(box.top, 300);
}

TEST(TheLayout, IgnoresAJoinOfATableWithItself) {
    EXPECT_TRUE(apart(arrange({cell, cell}, {{0, 0}}, {}, 13000)));
}

TEST(TheLayout, PutsJoinedTablesIntoDifferentColumns) {
    // Three tables that are all joined to one another, and one more at each.
    const std::vector<Link> links = {{0, 1}, {1, 2}, {0, 2}, {0, 3}, {1, 4}, {2, 5}};
    const auto boxes = arrange(std::vector<Size>(6, cell), links, {}, 4 * 3200);
    for (const auto& [a, b] : links) EXPECT_NE(boxes[a].left, boxes[b].left) << a << " " << b;
}

TEST(TheLayout, PutsAChainIntoNeighbouringColumnsAsFarAsTheyGo) {
    const auto boxes = arrange(std::vector<Size>(4, cell), {{2, 0}, {0, 3}, {3, 1}}, {}, 4 * 3200);
    for (const Box& box : boxes) EXPECT_EQ(box.top, 300);
    EXPECT_EQ(std::abs(boxes[2].left - boxes[0].left), 3200);
    EXPECT_EQ(std::abs(boxes[0].left - boxes[3].left), 3200);
    EXPECT_EQ(std::abs(boxes[3].left - boxes[1].left), 3200);
}

TEST(TheLayout, LeadsNoLineBelowATableWhereItCanGoBesideIt) {
    // Two hubs with four tables each, joined to each other.
    std::vector<Link> links = {{0, 1}};
    for (std::size_t n = 2; n < 6; ++n) links.emplace_back(0, n);
    for (std::size_t n = 6; n < 10; ++n) links.emplace_back(1, n);
    const auto boxes = arrange(std::vector<Size>(10, cell), links, {}, 4 * 3200);
    for (const auto& [a, b] : links) EXPECT_EQ(std::abs(boxes[a].left - boxes[b].left), 3200);
}

TEST(TheLayout, PutsTablesWithoutJoinsBelow) {
    const auto boxes = arrange(std::vector<Size>(5, cell), {{0, 4}, {4, 2}}, {}, 3 * 3200);
    for (const std::size_t joined : {0, 2, 4}) EXPECT_EQ(boxes[joined].top, 300);
    for (const std::size_t alone : {1, 3}) EXPECT_GT(boxes[alone].top, 2300);
}

TEST(TheLayout, UsesOneColumnMoreWhereNarrowTablesLeaveRoomForIt) {
    std::vector<Size> sizes(5, Size{1800, 1500});
    sizes[2].width = 3300; // would allow three of its kind
    const auto boxes = arrange(sizes, {{0, 1}, {1, 2}, {2, 3}}, {}, 15000);
    EXPECT_EQ(boxes[0].top, boxes[3].top);
    for (const Box& box : boxes) EXPECT_LE(box.left + box.width, 15000 - 300);
    EXPECT_TRUE(apart(boxes));
}

TEST(TheLayout, OfTheSameTablesIsAlwaysTheSame) {
    std::vector<Link> links;
    for (std::size_t n = 1; n < 16; ++n) links.emplace_back(n, n * 7 % n);
    const auto once = arrange(std::vector<Size>(16, cell), links, {}, 16000);
    const auto again = arrange(std::vector<Size>(16, cell), links, {}, 16000);
    for (std::size_t n = 0; n < 16; ++n) {
        EXPECT_EQ(once[n].left, again[n].left);
        EXPECT_EQ(once[n].top, again[n].top);
    }
}

TEST(TheLayout, OfVeryManyTablesComesToAnEnd) {
    std::vector<Link> links;
    for (std::size_t n = 1; n < 400; ++n) links.emplace_back(n, n / 3);
    EXPECT_TRUE(apart(arrange(std::vector<Size>(400, cell), links, {}, 16000)));
}
