#include "control/KeyNumber.h"

#include "platform/Numbers.h"

#include <algorithm>

namespace TalvikDBxZandor {

namespace {

bool isDigit(char16_t c) { return c >= u'0' && c <= u'9'; }

} // namespace

std::int32_t numberOfKey(platform::StringView key) {
    double number = 0;
    for (const char16_t c : key.substr(std::min<std::size_t>(1, key.size()))) {
        if (!isDigit(c)) break;
        number = number * 10 + (c - u'0');
    }
    return platform::toLong(number);
}

bool isKeyOfNumber(platform::StringView key) {
    return key.size() > 1 && key.front() == u'x' &&
           std::all_of(key.begin() + 1, key.end(), isDigit);
}

platform::String keyOfNumber(std::int32_t number) { return u"x" + platform::decimal(number); }

} // namespace TalvikDBxZandor
