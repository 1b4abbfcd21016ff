#include "designer/properties/FieldEdit.h"

#include "designer/Colours.h"
#include "designer/properties/fields.h"

#include <QAbstractItemView>
#include <QCompleter>
#include <QKeyEvent>
#include <QPainter>
#include <QRegularExpression>
#include <QScrollBar>
#include <QStringListModel>

namespace zandor::designer {

namespace {

constexpr int waveHeight = 2; // logical pixels
constexpr int shortestWord = 1;
constexpr int overlap = 2; // with which Qt puts a list below something

} // namespace

FieldEdit::FieldEdit(QWidget* parent)
    : QLineEdit(parent), mCompleter(new QCompleter(this)), mOffered(new QStringListModel(this)) {
    mCompleter->setModel(mOffered);
    mCompleter->setWidget(this); // not setCompleter: it is a word that is completed, not the text
    connect(mCompleter, qOverload<const QString&>(&QCompleter::activated), this, &FieldEdit::take);
    connect(this, &QLineEdit::textEdited, this, &FieldEdit::complete);
}

void FieldEdit::offer(const QStringList& names) { mNames = names; }

void FieldEdit::keepInSight(QWidget& below) {
    mBelow = &below;
    below.installEventFilter(this);
}

void FieldEdit::mark(int from) {
    mMarked = from;
    update();
}

QString FieldEdit::wordAtCursor() const {
    static const QRegularExpression word(QStringLiteral("[\\p{L}\\d_.\\[\\]]*$"));
    return word.match(text().left(cursorPosition())).captured();
}

void FieldEdit::complete() {
    const QString word = wordAtCursor();
    const QStringList found = word.size() < shortestWord ? QStringList() : matching(mNames, word);
    const bool isThere = found.size() == 1 && found.front().compare(word, Qt::CaseInsensitive) == 0;
    mOffered->setStringList(found);
    if (found.isEmpty() || isThere) return mCompleter->popup()->hide();
    showList();
}

void FieldEdit::showList() {
    QAbstractItemView* const list = mCompleter->popup();
    const int needed = list->sizeHintForColumn(0) + list->verticalScrollBar()->sizeHint().width();
    const int end =
        mBelow ? mapFromGlobal(mBelow->mapToGlobal(QPoint(0, mBelow->height()))).y() : height();
    mCompleter->complete(QRect(0, 0, std::max(width(), needed), end + overlap));
}

bool FieldEdit::eventFilter(QObject* watched, QEvent* event) {
    const bool isMoved = event->type() == QEvent::Resize || event->type() == QEvent::Move;
    if (watched == mBelow && isMoved && mCompleter->popup()->isVisible()) showList();
    return QLineEdit::eventFilter(watched, event);
}

void FieldEdit::take(const QString& word) {
    const int begin = cursorPosition() - static_cast<int>(wordAtCursor().size());
    setSelection(begin, cursorPosition() - begin);
    insert(word);
    emit textEdited(text());
    mCompleter->popup()->hide();
}

void FieldEdit::keyPressEvent(QKeyEvent* event) {
    // Those are for the list while it is open.
    const int key = event->key();
    if (mCompleter->popup()->isVisible()) {
        if (key == Qt::Key_Escape) return mCompleter->popup()->hide();
        if (key == Qt::Key_Return || key == Qt::Key_Enter || key == Qt::Key_Tab) {
            const QModelIndex chosen = mCompleter->popup()->currentIndex();
            if (chosen.isValid()) return take(chosen.data().toString());
            mCompleter->popup()->hide();
        }
    }
    if (key == Qt::Key_Space && event->modifiers() == Qt::ControlModifier) return complete();
    QLineEdit::keyPressEvent(event);
}

void FieldEdit::paintEvent(QPaintEvent* event) {
    QLineEdit::paintEvent(event);
    if (mMarked < 0 || text().isEmpty()) return;
    const int from = std::min(mMarked, static_cast<int>(text().size()) - 1);
    // Where the text begins, scrolled as it is.
    const int cursor = fontMetrics().horizontalAdvance(text().left(cursorPosition()));
    const int origin = cursorRect().center().x() - cursor;
    const int begin = origin + fontMetrics().horizontalAdvance(text().left(from));
    const int end = std::min(origin + fontMetrics().horizontalAdvance(text()), width() - 4);
    const int y = rect().center().y() + fontMetrics().height() / 2 - waveHeight;
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(areColoursDark() ? QColor(0xff8080) : QColor(0xc00000), 1));
    QPolygonF wave;
    for (int x = std::max(begin, 3), n = 0; x <= end; x += waveHeight, ++n)
        wave << QPointF(x, y + (n % 2) * waveHeight);
    painter.drawPolyline(wave);
}

} // namespace zandor::designer
