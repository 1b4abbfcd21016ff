#include <Zandor/model/Layout.h>

#include <gtest/gtest.h>

#include <set>
#include <string>

using namespace zandor;

using namespace model::layout;

// Places to the twip. Whoever changes how drawings are arranged looks at the new ones, and writes
// them here.

namespace {

/// Tables, joins and a canvas, other ones for each number.
struct Given {
    explicit Given(std::uint32_t number) : mState(number * 2654435761U + 1) {
        const std::uint32_t tables = 2 + next(8);
        for (std::uint32_t n = 0; n < tables; ++n) {
            const std::int32_t width = 1800 + 100 * signedNext(16);
            sizes.push_back({width, 1020 + 270 * signedNext(9)});
        }
        for (std::uint32_t n = 1; n < tables; ++n) {
            if (next(6) == 0) continue;
            const std::uint32_t left = next(2) != 0 ? next(n) : n;
            links.emplace_back(left, next(2) != 0 ? n : next(n));
        }
        for (std::uint32_t n = next(4); n > 0; --n) {
            const std::uint32_t left = next(tables);
            links.emplace_back(left, next(tables));
        }
        canvas = 4000 + 1000 * signedNext(13);
    }
    std::uint32_t next(std::size_t below) {
        mState = mState * 1664525U + 1013904223U;
        return (mState >> 16) % static_cast<std::uint32_t>(below);
    }
    std::int32_t signedNext(std::size_t below) { return static_cast<std::int32_t>(next(below)); }
    std::vector<Box> arranged() const { return arrange(sizes, links, {}, canvas); }

    std::vector<Size> sizes;
    std::vector<Link> links;
    std::int32_t canvas = 0;

private:
    std::uint32_t mState;
};

std::string said(const std::vector<Box>& boxes) {
    std::string text;
    for (const Box& box : boxes)
        text +=
            (text.empty() ? "" : " ") + std::to_string(box.left) + "," + std::to_string(box.top);
    return text;
}

/// Once more, with a table that was not there.
std::string grown(std::uint32_t number) {
    Given given(number);
    const auto boxes = given.arranged();
    std::vector<std::optional<Place>> standing;
    for (const Box& box : boxes)
        standing.push_back(given.next(5) != 0 ? std::optional(Place{box.left, box.top})
                                              : std::nullopt);
    given.sizes.push_back({2300, 1830});
    given.links.emplace_back(given.next(boxes.size()), boxes.size());
    standing.resize(1 + given.next(standing.size()));
    return said(arrangeAgain(given.sizes, given.links, standing, given.canvas));
}

/// From three columns in which the last table stands highest.
std::string tidied(std::uint32_t number) {
    Given given(number);
    std::vector<std::optional<Place>> standing(given.sizes.size());
    std::int32_t tops[] = {300, 300, 300};
    for (std::size_t n = given.sizes.size(); n-- > 0;) {
        const std::uint32_t column = given.next(3);
        standing[n] = Place{300 + 3200 * static_cast<std::int32_t>(column), tops[column]};
        tops[column] += given.sizes[n].height + 450;
    }
    return said(arrangeAgain(given.sizes, given.links, standing, given.canvas));
}

/// The first ones beside the last, which stay.
std::string beside(std::uint32_t number) {
    Given given(number);
    const auto boxes = given.arranged();
    const std::size_t there = 1 + given.next(boxes.size() - 1);
    given.sizes.resize(boxes.size() - there);
    const std::vector<Box> taken(boxes.end() - static_cast<std::ptrdiff_t>(there), boxes.end());
    return said(arrange(given.sizes, given.links, taken, given.canvas));
}

} // namespace

TEST(ThePlacesOfTables, AreThese) {
    EXPECT_EQ(grown(238), "4400,2580 300,300 4400,5940 300,3930 300,6750 4400,300");
    EXPECT_EQ(tidied(396),
              "4400,2040 300,300 4400,3780 4400,300 300,4320 4400,7140 300,1770 300,7680");
    EXPECT_EQ(beside(97), "300,4860 4400,300");
    EXPECT_EQ(beside(173),
              "4800,300 4800,10380 300,10380 9300,10380 300,300 5100,5130 8300,300 2000,5130");
    EXPECT_EQ(beside(181), "300,3660 300,20460 300,23820");
    EXPECT_EQ(beside(225), "7700,300 4100,300 4400,3930");
    EXPECT_EQ(beside(372), "300,300");
}

TEST(ThePlacesOfTables, GoDownByOneRowAtATime) {
    // A canvas of one column; below the first of these a single cell is free, then the second.
    const std::vector<Box> taken = {{300, 300, 2000, 6000}, {300, 20000, 2000, 2000}};
    EXPECT_EQ(said(arrange({{2000, 2000}}, {{0, 2}}, taken, 3000)), "300,7650");
}

TEST(ThePlacesOfTables, AreApartHoweverManyJoinsThereAre) {
    // More than are looked at for the best places.
    std::vector<Link> links;
    for (std::size_t a = 0; a < 76; ++a)
        for (std::size_t b = 0; b < a; ++b) links.emplace_back(a, b);
    const auto boxes = arrange(std::vector<Size>(76, {2000, 2000}), links, {}, 16000);
    std::set<std::pair<std::int32_t, std::int32_t>> places;
    for (const Box& box : boxes) places.emplace(box.left, box.top);
    EXPECT_EQ(places.size(), boxes.size());
}

TEST(TheSizeOfATable, IsThis) {
    const auto size = [](std::size_t entries, std::size_t longest) {
        const Size fitted = fittedSize(entries, longest);
        return std::to_string(fitted.width) + "," + std::to_string(fitted.height);
    };
    EXPECT_EQ(size(1, 9), "1800,1020");
    EXPECT_EQ(size(2, 10), "1800,1020");
    EXPECT_EQ(size(3, 11), "1905,1290");
    EXPECT_EQ(size(10, 24), "3270,3180");
    EXPECT_EQ(size(10, 25), "3300,3180");
    EXPECT_EQ(size(11, 9), "1905,3180");
    EXPECT_EQ(size(12, 30), "3300,3180");
}
