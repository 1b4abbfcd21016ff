#include <Zandor/control/LineReaches.h>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <limits>

namespace TalvikDBxZandor {

namespace {

constexpr float everywhere = std::numeric_limits<float>::infinity();

bool withinRim(float coordinate) { return std::fabs(coordinate) <= LineReaches::rim; }

} // namespace

LineReaches::LineReaches() {
    std::fill(std::begin(mPlaces), std::end(mPlaces), static_cast<std::uint8_t>(nowhere));
    for (std::size_t place = 0; place < most; ++place) set(place, everywhere, -everywhere, 0);
}

void LineReaches::set(std::size_t place, float west, float east, float square) {
    if (place == nowhere) return;
    mWest[place] = west;
    mEast[place] = east;
    mA[place] = mB[place] = mC[place] = 0;
    mSquare[place] = square;
}

void LineReaches::add(std::int16_t number) {
    if (number < 1 || number > most || placeOf(number) != nowhere) return;
    mPlaces[number - 1] = static_cast<std::uint8_t>(mCount++);
    forget(number);
}

void LineReaches::remove(std::int16_t number) {
    const std::size_t gone = placeOf(number);
    if (gone == nowhere) return;
    for (float* const each : {mWest, mEast, mA, mB, mC, mSquare})
        std::copy(each + gone + 1, each + mCount, each + gone);
    for (std::uint8_t& place : mPlaces)
        if (place > gone && place != nowhere) --place;
    mPlaces[number - 1] = nowhere;
    set(--mCount, everywhere, -everywhere, 0);
}

void LineReaches::forget(std::int16_t number) {
    set(placeOf(number), -everywhere, everywhere, everywhere);
}

void LineReaches::place(std::int16_t number, float X1, float Y1, float X2, float Y2,
                        float tolerance) {
    const std::size_t at = placeOf(number);
    if (at == nowhere) return;
    if (!withinRim(X1) || !withinRim(Y1) || !withinRim(X2) || !withinRim(Y2)) return forget(number);
    const double dx = static_cast<double>(X2) - X1;
    const double dy = static_cast<double>(Y2) - Y1;
    // This and the exact test are made in singles, which within the rim err by a tenth of a twip.
    const double reach = static_cast<double>(tolerance) + 1;
    set(at, std::min(X1, X2), std::max(X1, X2),
        static_cast<float>(reach * reach * (dx * dx + dy * dy)));
    mA[at] = static_cast<float>(dy);
    mB[at] = static_cast<float>(-dx);
    mC[at] = static_cast<float>(dx * Y1 - dy * X1);
}

std::uint64_t LineReaches::near(float X, float Y) const {
    if (!withinRim(X) || !withinRim(Y))
        return mCount == 0 ? 0 : ~std::uint64_t{0} >> (most - mCount);
    constexpr std::size_t stretch = 16;
    std::uint64_t lines = 0;
    for (std::size_t from = 0; from < mCount; from += stretch) {
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
