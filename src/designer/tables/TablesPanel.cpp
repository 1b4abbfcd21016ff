#include "designer/tables/TablesPanel.h"

#include "designer/database/ErrorLine.h"
#include "designer/database/opening.h"
#include "designer/tables/TableItemDelegate.h"
#include "designer/tables/TableListModel.h"
#include "designer/tables/TableTip.h"

#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QListView>
#include <QLocale>
#include <QMenu>
#include <QStackedWidget>
#include <QStyle>
#include <QToolButton>

#include <algorithm>

namespace zandor::designer {

TablesPanel::TablesPanel(Database& database, QWidget* parent)
    : QWidget(parent), mDatabase(database), mModel(new TableListModel(this)),
      mFilter(new QLineEdit), mRefresh(new QToolButton), mList(new QListView), mEmpty(new QLabel),
      mPages(new QStackedWidget), mCount(new QLabel), mError(new ErrorLine) {
    lay();
    new TableTip(database, *mModel, *mList);
    mFilter->installEventFilter(this);
    mList->installEventFilter(this);
    connect(mFilter, &QLineEdit::textChanged, this, &TablesPanel::filter);
    connect(mRefresh, &QToolButton::clicked, this, &TablesPanel::refresh);
    // Not activated(), which is a single click on some desktops.
    connect(mList, &QListView::doubleClicked, this, &TablesPanel::choose);
    connect(mList, &QListView::customContextMenuRequested, this, &TablesPanel::showMenu);
    connect(&database, &Database::opened, this, &TablesPanel::showDatabase);
    showDatabase();
}

void TablesPanel::lay() {
    mFilter->setObjectName(QStringLiteral("tableFilter"));
    mFilter->setPlaceholderText(tr("Filter tables"));
    mFilter->setAccessibleName(tr("Filter tables"));
    mFilter->setClearButtonEnabled(true);
    mRefresh->setIcon(style()->standardIcon(QStyle::SP_BrowserReload));
    mRefresh->setToolTip(tr("Read the list of tables again"));
    mRefresh->setAccessibleName(tr("Read the list of tables again"));
    mRefresh->setAutoRaise(true);

    mList->setObjectName(QStringLiteral("tables"));
    mList->setAccessibleName(tr("Tables"));
    mList->setModel(mModel);
    mList->setItemDelegate(new TableItemDelegate(mList));
    mList->setUniformItemSizes(true);
    mList->setSelectionMode(QAbstractItemView::ExtendedSelection);
    mList->setEditTriggers(QAbstractItemView::NoEditTriggers);
    mList->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    mList->setDragEnabled(true);
    mList->setDragDropMode(QAbstractItemView::DragOnly);
    mList->setContextMenuPolicy(Qt::CustomContextMenu);
    mEmpty->setObjectName(QStringLiteral("empty"));
    mEmpty->setTextFormat(Qt::PlainText);
    mEmpty->setWordWrap(true);
    mEmpty->setAlignment(Qt::AlignCenter);
    mEmpty->setMargin(12);
    mEmpty->setForegroundRole(QPalette::PlaceholderText);
    mCount->setObjectName(QStringLiteral("count"));

    auto* const top = new QHBoxLayout;
    top->setSpacing(4);
    top->addWidget(mFilter, 1);
    top->addWidget(mRefresh);
    mPages->addWidget(mList);
    mPages->addWidget(mEmpty);
    auto* const layout = new QVBoxLayout(this);
    layout->setContentsMargins(6, 6, 6, 6);
    layout->setSpacing(6);
    layout->addLayout(top);
    layout->addWidget(mError);
    layout->addWidget(mPages, 1);
    layout->addWidget(mCount);
    setFocusProxy(mFilter);
}

void TablesPanel::showDatabase() {
    const bool open = mDatabase.isOpen();
    mError->say({});
    mFilter->setEnabled(open);
    mRefresh->setEnabled(open);
    if (mAddress != mDatabase.address()) mFilter->clear();
    mAddress = mDatabase.address();
    mModel->setTables(mDatabase.tables());
    showCount();
}

void TablesPanel::filter() {
    mModel->setFilter(mFilter->text());
    // Enter in the box takes the best match.
    if (!mFilter->text().isEmpty() && mModel->rowCount() > 0)
        mList->setCurrentIndex(mModel->index(0));
    showCount();
}

void TablesPanel::showCount() {
    const auto shown = static_cast<std::size_t>(mModel->rowCount());
    const auto all = mModel->count();
    const QLocale locale;
    if (!mDatabase.isOpen())
        mEmpty->setText(tr("Open a database to see its tables."));
    else if (all == 0)
        mEmpty->setText(tr("There are no tables in this database."));
    else
        mEmpty->setText(tr("No table has all of this in its name."));
    mPages->setCurrentIndex(shown > 0 ? 0 : 1);
    if (all == 0)
        mCount->clear();
    else if (shown < all)
        mCount->setText(tr("%1 of %2 tables").arg(locale.toString(shown), locale.toString(all)));
    else if (all == 1)
        mCount->setText(tr("1 table"));
    else
        mCount->setText(tr("%1 tables").arg(locale.toString(all)));
    mCount->setVisible(all > 0);
}

bool TablesPanel::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() != QEvent::KeyPress) return QWidget::eventFilter(watched, event);
    const int key = static_cast<QKeyEvent*>(event)->key();
    if (watched == mFilter) return filterKey(key);
    const bool enter = key == Qt::Key_Return || key == Qt::Key_Enter;
    if (watched == mList && enter) choose();
    return watched == mList && enter;
}

bool TablesPanel::filterKey(int key) {
    switch (key) {
    case Qt::Key_Down:
        if (mModel->rowCount() == 0) return true;
        if (!mList->currentIndex().isValid()) mList->setCurrentIndex(mModel->index(0));
        mList->setFocus();
        return true;
    case Qt::Key_Return:
    case Qt::Key_Enter: choose(); return true;
    case Qt::Key_Escape:
        if (mFilter->text().isEmpty()) return false;
        mFilter->clear();
        return true;
    default: return false;
    }
}

void TablesPanel::choose() {
    QModelIndexList rows = mList->selectionModel()->selectedIndexes();
    std::sort(rows.begin(), rows.end());
    std::vector<reader::TableId> tables;
    for (const QModelIndex& row : rows) tables.push_back(mModel->entry(row.row()).id);
    if (!tables.empty()) emit chosen(tables);
}

void TablesPanel::refresh() { mError->say(renewPatiently(mDatabase, window()).error); }

void TablesPanel::showMenu(QPoint at) {
    if (!mList->indexAt(at).isValid()) return;
    QMenu menu(this);
    menu.addAction(tr("&Add to drawing"), this, &TablesPanel::choose);
    menu.addSeparator();
    menu.addAction(mRefresh->icon(), mRefresh->toolTip(), this, &TablesPanel::refresh);
    menu.exec(mList->viewport()->mapToGlobal(at));
}

} // namespace zandor::designer
