#include "frontends/qt/GridWidget.h"

#include "frontends/qt/ElisionToolTip.h"
#include "frontends/qt/GridCells.h"
#include "frontends/qt/GridCorner.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/KeyCodes.h"
#include "frontends/qt/OwnLooks.h"
#include "frontends/qt/PaneHandle.h"
#include "frontends/qt/ShownText.h"

#include <Zandor/qt/Text.h>
#include <Zandor/qt/Twips.h>

#include <QAccessible>
#include <QContextMenuEvent>
#include <QDropEvent>
#include <QHeaderView>
#include <QHelpEvent>
#include <QPointer>
#include <QScrollBar>
#include <QToolTip>

namespace zandor::platform::qt {

namespace {

constexpr float designWidth = 1500; ///< twips
constexpr int textMargin = 8;

/// Opens up what scrolling by whole columns needs.
class TableView : public QTableView {
public:
    using QTableView::QTableView;
    using QTableView::updateGeometries;
};

void prepareHeader(QHeaderView& header) {
    header.setMinimumSectionSize(0);
    header.setSectionsClickable(false);
    header.setHighlightSections(false);
    header.setTextElideMode(Qt::ElideRight);
}

} // namespace

GridWidget::GridWidget(int rows, int cols, QWidget* parent)
    : QWidget(parent), mModel(new GridModel(rows, cols, this)), mHandle(new PaneHandle(this)) {
    setAcceptDrops(true);
    for (int col = 0; col < cols; ++col) mModel->setWidth(col, designWidth);
    makeViewIfNeeded();
    fitColumnsToFont();
    if (mView) measure();
}

void GridWidget::makeView() {
    // A window that is being destroyed takes no new children.
    if (mEnding) mViewAtTheEnd = std::make_unique<TableView>();
    mView = mEnding ? mViewAtTheEnd.get() : new TableView(this);
    mTitles = new FieldTitles(*this, mView);
    mGestures.emplace(*mTitles);
    mGestures->setListener(mListener);
    mCorner = new GridCorner(*mModel, mView);
    if (!mEnding) setFocusProxy(mView);
    mView->setFocusPolicy(Qt::ClickFocus);
    mView->setHorizontalHeader(mTitles);
    mView->setVerticalHeader(new RowTitles(mView));
    mCorner->raise();
    mView->setItemDelegate(new GridCellDelegate(*this, *mView));
    // Fixed before there is a model, whose texts would be measured for their size.
    mView->horizontalHeader()->setFixedHeight(0);
    mView->verticalHeader()->setFixedWidth(0);
    mView->setModel(mModel);
    mView->setFrameShape(QFrame::NoFrame);
    mView->setEditTriggers(QTableView::NoEditTriggers);
    mView->setSelectionMode(QTableView::NoSelection); // the current cell has a frame instead
    mView->setAutoScroll(false);
    mView->setHorizontalScrollMode(QTableView::ScrollPerItem);
    mView->setVerticalScrollMode(QTableView::ScrollPerItem);
    mView->setCornerButtonEnabled(false);
    mView->setWordWrap(false);
    mView->setTextElideMode(Qt::ElideRight);
    mView->setTabKeyNavigation(false);
    prepareHeader(*mView->horizontalHeader());
    prepareHeader(*mView->verticalHeader());
    mView->verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    mView->setAccessibleName(mName);

    mView->installEventFilter(this);
    for (QWidget* part : {mView->viewport(), mView->horizontalHeader()->viewport(),
                          mView->verticalHeader()->viewport(), static_cast<QWidget*>(mCorner)})
        part->installEventFilter(this);
    const auto scrolled = [this] {
        if (mListener) mListener->scrolled();
    };
    connect(mView->horizontalScrollBar(), &QScrollBar::valueChanged, this, scrolled);
    connect(mView->verticalScrollBar(), &QScrollBar::valueChanged, this, scrolled);
    connect(mView->horizontalHeader(), &QHeaderView::sectionResized, this,
            [this](int section, int, int size) {
                if (mRefreshing) return;
                mModel->setWidth(section + 1, toTwips(size));
                mResized = section + 1;
            });
    connect(mTitles, &QHeaderView::sectionHandleDoubleClicked, this, [this](int section) {
        mResized = 0;
        if (mListener) mListener->borderDoubleClicked(section + 1);
    });
    connect(mView->selectionModel(), &QItemSelectionModel::currentChanged, this,
            [this](const QModelIndex& current) {
                if (mRefreshing || !current.isValid()) return;
                mRow = current.row() + 1;
                mCol = current.column() + 1;
            });
    // In a host that is dressed already they are told of no change.
    for (GridHeader* header : {&fields(), &titles()}) {
        header->ensurePolished();
        header->dropFrame();
    }
    mHandle->raise();
    arrange();
    if (!mEnding) mView->show();
}

void GridWidget::makeViewIfNeeded() {
    if (!mView && haveOwnLooks(*this, {"QTableView", "QHeaderView", "QAbstractItemView",
                                       "QAbstractScrollArea", "QFrame"}))
        makeView();
}

QTableView& GridWidget::view() const {
    // It shows what the grid has to show anyway.
    if (!mView) {
        auto& self = *const_cast<GridWidget*>(this);
        self.makeView();
        self.measure();
        // A view without a current cell takes the first for it as soon as it has the focus.
        bringUpToDate();
    }
    return *mView;
}

void GridWidget::setVisible(bool visible) {
    if (visible) view();
    if (visible) bringUpToDate();
    QWidget::setVisible(visible);
}

GridHeader& GridWidget::fields() const {
    return static_cast<GridHeader&>(*view().horizontalHeader());
}

GridHeader& GridWidget::titles() const {
    return static_cast<GridHeader&>(*view().verticalHeader());
}

void GridWidget::setListener(GridListener* listener) {
    mListener = listener;
    if (mGestures) mGestures->setListener(listener);
}

void GridWidget::setWords(const Words& words) {
    mName = toQt(words.Grid);
    if (mView) mView->setAccessibleName(mName);
    mOffer = toQt(words.AddField);
    mModel->setWords(words);
    mHandle->setWords(words);
    touch();
}

void GridWidget::measure() {
    const QString sample = QStringLiteral("Xg");
    mView->ensurePolished();
    QStyleOptionViewItem cell;
    cell.initFrom(mView);
    cell.features = QStyleOptionViewItem::HasDisplay;
    cell.text = sample;
    const QSize inCell = style()->sizeFromContents(QStyle::CT_ItemViewItem, &cell, {}, mView);
    mRowHeight =
        std::max({fontMetrics().height() + 8, mView->fontMetrics().height() + 8, inCell.height(),
                  fields().sizeFor(sample).height(), titles().sizeFor(sample).height()});
    titles().setDefaultSectionSize(mRowHeight);
    fields().setFixedHeight(mRowHeight);
    touch();
}

qreal GridWidget::textWidth(const QString& text) const {
    const qreal plain = QFontMetricsF(font()).horizontalAdvance(text);
    const bool styled = mView && fields().testAttribute(Qt::WA_StyleSheet);
    return styled ? std::max<qreal>(plain, fields().sizeFor(text).width()) : plain;
}

void GridWidget::fitColumnsToFont() {
    // The longest word that the control itself writes, roughly.
    const QString word = QStringLiteral("Descending");
    const Sample before = std::exchange(mSample, {});
    int widest = fontMetrics().horizontalAdvance(word);
    if (mView)
        widest = std::max({widest, mView->fontMetrics().horizontalAdvance(word),
                           fields().fontMetrics().horizontalAdvance(word)});
    mSample.text = widest;
    mSample.around = std::max<qreal>(0, textWidth(word) - mSample.text);
    const qreal design = toPixels(designWidth);
    for (int col = 1; col < mModel->cols(); ++col) {
        const qreal width = mModel->width(col) / twipsPerPixel;
        const qreal fitted =
            before.text > 0 ? (width - before.around) * mSample.text / before.text + mSample.around
                            : std::max(design, mSample.text + mSample.around + 3 * textMargin);
        if (std::abs(fitted - width) >= 0.5) mModel->setWidth(col, toTwips(std::max(0.0, fitted)));
    }
    touch();
}

void GridWidget::touch() {
    if (!mView || std::exchange(mStale, true)) return;
    QMetaObject::invokeMethod(
        this, [this] { bringUpToDate(); }, Qt::QueuedConnection);
}

void GridWidget::setCurrentCell(int row, int col) {
    mRow = row;
    mCol = col;
    touch();
}

void GridWidget::bringUpToDate() const {
    // Showing what is already so is no change of the grid, whatever the view has to do for it.
    if (mStale) const_cast<GridWidget*>(this)->refresh();
}

void GridWidget::refresh() {
    mStale = false;
    mRefreshing = true;
    fitLabels();
    QHeaderView& header = *mView->horizontalHeader();
    bool resized = false;
    for (int col = 1; col < mModel->cols(); ++col) {
        if (header.sectionSize(col - 1) == columnWidth(col)) continue;
        header.resizeSection(col - 1, columnWidth(col));
        resized = true;
    }
    if (resized) static_cast<TableView*>(mView)->updateGeometries();
    // A field is in none of the view's rows; the one below keeps its column for the view.
    if (mCol > 0)
        mView->setCurrentIndex(mModel->index(std::max(mRow, 1) - 1, mCol - 1));
    else
        mView->selectionModel()->clear();
    mModel->announce();
    mCorner->update();
    mRefreshing = false;
}

void GridWidget::setLabelWidth(float twips) {
    mLabelWidthSet = true;
    mModel->setWidth(0, twips);
    touch();
}

void GridWidget::fitLabels() {
    if (!mLabelWidthSet) {
        int widest = 0;
        for (int row = 0; row < mModel->rows(); ++row)
            widest =
                std::max({widest, titles().fontMetrics().horizontalAdvance(mModel->text(row, 0)),
                          static_cast<int>(textWidth(mModel->text(row, 0)))});
        mModel->setWidth(0, toTwips(std::max(widest + 2 * textMargin + 4, 70)));
    }
    const int width = columnWidth(0);
    mView->verticalHeader()->setFixedWidth(width);
    mCorner->setGeometry({mView->contentsRect().topLeft(), QSize(width, mRowHeight)});
}

int GridWidget::firstRow() const {
    QTableView& shown = view();
    bringUpToDate();
    return shown.verticalHeader()->visualIndexAt(0) + 1;
}

int GridWidget::firstCol() const {
    QTableView& shown = view();
    bringUpToDate();
    return shown.horizontalHeader()->visualIndexAt(0) + 1;
}

int GridWidget::columnWidth(int col) const { return toPixels(mModel->width(col)); }

QRect GridWidget::cellRect(int row, int col) const {
    view();
    bringUpToDate();
    QRect cell(0, 0, columnWidth(col), mRowHeight);
    if (col > 0)
        cell.moveLeft(columnWidth(0) + fields().sectionPosition(col - 1) - fields().offset());
    if (row > 0) cell.moveTop(mRowHeight * row - titles().offset());
    return cell.translated(mView->pos() + mView->contentsRect().topLeft());
}

void GridWidget::showHandle(bool shown) {
    mHandle->setVisible(shown);
    arrange();
}

void GridWidget::arrange() {
    const int above = mHandle->isHidden() ? 0 : PaneHandle::thickness;
    mHandle->setGeometry(0, 0, width(), PaneHandle::thickness);
    if (mView) mView->setGeometry(rect().adjusted(0, above, 0, 0));
}

void GridWidget::resizeEvent(QResizeEvent*) { arrange(); }

void GridWidget::changeEvent(QEvent* event) {
    QWidget::changeEvent(event);
    if (event->type() != QEvent::FontChange && event->type() != QEvent::StyleChange) return;
    makeViewIfNeeded();
    if (!mView) return fitColumnsToFont();
    // Qt hands a font down a list of children in which a view moves its scroll bars meanwhile, and
    // so may miss a part.
    for (QWidget* part : {static_cast<QWidget*>(&fields()), static_cast<QWidget*>(&titles()),
                          static_cast<QWidget*>(mCorner)})
        if (!part->testAttribute(Qt::WA_StyleSheet)) part->setFont(QFont());
    measure();
    fitColumnsToFont();
}

bool GridWidget::eventFilter(QObject* watched, QEvent* event) {
    auto* part = static_cast<QWidget*>(watched);
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseButtonRelease:
        if (part != mView) return mouse(part, static_cast<QMouseEvent*>(event));
        break;
    case QEvent::FocusIn:
    case QEvent::FocusOut:
        if (part != mView) break;
        mTitles->viewport()->update();
        if (event->type() == QEvent::FocusOut && mListener) mListener->left();
        break;
    case QEvent::InputMethod:
        if (part != mView || !mListener) break;
        return mListener->composed(static_cast<QInputMethodEvent&>(*event));
    case QEvent::InputMethodQuery:
        if (part != mView || !mListener) break;
        mListener->asked(static_cast<QInputMethodQueryEvent&>(*event));
        return true;
    case QEvent::MouseMove:
        if (part == mTitles->viewport()) mGestures->moved(static_cast<QMouseEvent&>(*event));
        // No selecting along the way of a held button; headers need it for their widths.
        if (part == mView->viewport()) return true;
        break;
    case QEvent::KeyPress:
        if (part != mView) break;
        if (QWidget* const box = mListener ? mListener->composer() : nullptr)
            return QCoreApplication::sendEvent(box, event), true;
        return keyPressed(*static_cast<QKeyEvent*>(event));
        break;
    case QEvent::ContextMenu:
        // The mouse opens the control's menu on release, and the host is to open none of its own.
        if (static_cast<QContextMenuEvent*>(event)->reason() == QContextMenuEvent::Mouse)
            return true;
        // The menu key has no release.
        if (part != mView) break;
        openMenu();
        return true;
    case QEvent::ToolTip:
        if (part != mView) return toolTip(part, *static_cast<QHelpEvent*>(event));
        break;
    default: break;
    }
    return QWidget::eventFilter(watched, event);
}

