#include "control/JoinScene.h"

#include <cmath>
#include <random>

using namespace zandor;

namespace {

/// Lines all over the canvas, and the search among them line by line.
struct TheSearchAmongManyLines : JoinScene {
    std::mt19937 dice{20};

    TheSearchAmongManyLines() {
        for (int n = 0; n < 64; ++n) join();
        bind();
    }

    float upTo(float end) { return std::uniform_real_distribution<float>(0, end)(dice); }
    int oneOf(int count) { return std::uniform_int_distribution<int>(0, count - 1)(dice); }

    /// Of the joins in the order of their making.
    std::vector<std::int16_t> numbers() {
        std::vector<std::int16_t> all;
        for (std::int32_t n = 1; n <= joinCount(); ++n)
            all.push_back(Back::mJoinLines(control).Item(n)->Index());
        return all;
    }

    /// Long and short, flat, steep, upright and level ones, some beyond every canvas.
    void putLines() {
        for (const std::int16_t n : numbers()) {
            const float x = upTo(16000), y = upTo(16000);
            switch (oneOf(6)) {
            case 0: put(n, x, y, x + upTo(3), upTo(16000)); break;
            case 1: put(n, x, y, x, upTo(16000)); break;
            case 2: put(n, x, y, upTo(16000), y); break;
            case 3: put(n, -x * 1e5F, y, x * 1e5F, -y); break;
            default: put(n, x, y, upTo(16000), upTo(16000));
            }
        }
    }

    Record found(float x, float y) {
        Record nearest;
        float best = 1e38F;
        for (const std::int16_t n : numbers()) {
            float x1 = line(n).X1(), y1 = line(n).Y1(), x2 = line(n).X2(), y2 = line(n).Y2();
            if (x1 >= x2) {
                std::swap(x1, x2);
                std::swap(y1, y2);
            }
            if (x < x1 || x > x2) continue;
            const float distance = std::fabs(Back::DeltaJoinLine(control, x, y, x1, y1, x2, y2));
            if (distance >= 50 || distance >= best) continue;
            best = distance;
            nearest = record(platform::decimal(n));
        }
        return nearest;
    }

    /// Every other point is about as far from a line as it is hit.
    void expectToFindThemAll(int rounds) {
        int hits = 0, points = 0;
        const auto all = numbers();
        for (int n = 0; n < rounds * 100; ++n) {
            if (n % 100 == 0) putLines();
            float x = upTo(16000), y = upTo(16000);
            if (n % 2 == 0) {
                const auto& near =
                    line(all[static_cast<std::size_t>(oneOf(static_cast<int>(all.size())))]);
                const float share = upTo(1);
                x = near.X1() + share * (near.X2() - near.X1());
                y = near.Y1() + share * (near.Y2() - near.Y1()) + upTo(104) - 52;
            }
            Record hit;
            Back::JoinHitTest(control, hit, x, y);
            ASSERT_EQ(hit, found(x, y)) << x << ", " << y << " in round " << n / 100;
            hits += hit != nullptr;
            ++points;
        }
        EXPECT_GT(hits, points / 4);
        EXPECT_LT(hits, points);
        EXPECT_EQ(stage->boxes, Boxes());
    }
};

TEST_F(TheSearchAmongManyLines, FindsWhatLineByLineIsFound) { expectToFindThemAll(40); }

TEST_F(TheSearchAmongManyLines, FindsThoseThatAreLeftAndThoseThatHaveCome) {
    for (const auto* gone : {u"1", u"17", u"64", u"30", u"31"})
        Back::RemoveJoin(control, record(gone));
    expectToFindThemAll(10);
    // They have the lowest numbers that are free, and stand behind the others.
    draw(entry(1, 1), entry(2, 1));
    draw(entry(1, 3), entry(2, 2));
    ASSERT_EQ(numbers().back(), 17);
    expectToFindThemAll(10);
}

TEST_F(TheSearchAmongManyLines, TakesTheOneMadeFirstOfTwoThatAreAsFarAway) {
    Back::RemoveJoin(control, record(u"1"));
    const Record reusing = draw(entry(1, 1), entry(2, 1));
    ASSERT_EQ(reusing->Index(), 1);
    for (const std::int16_t n : numbers()) put(n, 100, 100, 100, 200);
    put(1, 1000, 5000, 2000, 5000);
    put(40, 1000, 5000, 2000, 5000);
    Record hit;
    Back::JoinHitTest(control, hit, 1500, 5010);
    EXPECT_EQ(hit, record(u"40"));
}

TEST_F(TheSearchAmongManyLines, ReportsAPointThatIsBeyondAllNumbersAsItsDistanceIs) {
    Record hit;
    Back::JoinHitTest(control, hit, std::nanf(""), 1000);
    EXPECT_EQ(hit, record()) << "a distance that failed is zero";
    EXPECT_EQ(stage->boxes.size(), 64U);
    EXPECT_EQ(stage->boxes[0], controlErrorBox(u"DeltaJoinLine", 6, u"Overflow"));
}

} // namespace
