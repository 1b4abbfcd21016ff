#include "designer/run/ResultTable.h"

#include <QAction>
#include <QClipboard>
#include <QGuiApplication>
#include <QHeaderView>
#include <QHelpEvent>
#include <QKeyEvent>
#include <QPainter>
#include <QSignalBlocker>
#include <QStyledItemDelegate>
#include <QToolTip>

namespace zandor::designer {

namespace {

constexpr int widestColumn = 320; // logical pixels
constexpr int narrowestColumn = 48;
constexpr int widestByHand = 1200;
constexpr int roomInARow = 8;

/// Shows a tip where a text is cut off.
class CellDelegate final : public QStyledItemDelegate {
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    bool helpEvent(QHelpEvent* event, QAbstractItemView* view, const QStyleOptionViewItem& option,
                   const QModelIndex& index) override {
        const QString text = index.data(Qt::ToolTipRole).toString();
        const bool whole = sizeHint(option, index).width() <= view->visualRect(index).width() &&
                           text == index.data().toString();
        if (event->type() != QEvent::ToolTip || whole || text.isEmpty()) {
            QToolTip::hideText();
            return false;
        }
        QToolTip::showText(event->globalPos(), text, view);
        return true;
    }
};

} // namespace

ResultTable::ResultTable(QWidget* parent)
    : QTableView(parent), mModel(new ResultModel(this)), mCopy(new QAction(tr("&Copy"), this)) {
    setObjectName(QStringLiteral("resultTable"));
    setModel(mModel);
    setItemDelegate(new CellDelegate(this));
    setEditTriggers(NoEditTriggers);
    setAlternatingRowColors(true);
    setWordWrap(false);
    setFrameShape(NoFrame);
    setHorizontalScrollMode(ScrollPerPixel);
    setTabKeyNavigation(false);
    setContextMenuPolicy(Qt::ActionsContextMenu);
    numberRows();
    connect(mModel, &ResultModel::modelReset, this, [this] {
        if (mModel->rowCount() == 0) numberRows();
    });
    horizontalHeader()->setHighlightSections(false);
    horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    horizontalHeader()->setMinimumSectionSize(narrowestColumn);
    horizontalHeader()->setMaximumSectionSize(widestByHand);

    // A click goes from smallest first over largest first back to how the rows came.
    horizontalHeader()->setSortIndicatorClearable(true);
    showSorting(-1);
    setSortingEnabled(true);

    mCopy->setShortcut(QKeySequence::Copy);
    mCopy->setShortcutContext(Qt::WidgetShortcut);
    connect(mCopy, &QAction::triggered, this, &ResultTable::copy);
    addAction(mCopy);
    addCommand(tr("Copy &with all columns"), "copyRows", [this] {
        selectionModel()->select(selectionModel()->selection(),
                                 QItemSelectionModel::Select | QItemSelectionModel::Rows);
        copy();
    });
    addCommand(tr("Select c&olumn"), "selectColumn",
               [this] { selectColumn(currentIndex().column()); });
    const auto sortBy = [this](Qt::SortOrder direction) {
        if (currentIndex().isValid())
            horizontalHeader()->setSortIndicator(currentIndex().column(), direction);
    };
    addCommand(tr("Sort &ascending"), "sortAscending", [=] { sortBy(Qt::AscendingOrder); });
    addCommand(tr("Sort &descending"), "sortDescending", [=] { sortBy(Qt::DescendingOrder); });
    addCommand(tr("As the &query gives them"), "sortNot",
               [this] { horizontalHeader()->setSortIndicator(-1, Qt::AscendingOrder); });
}

QAction* ResultTable::addCommand(const QString& text, const char* name,
                                 const std::function<void()>& what) {
    auto* const action = new QAction(text, this);
    action->setObjectName(QLatin1String(name));
    connect(action, &QAction::triggered, this, what);
    addAction(action);
    return action;
}

/// By a new header, for one that has had a million rows keeps its room for them.
void ResultTable::numberRows() {
    setVerticalHeader(new QHeaderView(Qt::Vertical, this));
    verticalHeader()->setSectionsClickable(true);
    // One height for all: the header then need not ask for that of each row.
    verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    verticalHeader()->setDefaultSectionSize(fontMetrics().height() + roomInARow);
    verticalHeader()->setHighlightSections(false);
    verticalHeader()->setDefaultAlignment(Qt::AlignRight | Qt::AlignVCenter);
    verticalHeader()->show();
}

void ResultTable::showSorting(int column, Qt::SortOrder direction) {
    const QSignalBlocker quiet(horizontalHeader());
    horizontalHeader()->setSortIndicator(column, direction);
    horizontalHeader()->viewport()->update();
}

void ResultTable::fitColumns() {
    resizeColumnsToContents();
    for (int column = 0; column < mModel->columnCount(); ++column)
        if (columnWidth(column) > widestColumn) setColumnWidth(column, widestColumn);
}

void ResultTable::widenColumns() {
    for (int column = 0; column < mModel->columnCount(); ++column)
        if (const int wanted = std::min(sizeHintForColumn(column), widestColumn);
            columnWidth(column) < wanted)
            setColumnWidth(column, wanted);
}

void ResultTable::setEmptyText(const QString& text) {
    mEmptyText = text;
    setAccessibleDescription(text);
    viewport()->update();
}

void ResultTable::paintEvent(QPaintEvent* event) {
    QTableView::paintEvent(event);
    if (mModel->rowCount() > 0 || mEmptyText.isEmpty()) return;
    QPainter painter(viewport());
    painter.setPen(palette().color(QPalette::PlaceholderText));
    painter.drawText(viewport()->rect().adjusted(roomInARow, 0, -roomInARow, 0),
                     Qt::AlignCenter | Qt::TextWordWrap, mEmptyText);
}

// By itself a view copies the current cell only.
void ResultTable::keyPressEvent(QKeyEvent* event) {
    if (!event->matches(QKeySequence::Copy)) return QTableView::keyPressEvent(event);
    copy();
    event->accept();
}

void ResultTable::copy() {
    if (!selectionModel()->hasSelection()) return;
    if (const auto text = mModel->copied(selectionModel()->selection()))
        QGuiApplication::clipboard()->setText(*text);
    else
        emit tooMuchToCopy();
}

} // namespace zandor::designer