bool GridWidget::mouse(QWidget* part, QMouseEvent* event) {
    const bool body = part == mView->viewport();
    const bool pressed = event->type() != QEvent::MouseButtonRelease;
    const QModelIndex index = mView->indexAt(event->position().toPoint());
    if (body && pressed && event->button() == Qt::LeftButton && index.isValid()) {
        bringUpToDate();
        mView->setCurrentIndex(index);
    }
    const QPointF at = part->mapTo(this, event->position());
    const bool field = part == mTitles->viewport();
    if (field && pressed) mGestures->pressed(*event);
    const QPointer<GridWidget> alive = this;
    if (mListener && pressed)
        mListener->pressed(event->button(), event->modifiers(), at);
    else if (mListener)
        mListener->released(event->button(), event->modifiers(), at);
    if (!alive || !field || pressed) return body;
    if (const int resized = std::exchange(mResized, 0); resized > 0 && mListener)
        mListener->borderDragged(resized);
    if (alive) mGestures->released(*event);
    return false;
}

int GridWidget::offeredColumn() const {
    if (!mListener || !mListener->offersFields()) return 0;
    int last = mModel->cols() - 1;
    if (!mModel->text(0, last).isEmpty()) return 0;
    while (last > 0 && mModel->text(0, last).isEmpty()) --last;
    return last + 1;
}

