#include "designer/statement/SqlHighlighter.h"

#include <gmock/gmock.h>

#include <cmath>

#include <QPalette>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextLayout>

using namespace zandor;

using designer::SqlHighlighter;
using testing::ElementsAre;
using Painted = std::pair<std::string, SqlHighlighter::Part>;

namespace {

/// The stretches that are coloured, in their order.
std::vector<Painted> painted(const QString& sql, const QPalette& palette = QPalette()) {
    QTextDocument document(sql);
    SqlHighlighter highlighter(&document, palette);
    highlighter.rehighlight();
    std::vector<Painted> result;
    for (auto block = document.begin(); block.isValid(); block = block.next())
        for (const auto& range : block.layout()->formats())
            result.emplace_back(block.text().mid(range.start, range.length).toStdString(),
                                static_cast<SqlHighlighter::Part>(
                                    range.format.intProperty(SqlHighlighter::partProperty)));
    return result;
}

QColor colourOf(const QString& sql, const QPalette& palette) {
    QTextDocument document(sql);
    SqlHighlighter highlighter(&document, palette);
    highlighter.rehighlight();
    return document.begin().layout()->formats().first().format.foreground().color();
}

/// By the usual formula of readability; 4.5 is what is asked of texts.
double contrast(const QColor& one, const QColor& other) {
    const auto light = [](const QColor& colour) {
        const auto part = [](double value) {
            return value <= 0.04045 ? value / 12.92 : std::pow((value + 0.055) / 1.055, 2.4);
        };
        return 0.2126 * part(colour.redF()) + 0.7152 * part(colour.greenF()) +
               0.0722 * part(colour.blueF());
    };
    const auto [least, most] = std::minmax({light(one), light(other)});
    return (most + 0.05) / (least + 0.05);
}

} // namespace

TEST(TheHighlighter, TellsKeywordsFromNames) {
    EXPECT_THAT(painted("SELECT total FROM orders"),
                ElementsAre(Painted("SELECT", SqlHighlighter::keyword),
                            Painted("FROM", SqlHighlighter::keyword)));
}

TEST(TheHighlighter, ColoursValuesNamesInQuotesAndParameters) {
    EXPECT_THAT(
        painted("a = 'it''s' AND \"the \"\"b\"\"\" > 1.5e3 OR [c d] < ?"),
        ElementsAre(
            Painted("'it''s'", SqlHighlighter::string), Painted("AND", SqlHighlighter::keyword),
            Painted("\"the \"\"b\"\"\"", SqlHighlighter::quotedName),
            Painted("1.5e3", SqlHighlighter::number), Painted("OR", SqlHighlighter::keyword),
            Painted("[c d]", SqlHighlighter::quotedName), Painted("?", SqlHighlighter::parameter)));
    EXPECT_THAT(painted("`from` = :day"), ElementsAre(Painted("`from`", SqlHighlighter::quotedName),
                                                      Painted(":day", SqlHighlighter::parameter)));
}

TEST(TheHighlighter, KnowsNoKeywordWithinQuotesOrNames) {
    EXPECT_THAT(painted("'select ? 1' selection x1"),
                ElementsAre(Painted("'select ? 1'", SqlHighlighter::string)));
}

TEST(TheHighlighter, GoesOnOverTheEndOfALine) {
    EXPECT_THAT(
        painted("'a\nselect' AND 1 /* 2\n3 */ 4 -- 5"),
        ElementsAre(
            Painted("'a", SqlHighlighter::string), Painted("select'", SqlHighlighter::string),
            Painted("AND", SqlHighlighter::keyword), Painted("1", SqlHighlighter::number),
            Painted("/* 2", SqlHighlighter::comment), Painted("3 */", SqlHighlighter::comment),
            Painted("4", SqlHighlighter::number), Painted("-- 5", SqlHighlighter::comment)));
}

TEST(TheHighlighter, CanBeReadOnLightAndOnDark) {
    for (const QColor& base : {QColor(Qt::white), QColor(0x1f, 0x21, 0x24)}) {
        QPalette palette;
        palette.setColor(QPalette::Base, base);
        for (const char* sql : {"select", "'text'", "12", "\"name\"", "?"})
            EXPECT_GE(contrast(colourOf(QString::fromLatin1(sql), palette), base), 4.5)
                << sql << " on " << base.name().toStdString();
    }
}
