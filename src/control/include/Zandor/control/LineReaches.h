#pragma once

#include <Zandor/platform/export.h>

#include <cstddef>
#include <cstdint>

namespace TalvikDBxZandor {

/// Which lines a point of the canvas can be near to, in plain numbers beside each other, so that
/// the exact test, which asks the toolkit for a line's ends, is made for hardly one of many. Lines
/// have numbers from 1 to `most` and stand in the order of their adding; at first there is none,
/// and of another number nothing is kept. Coordinates are twips.
class ZANDOR_CONTROL_EXPORT LineReaches {
public:
    static constexpr std::int16_t most = 64; ///< what the answer has bits for
    /// Beyond it singles are too coarse to tell beforehand what the exact test finds.
    static constexpr float rim = 100000;

    LineReaches();
    /// A line comes behind the others; nobody knows where it is.
    void add(std::int16_t number);
    /// A line is there no longer; those behind it move up.
    void remove(std::int16_t number);
    /// A line is where nobody knows: it can be near to any point.
    void forget(std::int16_t number);
    /// A line has these ends, and the exact test finds it within `tolerance` of it.
    void place(std::int16_t number, float X1, float Y1, float X2, float Y2, float tolerance);

    /// The lines that a point can be near to: bit n for the line that n others stand before.
    std::uint64_t near(float X, float Y) const;

private:
    static constexpr std::size_t nowhere = most;
    std::size_t placeOf(std::int16_t number) const {
        return number >= 1 && number <= most ? mPlaces[number - 1] : nowhere;
    }
    void set(std::size_t place, float west, float east, float square);

    std::size_t mCount = 0;
    std::uint8_t mPlaces[most]; ///< of the lines in their order, by their numbers
    // A point's distance from the line as it is without an end is |A X + B Y + C| / length; squared
    // and times the length, so that nothing of it is a root.
    float mWest[most], mEast[most], mA[most], mB[most], mC[most], mSquare[most];
};

} // namespace TalvikDBxZandor
