#include <Zandor/platform/String.h>

#include <gtest/gtest.h>

#include <limits>

using namespace zandor;

using platform::decimal;
using platform::fromUtf8;
using platform::String;
using platform::toUtf8;

TEST(DecimalText, HasNoBlankBeforeAPositiveNumber) {
    EXPECT_EQ(decimal(0), u"0");
    EXPECT_EQ(decimal(91), u"91");
}

TEST(DecimalText, KeepsTheMinusSign) {
    EXPECT_EQ(decimal(-91), u"-91");
    EXPECT_EQ(decimal(std::numeric_limits<std::int64_t>::min()), u"-9223372036854775808");
}

TEST(Utf8, ComesOutAsItWentIn) {
    for (const std::string text :
         {"", "ORDERS",
          "\xC3\x9C"
          "bersicht",
          "\xE6\xB3\xA8\xE6\x96\x87", "\xF0\x9F\x97\x84",
          "\x7F\xC2\x80\xDF\xBF\xE0\xA0\x80\xEF\xBF\xBF\xF0\x90\x80\x80\xF4\x8F\xBF\xBF"})
        EXPECT_EQ(toUtf8(fromUtf8(text)), text);
}

TEST(Utf8, KeepsZeroCharacters) {
    EXPECT_EQ(fromUtf8(std::string_view("a\0b", 3)), String(u"a\0b", 3));
    EXPECT_EQ(toUtf8(String(u"a\0b", 3)), std::string("a\0b", 3));
}

TEST(Utf8, BeyondTheBasicPlaneBecomesASurrogatePair) {
    EXPECT_EQ(fromUtf8("\xF0\x9F\x97\x84"), String({0xD83D, 0xDDC4}));
    EXPECT_EQ(fromUtf8("\xF0\x90\x80\x80"), String({0xD800, 0xDC00}));
    EXPECT_EQ(fromUtf8("\xF4\x8F\xBF\xBF"), String({0xDBFF, 0xDFFF}));
}

TEST(MalformedUtf8, CostsOneReplacementCharacterForEachBadByte) {
    struct Case {
        std::string bytes;
        String text;
    };
    const Case cases[] = {
        {"a\x80z", u"a\uFFFDz"},                           // a tail without a lead
        {"a\xFFz", u"a\uFFFDz"},                           // never a lead
        {"a\xC3", u"a\uFFFD"},                             // cut off
        {"a\xC3z", u"a\uFFFDz"},                           // no tail
        {"\xC0\xAF", u"\uFFFD\uFFFD"},                     // overlong slash
        {"\xE0\x80\xAF", u"\uFFFD\uFFFD\uFFFD"},           // overlong slash
        {"\xF0\x80\x80\xAF", u"\uFFFD\uFFFD\uFFFD\uFFFD"}, // overlong slash
        {"\xED\xA0\x80", u"\uFFFD\uFFFD\uFFFD"},           // a surrogate
        {"\xED\xB0\x80", u"\uFFFD\uFFFD\uFFFD"},           // the other half of one
        {"\xED\xBF\xBF", u"\uFFFD\uFFFD\uFFFD"},           // the last of them
        {"\xF4\x90\x80\x80", u"\uFFFD\uFFFD\uFFFD\uFFFD"}, // beyond the last plane
        {"\xF5\x80\x80\x80", u"\uFFFD\uFFFD\uFFFD\uFFFD"}, // beyond the last plane
        {"\xE6\xB3z", u"\uFFFD\uFFFDz"},                   // the second tail missing
    };
    for (const Case& each : cases) EXPECT_EQ(fromUtf8(each.bytes), each.text) << each.bytes;
}

TEST(UnpairedSurrogates, BecomeReplacementCharacters) {
    EXPECT_EQ(toUtf8(String({u'a', 0xD800})), "a\xEF\xBF\xBD");
    EXPECT_EQ(toUtf8(String({0xD800, u'a'})), "\xEF\xBF\xBD"
                                              "a");
    EXPECT_EQ(toUtf8(String({0xDC00, u'a'})), "\xEF\xBF\xBD"
                                              "a");
    EXPECT_EQ(toUtf8(String({0xDC00, 0xDC00})), "\xEF\xBF\xBD\xEF\xBF\xBD");
    EXPECT_EQ(toUtf8(String({0xD800, 0xE000})), "\xEF\xBF\xBD\xEE\x80\x80");
    EXPECT_EQ(toUtf8(String({0xD800, 0xD83D, 0xDDC4})), "\xEF\xBF\xBD\xF0\x9F\x97\x84");
}
