#include <Zandor/platform/String.h>

namespace zandor::platform {

namespace {

constexpr char32_t replacement = 0xFFFD;

void appendUtf16(String& out, char32_t point) {
    if (point < 0x10000) {
        out.push_back(static_cast<char16_t>(point));
        return;
    }
    point -= 0x10000;
    out.push_back(static_cast<char16_t>(0xD800 + (point >> 10)));
    out.push_back(static_cast<char16_t>(0xDC00 + (point & 0x3FF)));
}

void appendUtf8(std::string& out, char32_t point) {
    const auto tail = [&out](char32_t bits) {
        out.push_back(static_cast<char>(0x80 | (bits & 0x3F)));
    };
    if (point < 0x80) {
        out.push_back(static_cast<char>(point));
    } else if (point < 0x800) {
        out.push_back(static_cast<char>(0xC0 | (point >> 6)));
        tail(point);
    } else if (point < 0x10000) {
        out.push_back(static_cast<char>(0xE0 | (point >> 12)));
        tail(point >> 6);
        tail(point);
    } else {
        out.push_back(static_cast<char>(0xF0 | (point >> 18)));
        tail(point >> 12);
        tail(point >> 6);
        tail(point);
    }
}

/// Decodes one code point and moves `at` behind it; a bad byte costs one replacement character.
char32_t nextPoint(std::string_view text, std::size_t& at) {
    const auto lead = static_cast<unsigned char>(text[at++]);
    if (lead < 0x80) return lead;
    const int tails = lead >= 0xF0 && lead < 0xF5 ? 3 : lead >= 0xE0 ? 2 : lead >= 0xC2 ? 1 : 0;
    if (tails == 0 || lead >= 0xF5 || at + static_cast<std::size_t>(tails) > text.size())
        return replacement;
    char32_t point = lead & (0x3F >> tails);
    for (int i = 0; i < tails; ++i) {
        const auto tail = static_cast<unsigned char>(text[at + static_cast<std::size_t>(i)]);
        if ((tail & 0xC0) != 0x80) return replacement;
        point = (point << 6) | (tail & 0x3F);
    }
    constexpr char32_t smallest[] = {0, 0x80, 0x800, 0x10000};
    if (point < smallest[tails] || point > 0x10FFFF || (point >= 0xD800 && point < 0xE000))
        return replacement;
    at += static_cast<std::size_t>(tails);
    return point;
}

} // namespace

String decimal(std::int64_t value) {
    const std::string digits = std::to_string(value);
    return String(digits.begin(), digits.end());
}

String fromUtf8(std::string_view text) {
    String out;
    out.reserve(text.size());
    for (std::size_t at = 0; at < text.size();) appendUtf16(out, nextPoint(text, at));
    return out;
}

std::string toUtf8(StringView text) {
    std::string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        char32_t point = text[i];
        if (point >= 0xD800 && point < 0xE000) {
            const bool paired = point < 0xDC00 && i + 1 < text.size() && text[i + 1] >= 0xDC00 &&
                                text[i + 1] < 0xE000;
            point =
                paired ? 0x10000 + ((point - 0xD800) << 10) + (text[++i] - 0xDC00u) : replacement;
        }
        appendUtf8(out, point);
    }
    return out;
}

} // namespace zandor::platform
