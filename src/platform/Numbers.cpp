#include <Zandor/platform/Numbers.h>

#include <Zandor/platform/RuntimeError.h>

#include <cmath>
#include <limits>

namespace zandor::platform {

namespace {

template <class Whole>
Whole toWhole(double value) {
    // Halves to even by hand: the result must not follow the thread's rounding mode.
    double rounded = std::floor(value);
    const double rest = value - rounded;
    if (rest > 0.5 || (rest == 0.5 && std::fmod(rounded, 2.0) != 0.0)) rounded += 1.0;
    if (!(rounded >= std::numeric_limits<Whole>::min() &&
          rounded <= std::numeric_limits<Whole>::max()))
        throwOverflow();
    return static_cast<Whole>(rounded);
}

} // namespace

void throwOverflow() { throw errors::overflow(); }

std::int16_t toInteger(double value) { return toWhole<std::int16_t>(value); }

std::int32_t toLong(double value) { return toWhole<std::int32_t>(value); }

} // namespace zandor::platform
