#pragma once

#include <Zandor/platform/String.h>
#include <Zandor/platform/export.h>

namespace TalvikDBxZandor {

namespace platform = zandor::platform;

/// The number of a definition's key: the first character dropped, leading digits as a decimal
/// value, 0 without any. Error 6 when it does not fit 32 bits.
ZANDOR_CONTROL_EXPORT std::int32_t numberOfKey(platform::StringView key);

/// Whether a key is one that `keyOfNumber` writes, so that its number leads back to it: "x007" and
/// a number beyond 32 bits are none.
ZANDOR_CONTROL_EXPORT bool isKeyOfNumber(platform::StringView key);

/// "x" and the number in decimal digits.
ZANDOR_CONTROL_EXPORT platform::String keyOfNumber(std::int32_t number);

} // namespace TalvikDBxZandor
