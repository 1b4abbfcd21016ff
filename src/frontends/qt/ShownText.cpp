#include "frontends/qt/ShownText.h"

#include <QStringList>
#include <QTextBoundaryFinder>
#include <QTextDocument>

namespace zandor::platform::qt {

namespace {

constexpr char16_t lineBreak = u'\u21B5';       // ↵
constexpr char16_t tabulator = u'\u21E5';       // ⇥
constexpr char16_t turn = u'\u21C4';            // ⇄
constexpr char16_t anythingElse = u'\uFFFD';    // �
constexpr char16_t controlPictures = 0x2400;    // ␀ and those that follow
constexpr char16_t pictureOfDelete = u'\u2421'; // ␡

constexpr qsizetype widest = 60;
constexpr qsizetype highest = 20;

bool breaksLine(char32_t c) {
    return (c >= 0x0A && c <= 0x0D) || c == 0x85 || c == 0x2028 || c == 0x2029;
}

bool turnsDirection(char32_t c) {
    return c == 0x061C || c == 0x200E || c == 0x200F || (c >= 0x202A && c <= 0x202E) ||
           (c >= 0x2066 && c <= 0x2069);
}

bool isJoiner(char32_t c) { return c == 0x200C || c == 0x200D; }

/// The sign for a character that cannot be seen, 0 for one that can.
char16_t signFor(char32_t c) {
    if (breaksLine(c)) return lineBreak;
    if (c == u'\t') return tabulator;
    if (c < 0x20) return static_cast<char16_t>(controlPictures + c);
    if (c == 0x7F) return pictureOfDelete;
    if (turnsDirection(c)) return turn;
    switch (QChar::category(c)) {
    case QChar::Other_Control:
    case QChar::Other_Surrogate: return anythingElse;
    case QChar::Other_Format: return isJoiner(c) ? u'\0' : anythingElse;
    default: return u'\0';
    }
}

/// Where a line that is too long ends: behind its last blank, or else between two characters.
qsizetype endOfLine(const QString& line) {
    QTextBoundaryFinder between(QTextBoundaryFinder::Grapheme, line);
    between.setPosition(widest);
    const qsizetype hard =
        between.isAtBoundary() ? widest : std::max<qsizetype>(between.toPreviousBoundary(), 1);
    const qsizetype blank = line.lastIndexOf(u' ', hard - 1);
    return blank > 0 ? blank + 1 : hard;
}

} // namespace

QString asSigns(const QString& name) {
    QString shown;
    shown.reserve(name.size());
    for (qsizetype i = 0; i < name.size(); ++i) {
        char32_t c = name[i].unicode();
        qsizetype units = 1;
        if (name[i].isHighSurrogate() && i + 1 < name.size() && name[i + 1].isLowSurrogate()) {
            c = QChar::surrogateToUcs4(name[i], name[i + 1]);
            units = 2;
        }
        if (c == u'\r' && i + 1 < name.size() && name[i + 1] == u'\n') continue; // one break
        if (const char16_t sign = signFor(c))
            shown += QChar(sign);
        else
            shown += QStringView(name).mid(i, units);
        i += units - 1;
    }
    return shown;
}

QString asToolTip(const QString& text) {
    // More than this is never shown; a whole book need not be gone through.
    QString rest = text.left(2 * widest * highest);
    rest.replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
    QStringList lines;
    for (const QString& paragraph : rest.split(u'\n')) {
        QString line = asSigns(paragraph);
        while (line.size() > widest && lines.size() <= highest) {
            const qsizetype end = endOfLine(line);
            lines += line.left(end).trimmed();
            line.remove(0, end);
        }
        lines += line;
    }
    if (lines.size() > highest) lines = lines.mid(0, highest - 1) << QStringLiteral("…");
    QString shown = lines.join(u'\n');
    if (!Qt::mightBeRichText(shown)) return shown;
    return QStringLiteral("<p style='white-space:pre'>") +
           shown.toHtmlEscaped().replace(u'\n', QStringLiteral("<br>")) + QStringLiteral("</p>");
}

} // namespace zandor::platform::qt