void GridWidget::offerAnew() {
    const int offered = offeredColumn();
    if (std::exchange(mOffered, offered) != offered && mTitles) mTitles->viewport()->update();
}

void GridWidget::walkTo(int row, int col) {
    setCurrentCell(row, std::clamp(col, 1, mModel->cols() - 1));
    showCurrentCell();
    if (row > 0) return;
    // To the view this is no change of its current cell, so nobody else tells.
    QAccessibleEvent focus(mView, QAccessible::Focus);
    focus.setChild(mCol); // after the corner, the head of each column
    QAccessible::updateAccessibility(&focus);
}

/// The keys that lead to the fields, along them and back.
bool GridWidget::walkFields(const QKeyEvent& event) {
    if (modifiersOf(event) != Qt::NoModifier) return false;
    if (mRow == 1 && event.key() == Qt::Key_Up && mListener->offersFields())
        return walkTo(0, mCol), true;
    if (mRow != 0 || mCol == 0) return false;
    switch (event.key()) {
    case Qt::Key_Up: return true;
    case Qt::Key_Down: return walkTo(1, mCol), true;
    case Qt::Key_Left: return walkTo(0, mCol - 1), true;
    case Qt::Key_Right: return walkTo(0, mCol + 1), true;
    case Qt::Key_Home: return walkTo(0, 1), true;
    case Qt::Key_End: return walkTo(0, mModel->cols() - 1), true;
    default: return false;
    }
}

