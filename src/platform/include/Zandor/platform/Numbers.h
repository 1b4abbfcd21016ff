#pragma once

#include <Zandor/platform/export.h>

#include <cmath>
#include <cstdint>

namespace zandor::platform {

/// `value` as a 16-bit integer, to nearest with halves to even.
/// Error 6 when the result lies outside -32768 to 32767 (a NaN included).
ZANDOR_CONTROL_EXPORT std::int16_t toInteger(double value);

/// `value` as a 32-bit integer under the same rules; error 6 outside its range.
ZANDOR_CONTROL_EXPORT std::int32_t toLong(double value);

[[noreturn]] ZANDOR_CONTROL_EXPORT void throwOverflow(); ///< error 6

/// `value` rounded once to single precision. Error 6 when it does not fit a finite single.
inline float single(double value) {
    const auto rounded = static_cast<float>(value);
    if (!std::isfinite(rounded)) [[unlikely]]
        throwOverflow();
    return rounded;
}

} // namespace zandor::platform
