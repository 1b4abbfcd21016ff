#pragma once

#include <Zandor/platform/export.h>

#include <cstdint>

namespace zandor::platform {

/// `value` as a 16-bit integer, to nearest with halves to even.
/// Error 6 when the result lies outside -32768 to 32767 (a NaN included).
ZANDOR_CONTROL_EXPORT std::int16_t toInteger(double value);

/// `value` as a 32-bit integer under the same rules; error 6 outside its range.
ZANDOR_CONTROL_EXPORT std::int32_t toLong(double value);

/// `value` rounded once to single precision. Error 6 when it does not fit a finite single.
ZANDOR_CONTROL_EXPORT float single(double value);

} // namespace zandor::platform
