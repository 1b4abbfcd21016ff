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

    /// Long and short, flat, steep, upright and level ones, some beyond every canvas.
    void putLines() {
        for (std::int16_t n = 1; n <= 64; ++n) {
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
        for (std::int16_t n = 1; n <= 64; ++n) {
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
};

TEST_F(TheSearchAmongManyLines, FindsWhatLineByLineIsFound) {
    int hits = 0, points = 0;
    for (int round = 0; round < 40; ++round) {
        putLines();
        for (int n = 0; n < 100; ++n) {
            float x = upTo(16000), y = upTo(16000);
            if (n % 2 == 0) {
                // About as far from a line as it is hit.
                const auto& near = line(static_cast<std::int16_t>(1 + oneOf(64)));
                const float share = upTo(1);
                x = near.X1() + share * (near.X2() - near.X1());
                y = near.Y1() + share * (near.Y2() - near.Y1()) + upTo(104) - 52;
            }
            Record hit;
            Back::JoinHitTest(control, hit, x, y);
            ASSERT_EQ(hit, found(x, y)) << x << ", " << y << " in round " << round;
            hits += hit != nullptr;
            ++points;
        }
    }
    EXPECT_GT(hits, points / 4);
    EXPECT_LT(hits, points);
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(TheSearchAmongManyLines, ReportsAPointThatIsBeyondAllNumbersAsItsDistanceIs) {
    Record hit;
    Back::JoinHitTest(control, hit, std::nanf(""), 1000);
    EXPECT_EQ(hit, record()) << "a distance that failed is zero";
    EXPECT_EQ(stage->boxes.size(), 64U);
    EXPECT_EQ(stage->boxes[0], controlErrorBox(u"DeltaJoinLine", 6, u"Overflow"));
}

} // namespace
