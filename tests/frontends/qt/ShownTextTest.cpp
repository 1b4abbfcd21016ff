#include "frontends/qt/ShownText.h"

#include <QLabel>
#include <QTextDocument>
#include <QToolTip>

#include <gtest/gtest.h>

using namespace zandor;

using platform::qt::asSigns;
using platform::qt::asToolTip;

namespace {

QString text(std::u16string_view units) {
    return QString::fromUtf16(units.data(), static_cast<qsizetype>(units.size()));
}

std::string signs(std::u16string_view units) { return asSigns(text(units)).toStdString(); }

/// What a tooltip's label makes of a text.
QString shownBy(const QString& toolTip) {
    if (!Qt::mightBeRichText(toolTip)) return toolTip;
    QTextDocument document;
    document.setHtml(toolTip);
    return document.toPlainText();
}

qsizetype widest(const QString& lines) {
    qsizetype most = 0;
    for (const QString& line : lines.split(u'\n')) most = std::max(most, line.size());
    return most;
}

} // namespace

TEST(AShownName, StaysAsItIsWhenAllOfItCanBeSeen) {
    for (const auto* name : {u"", u"Order Details", u"<b>R&D</b>", u"Größe", u"顧客", u"עברית",
                             u"سفارش\u200Cها", u"\U0001F600", u"e\u0301"})
        EXPECT_EQ(asSigns(text(name)), text(name));
}

TEST(AShownName, IsOneLine) {
    EXPECT_EQ(signs(u"one\ntwo"), "one↵two");
    EXPECT_EQ(signs(u"one\r\ntwo"), "one↵two") << "one break, one sign";
    EXPECT_EQ(signs(u"one\n\rtwo"), "one↵↵two");
    for (const char16_t c : {u'\r', u'\v', u'\f', u'\u0085', u'\u2028', u'\u2029'})
        EXPECT_EQ(signs(std::u16string(u"a") + c + u"b"), "a↵b") << static_cast<int>(c);
}

TEST(AShownName, ShowsEveryCharacterThatControlsOrTurnsWhatFollows) {
    EXPECT_EQ(signs(u"a\tb"), "a⇥b");
    EXPECT_EQ(signs(std::u16string_view(u"a\0b", 3)), "a␀b");
    EXPECT_EQ(signs(u"a\u001B[31m"), "a␛[31m");
    EXPECT_EQ(signs(u"a\u007Fb"), "a␡b");
    EXPECT_EQ(signs(u"invoice\u202Efdp.exe"), "invoice⇄fdp.exe");
    for (char32_t c = 0; c < 0x110000; ++c) {
        const auto category = QChar::category(c);
        const bool hidden = category == QChar::Other_Control || category == QChar::Separator_Line ||
                            category == QChar::Separator_Paragraph ||
                            category == QChar::Other_Surrogate ||
                            (category == QChar::Other_Format && c != 0x200C && c != 0x200D);
        if (!hidden) continue;
        const char32_t units[] = {u'a', c}; // in front, the byte order mark would be taken off
        const QString shown = asSigns(QString::fromUcs4(units, 2)).mid(1);
        ASSERT_EQ(shown.size(), 1) << std::hex << static_cast<unsigned>(c);
        ASSERT_TRUE(shown[0].isPrint()) << std::hex << static_cast<unsigned>(c);
    }
}

TEST(AShownName, SurvivesHalfACharacter) {
    EXPECT_EQ(signs(std::u16string_view(u"a\xD83D", 2)), "a\uFFFD");
    EXPECT_EQ(signs(std::u16string_view(u"\xDE00z", 2)), "\uFFFDz");
}

TEST(ATooltip, IsPlainTextWhateverItContains) {
    for (const auto* name :
         {u"<img src='file:///etc/passwd'>", u"<b>bold</b>", u"R&D", u"a &lt; b", u"&amp;",
          u"<?xml version='1.0'?>", u"a<br>b\nc", u"a\n<b>bold</b>", u"a  b"})
        EXPECT_EQ(shownBy(asToolTip(text(name))).replace(QChar::Nbsp, u' '), text(name));
}

TEST(ATooltip, HasALargestWidthAndHeight) {
    const QString endless(5000, u'x');
    EXPECT_LE(widest(asToolTip(endless)), 60);
    EXPECT_LE(asToolTip(endless).count(u'\n'), 19);
    EXPECT_TRUE(asToolTip(endless).endsWith(u'…'));
    EXPECT_LE(asToolTip(QString(5000, u'\n')).count(u'\n'), 19);
    EXPECT_EQ(asToolTip(QString(60, u'x')), QString(60, u'x'));
    const QString two = asToolTip(QString(61, u'x'));
    EXPECT_EQ(two, QString(60, u'x') + QStringLiteral("\nx")) << "nothing gets lost";
}

TEST(ATooltip, BreaksItsLinesBetweenWords) {
    const QString words = QStringLiteral("all the rows of the table and those of the other table "
                                         "that match its customers");
    const QString shown = asToolTip(words);
    EXPECT_EQ(QString(shown).replace(u'\n', u' '), words);
    EXPECT_LE(widest(shown), 60);
}

TEST(ATooltip, KeepsLineBreaksAndShowsOtherControlCharactersAsSigns) {
    EXPECT_EQ(asToolTip(QStringLiteral("one\r\ntwo\nthree")), QStringLiteral("one\ntwo\nthree"));
    EXPECT_EQ(asToolTip(QStringLiteral("a\u202Eb")), QStringLiteral("a⇄b"));
}

TEST(ATooltip, NeverCutsACharacterInTwo) {
    QString faces;
    for (int i = 0; i < 100; ++i) faces += QStringLiteral("x\U0001F600");
    for (const QString& line : asToolTip(faces).split(u'\n')) {
        EXPECT_FALSE(line.back().isHighSurrogate());
        EXPECT_FALSE(line.front().isLowSurrogate());
    }
}
