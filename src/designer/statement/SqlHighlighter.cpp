#include "designer/statement/SqlHighlighter.h"

#include "model/sql/ReservedWords.h"

#include <QPalette>

#include <algorithm>
#include <iterator>

namespace zandor::designer {

namespace {

/// What is open at the end of a line: its closing text, and the part it belongs to.
struct Open {
    QLatin1String opening;
    QLatin1String closing;
    SqlHighlighter::Part part;
};

constexpr Open opens[] = {
    {QLatin1String("'"), QLatin1String("'"), SqlHighlighter::string},
    {QLatin1String("\""), QLatin1String("\""), SqlHighlighter::quotedName},
    {QLatin1String("`"), QLatin1String("`"), SqlHighlighter::quotedName},
    {QLatin1String("["), QLatin1String("]"), SqlHighlighter::quotedName},
    {QLatin1String("/*"), QLatin1String("*/"), SqlHighlighter::comment},
};

QColor tone(int hue, bool dark) { return QColor::fromHsl(hue, dark ? 150 : 200, dark ? 175 : 72); }

/// A word of any dialect, for the view is not told which one it shows.
bool isKeyword(QStringView word) {
    const platform::StringView text(word.utf16(), static_cast<std::size_t>(word.size()));
    return std::any_of(
        std::begin(model::sql::allDialects), std::end(model::sql::allDialects),
        [text](model::sql::Dialect dialect) { return model::sql::isReserved(text, dialect); });
}

} // namespace

SqlHighlighter::SqlHighlighter(QTextDocument* document, const QPalette& palette)
    : QSyntaxHighlighter(document),
      mParts(QStringLiteral("(?<comment>--.*)|(?<open>/\\*|['\"`\\[])"
                            "|(?<parameter>\\?|[$:@]\\w+)"
                            "|(?<number>\\b\\d+(\\.\\d+)?([eE][+-]?\\d+)?\\b)"
                            "|(?<word>[\\p{L}_]\\w*)"),
             QRegularExpression::UseUnicodePropertiesOption) {
    for (int part = other; part < partCount; ++part) mFormats[part].setProperty(partProperty, part);
    mFormats[keyword].setFontWeight(QFont::Bold);
    mFormats[parameter].setFontWeight(QFont::Bold);
    mFormats[comment].setFontItalic(true);
    setPalette(palette);
}

void SqlHighlighter::setPalette(const QPalette& palette) {
    const bool dark = palette.color(QPalette::Base).lightness() < 128;
    mFormats[keyword].setForeground(tone(215, dark));
    mFormats[string].setForeground(tone(115, dark));
    mFormats[number].setForeground(tone(28, dark));
    mFormats[quotedName].setForeground(tone(280, dark));
    mFormats[parameter].setForeground(tone(335, dark));
    mFormats[comment].setForeground(palette.color(QPalette::PlaceholderText));
    rehighlight();
}

qsizetype SqlHighlighter::close(const QString& text, int open, qsizetype begin) {
    const QLatin1String closing = opens[open].closing;
    const bool doubles = closing.size() == 1; // a doubled quote is one within the text
    qsizetype end = text.indexOf(closing, begin);
    while (doubles && end >= 0 && end + 1 < text.size() && text[end + 1] == text[end])
        end = text.indexOf(closing, end + 2);
    if (end >= 0) return end + closing.size();
    setCurrentBlockState(open);
    return text.size();
}

void SqlHighlighter::highlightBlock(const QString& text) {
    setCurrentBlockState(-1);
    const auto paint = [this](qsizetype begin, qsizetype end, Part part) {
        setFormat(static_cast<int>(begin), static_cast<int>(end - begin), mFormats[part]);
    };
    qsizetype at = 0;
    if (const int open = previousBlockState(); open >= 0) {
        at = close(text, open, 0);
        paint(0, at, opens[open].part);
    }
    // The text is looked through once for halves of characters, and not with each match.
    auto options = QRegularExpression::NoMatchOption;
    while (true) {
        const auto match = mParts.match(text, at, QRegularExpression::NormalMatch, options);
        if (!match.hasMatch()) return;
        options = QRegularExpression::DontCheckSubjectStringMatchOption;
        const qsizetype begin = match.capturedStart();
        at = match.capturedEnd();
        if (match.hasCaptured(u"open")) {
            int open = 0;
            while (opens[open].opening != match.captured()) ++open;
            at = close(text, open, at);
            paint(begin, at, opens[open].part);
        } else if (match.hasCaptured(u"comment")) {
            paint(begin, at, comment);
        } else if (match.hasCaptured(u"parameter")) {
            paint(begin, at, parameter);
        } else if (match.hasCaptured(u"number")) {
            paint(begin, at, number);
        } else if (isKeyword(match.capturedView())) {
            paint(begin, at, keyword);
        }
    }
}

} // namespace zandor::designer
