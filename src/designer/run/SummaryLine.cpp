#include "designer/run/SummaryLine.h"

#include "designer/run/ResultTable.h"
#include "frontends/qt/ShownText.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QLocale>

namespace zandor::designer {

namespace {

constexpr std::chrono::milliseconds atATime(10);
constexpr int roomInFront = 8; // logical pixels: of the cursor and of what is around the text

} // namespace

SummaryLine::SummaryLine(ResultTable& table, QWidget* parent) : QLineEdit(parent), mTable(table) {
    setObjectName(QStringLiteral("cellSummary"));
    setAccessibleName(tr("What the selected cells come to"));
    setReadOnly(true);
    setFrame(false);
    setAlignment(Qt::AlignRight);
    setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Fixed);
    setBackgroundRole(QPalette::Window);
    QPalette plain;
    plain.setColor(QPalette::Base, Qt::transparent);
    setPalette(plain);
    mNext.setSingleShot(true);
    connect(&mNext, &QTimer::timeout, this, &SummaryLine::goOn);
    connect(table.selectionModel(), &QItemSelectionModel::selectionChanged, this,
            &SummaryLine::begin);
    connect(&table.rows(), &QAbstractItemModel::modelReset, this, &SummaryLine::begin);
    connect(&table.rows(), &QAbstractItemModel::dataChanged, this, &SummaryLine::begin);
    hide();
}

QSize SummaryLine::sizeHint() const {
    return {fontMetrics().horizontalAdvance(text()) + roomInFront, QLineEdit::sizeHint().height()};
}

void SummaryLine::copyAll() {
    if (!text().isEmpty()) QGuiApplication::clipboard()->setText(text());
}

/// Not at once: while a selection grows it is another one with each move of the mouse.
void SummaryLine::begin() {
    mCells = SelectedCells();
    mNext.start(0);
}

void SummaryLine::goOn() {
    if (mCells.count() == 0)
        mCells = SelectedCells(mTable.rows(), mTable.selectionModel()->selection());
    if (mCells.count() < 2) return say({});
    mCells.goOn(QDeadlineTimer(atATime));
    if (mCells.isOver()) return say(mCells.tally().inWords());
    const QLocale locale;
    say(tr("Cells: %1 \u00b7 adding up, %2 %")
            .arg(locale.toString(mCells.count()),
                 locale.toString(100 * mCells.done() / mCells.count())));
    mNext.start(0);
}

void SummaryLine::say(const QString& words) {
    if (words != text()) {
        setText(words);
        setToolTip(platform::qt::asToolTip(words));
        setCursorPosition(0);
        updateGeometry();
    }
    setVisible(!words.isEmpty());
}

} // namespace zandor::designer