void GridWidget::showCurrentCell() {
    view();
    bringUpToDate();
    const QModelIndex shown = mModel->index(std::max(mRow, 1) - 1, std::max(mCol, 1) - 1);
    mView->scrollTo(shown);
}

QPointF GridWidget::middleOfCurrentCell() {
    showCurrentCell();
    return QRectF(cellRect(mRow, mCol)).center();
}

bool GridWidget::keyPressed(QKeyEvent& event) {
    if (!mListener) return false;
    const bool plain = modifiersOf(event) == Qt::NoModifier;
    if (isMenuKey(event)) {
        openMenu();
        return true;
    }
    if (event.key() == Qt::Key_Delete && plain) {
        mListener->deleteKey(middleOfCurrentCell());
        return true;
    }
    if (event.key() == Qt::Key_Escape && mGestures->cancel()) return true;
    if (walkFields(event)) return true;
    if (modifiersOf(event) == Qt::AltModifier && arrowOf(event).x() != 0)
        return mListener->moveKey(arrowOf(event).x());
    if (isTyping(event)) return mListener->typed(event);
    if (event.key() != Qt::Key_F2 && !isEnter(event)) return false;
    if (mListener->editKey()) return true;
    // For the keyboard, what a click on the current cell is for the mouse.
    const QPointF middle = middleOfCurrentCell();
    const QPointer<GridWidget> alive = this;
    mListener->pressed(Qt::LeftButton, Qt::NoModifier, middle);
    if (alive && mListener) mListener->released(Qt::LeftButton, Qt::NoModifier, middle);
    return true;
}

