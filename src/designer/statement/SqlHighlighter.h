#pragma once

#include <QRegularExpression>
#include <QSyntaxHighlighter>
#include <QTextCharFormat>

class QPalette;

namespace zandor::designer {

/// Colours SQL as the dialects write it. Strings, quoted names and comments may go over lines.
class SqlHighlighter final : public QSyntaxHighlighter {
    Q_OBJECT

public:
    SqlHighlighter(QTextDocument* document, const QPalette& palette);

    /// Takes the colours that can be read on a palette's base.
    void setPalette(const QPalette& palette);

    /// What a stretch of the text is, kept as a property of its format so that it can be asked for.
    enum Part { other, keyword, string, number, quotedName, comment, parameter, partCount };
    static constexpr int partProperty = QTextFormat::UserProperty;

protected:
    void highlightBlock(const QString& text) override;

private:
    /// The end of what is open from the line before, which goes on from `begin`.
    qsizetype close(const QString& text, int open, qsizetype begin);

    QRegularExpression mParts;
    QTextCharFormat mFormats[partCount];
};

} // namespace zandor::designer
