#include <Zandor/control/KeyNumber.h>

#include <Zandor/platform/Numbers.h>

#include <algorithm>
#include <limits>

namespace TalvikDBxZandor {

namespace {

bool isDigit(char16_t c) { return c >= u'0' && c <= u'9'; }

/// The digits after the first character; exact as far as 32 bits go, beyond any limit in the end.
double digitsOf(platform::StringView key) {
    double number = 0;
    for (const char16_t c : key.substr(std::min<std::size_t>(1, key.size()))) {
        if (!isDigit(c)) break;
        number = number * 10 + (c - u'0');
    }
    return number;
}

} // namespace

std::int32_t numberOfKey(platform::StringView key) { return platform::toLong(digitsOf(key)); }

bool isKeyOfNumber(platform::StringView key) {
    const double number = digitsOf(key);
    return number <= std::numeric_limits<std::int32_t>::max() &&
           key == keyOfNumber(static_cast<std::int32_t>(number));
}

platform::String keyOfNumber(std::int32_t number) { return u"x" + platform::decimal(number); }

} // namespace TalvikDBxZandor
