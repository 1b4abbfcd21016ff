#include <Zandor/model/Names.h>

#include <algorithm>

namespace zandor::model {

namespace {

char16_t folded(char16_t c) {
    return c >= u'A' && c <= u'Z' ? static_cast<char16_t>(c - u'A' + u'a') : c;
}

} // namespace

bool sameName(platform::StringView left, platform::StringView right) {
    return std::equal(left.begin(), left.end(), right.begin(), right.end(),
                      [](char16_t a, char16_t b) { return folded(a) == folded(b); });
}

platform::String oneLine(platform::String text) {
    for (char16_t& c : text)
        if (c < u' ' || c == 0x85 || c == 0x2028 || c == 0x2029) c = u' ';
    return text;
}

platform::String foldedName(platform::StringView name) {
    platform::String result(name);
    std::transform(result.begin(), result.end(), result.begin(), folded);
    return result;
}

} // namespace zandor::model
