#include "designer/statement/SqlView.h"

#include "designer/Colours.h"
#include "designer/statement/SqlHighlighter.h"

#include <QFontDatabase>
#include <QKeyEvent>
#include <QMimeData>
#include <QScrollBar>
#include <QSignalBlocker>

#include <algorithm>

namespace zandor::designer {

namespace {

/// What no engine and no file takes, a NUL or half a character, is seen as the sign for that.
QString withoutHalves(QString text) {
    const qsizetype size = text.size();
    for (qsizetype at = 0; at < size; ++at) {
        const QChar c = text.at(at);
        const bool whole = c.isHighSurrogate() && at + 1 < size && text.at(at + 1).isLowSurrogate();
        if (whole)
            ++at;
        else if (c.isNull() || c.isSurrogate())
            text[at] = QChar::ReplacementCharacter;
    }
    return text;
}

/// To look for the ends of words in such a line takes minutes.
bool hasEndlessLine(QStringView text) {
    constexpr qsizetype most = 10'000;
    qsizetype begin = 0;
    for (qsizetype end = 0; end >= 0; begin = end + 1) {
        end = text.indexOf(u'\n', begin);
        if ((end < 0 ? text.size() : end) - begin > most) return true;
    }
    return false;
}

} // namespace

SqlView::SqlView(QWidget* parent)
    : QPlainTextEdit(parent), mHighlighter(new SqlHighlighter(document(), palette())) {
    setReadOnly(true);
    setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    setTabChangesFocus(true);
    connect(this, &QPlainTextEdit::textChanged, this, &SqlView::hear);
}

void SqlView::setStatement(const QString& text) {
    QString lines = text;
    lines.replace(QLatin1String("\r\n"), QLatin1String("\n")).replace(u'\r', u'\n');
    if (text == mStatement && lines == this->text()) return;
    const int across = horizontalScrollBar()->value();
    const int down = verticalScrollBar()->value();
    mark(-1);
    mStatement = text;
    wrapFor(lines);
    {
        const QSignalBlocker quiet(this);
        replace(text);
    }
    if (!hasEndlessLine(lines)) setWordWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
    mHeard = this->text();
    emit textChanged();
    forgetTyping();
    horizontalScrollBar()->setValue(across);
    verticalScrollBar()->setValue(down);
}

QString SqlView::text() const {
    // Not as plain text, which takes protected blanks for others.
    QString text = document()->toRawText();
    return text.replace(QChar::ParagraphSeparator, u'\n').replace(QChar::LineSeparator, u'\n');
}

void SqlView::type(const QString& text) {
    wrapFor(text);
    QTextCursor cursor(document());
    cursor.select(QTextCursor::Document);
    cursor.insertText(withoutHalves(text));
    setTextCursor(cursor);
}

void SqlView::forgetTyping() { document()->clearUndoRedoStacks(); }

void SqlView::wrapFor(const QString& text) {
    if (hasEndlessLine(text)) setWordWrapMode(QTextOption::WrapAnywhere);
}

/// By whatever way, with the keyboard or the mouse.
void SqlView::insertFromMimeData(const QMimeData* source) {
    if (!source->hasText()) return;
    wrapFor(source->text());
    QMimeData plain;
    plain.setText(withoutHalves(source->text()));
    QPlainTextEdit::insertFromMimeData(&plain);
}

/// The highlighter changes the document too, but not its text.
void SqlView::hear() {
    const QString now = text();
    if (now == mHeard) return;
    mHeard = now;
    emit typing();
}

/// Changes the document in one place, from the first to the last difference.
void SqlView::replace(const QString& text) {
    // Line ends of two characters become one in the document, and then places are not the same.
    if (text.contains(u'\r')) return setPlainText(text);
    const QString before = this->text();
    const auto unlike = std::mismatch(before.cbegin(), before.cend(), text.cbegin(), text.cend());
    const qsizetype begin = unlike.first - before.cbegin();
    const qsizetype most = std::min(before.size(), text.size()) - begin;
    qsizetype same = 0;
    while (same < most && before[before.size() - 1 - same] == text[text.size() - 1 - same]) ++same;

    QTextCursor cursor(document());
    cursor.setPosition(static_cast<int>(begin));
    cursor.setPosition(static_cast<int>(before.size() - same), QTextCursor::KeepAnchor);
    cursor.insertText(text.mid(begin, text.size() - same - begin));
}

void SqlView::mark(int position) {
    mMarked = position;
    showMark();
}

void SqlView::showMark() {
    if (mMarked < 0 || document()->isEmpty()) return setExtraSelections({});
    QTextEdit::ExtraSelection wave;
    wave.format.setUnderlineStyle(QTextCharFormat::WaveUnderline);
    wave.format.setUnderlineColor(areColoursDark() ? QColor(0xff8080) : QColor(0xc00000));
    const QString now = text();
    // What is missing is so behind the last sign.
    int begin = std::min(mMarked, static_cast<int>(now.size()) - 1);
    while (begin > 0 && mMarked >= now.size() && now[begin].isSpace()) --begin;
    int end = begin;
    const auto isWord = [&](int at) { return now[at].isLetterOrNumber() || now[at] == u'_'; };
    // With what it is of: "o.id".
    while (end < now.size() && (isWord(end) || (now[end] == u'.' && end > begin))) ++end;
    while (end > begin && now[end - 1] == u'.') --end;
    end = std::max(end, begin + 1);
    wave.cursor = QTextCursor(document());
    wave.cursor.setPosition(begin);
    wave.cursor.setPosition(end, QTextCursor::KeepAnchor);
    setExtraSelections({wave});
}

QSize SqlView::sizeHint() const {
    return {fontMetrics().averageCharWidth() * 44, fontMetrics().lineSpacing() * 9};
}

void SqlView::changeEvent(QEvent* event) {
    QPlainTextEdit::changeEvent(event);
    if (event->type() != QEvent::PaletteChange) return;
    mHighlighter->setPalette(palette());
    showMark();
}

/// Which keys are this view's, and not those of a command of the window's.
bool SqlView::event(QEvent* event) {
    if (event->type() != QEvent::ShortcutOverride) return QPlainTextEdit::event(event);
    const auto& key = static_cast<const QKeyEvent&>(*event);
    // Where nothing that was typed is left to be taken back, the window takes a step back.
    const bool idle = (key.matches(QKeySequence::Undo) && !document()->isUndoAvailable()) ||
                      (key.matches(QKeySequence::Redo) && !document()->isRedoAvailable());
    if (idle)
        event->ignore();
    else if (key.matches(QKeySequence::Find) ||
             (key.key() == Qt::Key_Space && key.modifiers() == Qt::ControlModifier))
        event->accept();
    else
        QPlainTextEdit::event(event);
    const bool isModifier = key.key() >= Qt::Key_Shift && key.key() <= Qt::Key_ScrollLock;
    const bool isCommand =
        (key.modifiers().testAnyFlags(Qt::ControlModifier | Qt::AltModifier) && !isModifier) ||
        (key.key() >= Qt::Key_F1 && key.key() <= Qt::Key_F35);
    if (isCommand && !event->isAccepted() && !idle) emit turnedAway();
    return true;
}

void SqlView::keyPressEvent(QKeyEvent* event) {
    if (mKeyHandler && mKeyHandler(*event)) return;
    if (event->matches(QKeySequence::Find)) {
        emit findWanted();
    } else if (event->key() == Qt::Key_Escape) {
        emit left();
    } else {
        QPlainTextEdit::keyPressEvent(event);
    }
}

void SqlView::focusOutEvent(QFocusEvent* event) {
    QPlainTextEdit::focusOutEvent(event);
    if (event->reason() != Qt::PopupFocusReason) emit turnedAway();
}

} // namespace zandor::designer
