#pragma once

#include "platform/String.h"

namespace TalvikDBxZandor {

/// The number of a definition's key: the first character dropped, leading digits as a decimal
/// value, 0 without any. Error 6 when it does not fit 32 bits.
std::int32_t numberOfKey(platform::StringView key);

/// Whether a key is "x" and nothing but digits after it, as `keyOfNumber` writes them.
bool isKeyOfNumber(platform::StringView key);

platform::String keyOfNumber(std::int32_t number);

} // namespace TalvikDBxZandor