void GridWidget::openMenu() {
    if (!mListener) return;
    const QPointF middle = middleOfCurrentCell();
    mListener->menuKey(middle, mapToGlobal(middle.toPoint()));
}

bool GridWidget::toolTip(QWidget* part, const QHelpEvent& help) {
    const QPoint at = part->mapTo(this, help.pos());
    for (int row = 0; row < mModel->rows(); ++row) {
        for (int col = 0; col < mModel->cols(); ++col) {
            // The fixed cells lie over those that have been scrolled below them.
            const bool fixedRow = at.y() <= mView->y() + mCorner->geometry().bottom();
            const bool fixedCol = at.x() <= mCorner->geometry().right();
            if (fixedRow != (row == 0) || fixedCol != (col == 0)) continue;
            const QRect cell = cellRect(row, col);
            if (!cell.contains(at)) continue;
            const QRect place(part->mapFrom(this, cell.topLeft()), cell.size());
            if (const QString& note = mModel->note(row, col); !note.isEmpty())
                return QToolTip::showText(help.globalPos(), asToolTip(note), part, place), true;
            showElisionToolTip(help, *part, mModel->text(row, col), font(),
                               place.adjusted(textMargin / 2, 0, -textMargin / 2, 0));
            return true;
        }
    }
    return true;
}

void GridWidget::dragEnterEvent(QDragEnterEvent* event) {
    event->setAccepted(mListener && mListener->dragAccepted(event->mimeData()));
}

void GridWidget::dragMoveEvent(QDragMoveEvent* event) {
    event->setAccepted(mListener && mListener->dragAccepted(event->mimeData()));
}

void GridWidget::dropEvent(QDropEvent* event) {
    event->setAccepted(mListener && mListener->dropped(event->mimeData(), event->position()));
}

} // namespace zandor::platform::qt
