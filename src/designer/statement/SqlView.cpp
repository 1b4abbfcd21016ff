#include "designer/statement/SqlView.h"

#include "designer/statement/SqlHighlighter.h"

#include <QEvent>
#include <QFontDatabase>
#include <QScrollBar>

#include <algorithm>

namespace zandor::designer {

SqlView::SqlView(QWidget* parent)
    : QPlainTextEdit(parent), mHighlighter(new SqlHighlighter(document(), palette())) {
    setReadOnly(true);
    setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    setTabChangesFocus(true);
    document()->setUndoRedoEnabled(false);
}

void SqlView::setStatement(const QString& text) {
    if (text == mStatement) return;
    const int across = horizontalScrollBar()->value();
    const int down = verticalScrollBar()->value();
    replace(text);
    mStatement = text;
    horizontalScrollBar()->setValue(across);
    verticalScrollBar()->setValue(down);
}

/// Changes the document in one place, from the first to the last difference.
void SqlView::replace(const QString& text) {
    // Line ends of two characters become one in the document, and then places are not the same.
    if (document()->characterCount() - 1 != mStatement.size() || text.contains(u'\r')) {
        setPlainText(text);
        return;
    }
    const auto unlike =
        std::mismatch(mStatement.cbegin(), mStatement.cend(), text.cbegin(), text.cend());
    const qsizetype begin = unlike.first - mStatement.cbegin();
    const qsizetype most = std::min(mStatement.size(), text.size()) - begin;
    qsizetype same = 0;
    while (same < most && mStatement[mStatement.size() - 1 - same] == text[text.size() - 1 - same])
        ++same;

    QTextCursor cursor(document());
    cursor.setPosition(static_cast<int>(begin));
    cursor.setPosition(static_cast<int>(mStatement.size() - same), QTextCursor::KeepAnchor);
    cursor.insertText(text.mid(begin, text.size() - same - begin));
}

QSize SqlView::sizeHint() const {
    return {fontMetrics().averageCharWidth() * 44, fontMetrics().lineSpacing() * 9};
}

void SqlView::changeEvent(QEvent* event) {
    QPlainTextEdit::changeEvent(event);
    if (event->type() == QEvent::PaletteChange) mHighlighter->setPalette(palette());
}

} // namespace zandor::designer
