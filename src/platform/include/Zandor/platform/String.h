#pragma once

#include <Zandor/platform/export.h>

#include <cstdint>
#include <string>
#include <string_view>

namespace zandor::platform {

/// Text as both kinds of host speak it: UTF-16 code units, compared binary.
using String = std::u16string;
using StringView = std::u16string_view; ///< text that somebody else holds

/// `value` in decimal digits, with a minus sign when negative and no blank.
ZANDOR_CONTROL_EXPORT String decimal(std::int64_t value);

/// UTF-16 from UTF-8; a malformed sequence becomes U+FFFD.
ZANDOR_CONTROL_EXPORT String fromUtf8(std::string_view text);

/// UTF-8 from UTF-16; an unpaired surrogate becomes U+FFFD.
ZANDOR_CONTROL_EXPORT std::string toUtf8(StringView text);

} // namespace zandor::platform
