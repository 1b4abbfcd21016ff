#include <Zandor/control/LineReaches.h>

#include <algorithm>
#include <cmath>
#include <limits>

namespace TalvikDBxZandor {

namespace {

constexpr float everywhere = std::numeric_limits<float>::infinity();

} // namespace

LineReaches::LineReaches() {
    for (std::int16_t number = 1; number <= most; ++number) remove(number);
}

void LineReaches::set(std::int16_t number, float west, float east, float square) {
    if (bit(number) == 0) return;
    const auto at = static_cast<std::size_t>(number) - 1;
    mWest[at] = west;
    mEast[at] = east;
    mA[at] = mB[at] = mC[at] = 0;
    mSquare[at] = square;
}

void LineReaches::remove(std::int16_t number) { set(number, everywhere, -everywhere, 0); }

void LineReaches::forget(std::int16_t number) { set(number, -everywhere, everywhere, everywhere); }

void LineReaches::place(std::int16_t number, float X1, float Y1, float X2, float Y2,
                        float tolerance) {
    const auto within = [](float coordinate) { return std::fabs(coordinate) <= rim; };
    if (!within(X1) || !within(Y1) || !within(X2) || !within(Y2)) return forget(number);
    if (bit(number) == 0) return;
    const double dx = static_cast<double>(X2) - X1;
    const double dy = static_cast<double>(Y2) - Y1;
    // This and the exact test are made in singles, which within the rim err by a tenth of a twip.
    const double reach = static_cast<double>(tolerance) + 1;
    set(number, std::min(X1, X2), std::max(X1, X2),
        static_cast<float>(reach * reach * (dx * dx + dy * dy)));
    const auto at = static_cast<std::size_t>(number) - 1;
    mA[at] = static_cast<float>(dy);
    mB[at] = static_cast<float>(-dx);
    mC[at] = static_cast<float>(dx * Y1 - dy * X1);
}

std::uint64_t LineReaches::near(float X, float Y) const {
    constexpr std::size_t stretch = 16;
    std::uint64_t lines = 0;
    for (std::size_t from = 0; from < most; from += stretch) {
        // Without a branch, so that several are done at once.
        std::int32_t hits[stretch];
        std::int32_t any = 0;
        for (std::size_t n = 0; n < stretch; ++n) {
            const float across = mA[from + n] * X + mB[from + n] * Y + mC[from + n];
            hits[n] = static_cast<std::int32_t>(X >= mWest[from + n]) &
                      static_cast<std::int32_t>(X <= mEast[from + n]) &
                      static_cast<std::int32_t>(across * across <= mSquare[from + n]);
            any |= hits[n];
        }
        if (any == 0) continue;
        for (std::size_t n = 0; n < stretch; ++n)
            lines |= static_cast<std::uint64_t>(hits[n]) << (from + n);
    }
    return lines;
}

} // namespace TalvikDBxZandor
