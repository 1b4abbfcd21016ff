#include "frontends/qt/PickListWidget.h"

#include "frontends/qt/KeyCodes.h"
#include "frontends/qt/ShownText.h"

#include <Zandor/qt/Text.h>
#include <Zandor/qt/Twips.h>

#include <QApplication>
#include <QKeyEvent>
#include <QLineEdit>
#include <QListView>
#include <QPainter>
#include <QScrollBar>
#include <QSortFilterProxyModel>
#include <QStringListModel>
#include <QVBoxLayout>

namespace zandor::platform::qt {

namespace {

constexpr int mostRows = 12;
constexpr int fewestRows = 4;
constexpr QSize widths(220, 420); // least and most, logical pixels
constexpr int frame = 2;

/// The items that hold every word typed, in whatever order and case.
class Filter : public QSortFilterProxyModel {
public:
    using QSortFilterProxyModel::QSortFilterProxyModel;

    void setTyped(const QString& typed) {
        mWords = typed.split(QLatin1Char(' '), Qt::SkipEmptyParts);
        invalidateFilter();
    }

protected:
    bool filterAcceptsRow(int row, const QModelIndex& parent) const override {
        const QString item = sourceModel()->index(row, 0, parent).data().toString();
        return std::all_of(mWords.begin(), mWords.end(), [&](const QString& word) {
            return item.contains(word, Qt::CaseInsensitive);
        });
    }

private:
    QStringList mWords;
};

} // namespace

PickListWidget::PickListWidget(QWidget* parent, Picked picked)
    : QFrame(parent), mPicked(std::move(picked)), mItems(new QStringListModel(this)),
      mLeft(new Filter(this)), mBox(new QLineEdit), mList(new QListView) {
    hide();
    // Opaque, so that showing it never makes what lies below paint itself.
    setAutoFillBackground(true);
    mLeft->setSourceModel(mItems);
    mBox->setFrame(false);
    mBox->installEventFilter(this);
    mList->setModel(mLeft);
    mList->setFrameShape(QFrame::NoFrame);
    mList->setEditTriggers(QListView::NoEditTriggers);
    mList->setUniformItemSizes(true);
    mList->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    mList->setTextElideMode(Qt::ElideMiddle);
    mList->setFocusPolicy(Qt::NoFocus); // the keys stay with the box
    setFocusProxy(mBox);
    auto* const layout = new QVBoxLayout(this);
    layout->setContentsMargins(frame, frame, frame, frame);
    layout->setSpacing(0);
    layout->addWidget(mBox);
    layout->addWidget(mList, 1);

    connect(mBox, &QLineEdit::textEdited, this, [this](const QString& typed) {
        static_cast<Filter*>(mLeft)->setTyped(typed);
        chooseFirst();
    });
    connect(mList, &QListView::clicked, this, &PickListWidget::pick);
    connect(qApp, &QApplication::focusChanged, this, [this](const QWidget*, const QWidget* to) {
        if (isVisible() && to && to != mBox && to->window() == window() && mClose) mClose();
    });
}

void PickListWidget::setWords(const platform::Words& words) {
    mBox->setPlaceholderText(toQt(words.FindField));
    mBox->setAccessibleName(toQt(words.Field));
    mList->setAccessibleName(toQt(words.Fields));
}

void PickListWidget::open(const QRect& over, const QStringList& items, const QString& typed,
                          int position) {
    mItems->setStringList(items);
    static_cast<Filter*>(mLeft)->setTyped(typed);
    mBox->setText(typed);
    mList->setMinimumHeight(0);
    stand(over);
    show();
    raise();
    const QModelIndex current = mLeft->mapFromSource(mItems->index(position));
    if (!current.isValid()) return chooseFirst();
    mList->setCurrentIndex(current);
    mList->scrollTo(current, QListView::PositionAtCenter);
}

/// Below the upper edge of a place, as high as the items need and the surface has room for.
void PickListWidget::stand(const QRect& over) {
    const int row =
        mList->sizeHintForRow(0) > 0 ? mList->sizeHintForRow(0) : fontMetrics().height();
    const int box = mBox->sizeHint().height();
    const auto height = [&](int rows) { return box + rows * row + 2 * frame; };
    const int room = parentWidget()->height() - over.top();
    const int most = std::min<int>(mostRows, std::max(1, mItems->rowCount()));
    const int rows =
        std::clamp((room - height(0)) / std::max(1, row), std::min(fewestRows, most), most);
    const int wanted = mList->sizeHintForColumn(0) +
                       mList->verticalScrollBar()->sizeHint().width() + 2 * frame + 8;
    const int width = std::max(over.width(), std::clamp(wanted, widths.width(), widths.height()));
    const int left = std::clamp(over.left(), 0, std::max(0, parentWidget()->width() - width));
    const int top = std::clamp(over.top(), 0, std::max(0, parentWidget()->height() - height(rows)));
    setGeometry(left, top, width, height(rows));
}

/// The first one whose name begins so: what stands behind the table's.
void PickListWidget::chooseFirst() {
    const QString typed = mBox->text().trimmed();
    int first = 0;
    for (int row = 0; row < mLeft->rowCount() && !typed.isEmpty(); ++row) {
        const QString item = mLeft->index(row, 0).data().toString();
        if (!item.section(QLatin1Char('.'), 1).startsWith(typed, Qt::CaseInsensitive)) continue;
        first = row;
        break;
    }
    mList->setCurrentIndex(mLeft->index(first, 0));
}

bool PickListWidget::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::ShortcutOverride) {
        auto& key = static_cast<QKeyEvent&>(*event);
        // The host's shortcuts on these have to wait.
        if (!isEnter(key) && key.key() != Qt::Key_Escape)
            return QFrame::eventFilter(watched, event);
        key.accept();
        return true;
    }
    if (event->type() == QEvent::KeyPress && keyPressed(static_cast<QKeyEvent&>(*event)))
        return true;
    return QFrame::eventFilter(watched, event);
}

bool PickListWidget::keyPressed(const QKeyEvent& event) {
    const int page = std::max(1, mList->height() / std::max(1, mList->sizeHintForRow(0)));
    const auto walk = [this](int by) {
        const int row =
            std::clamp(mList->currentIndex().row() + by, 0, std::max(0, mLeft->rowCount() - 1));
        mList->setCurrentIndex(mLeft->index(row, 0));
        return true;
    };
    if (isEnter(event)) return pick(mList->currentIndex()), true;
    switch (event.key()) {
    case Qt::Key_Tab: return pick(mList->currentIndex()), true;
    case Qt::Key_Escape:
    case Qt::Key_Backtab:
        if (mClose) mClose();
        return true;
    case Qt::Key_Up: return walk(-1);
    case Qt::Key_Down: return walk(1);
    case Qt::Key_PageUp: return walk(-page);
    case Qt::Key_PageDown: return walk(page);
    default: return false;
    }
}

void PickListWidget::pick(const QModelIndex& index) {
    const int position = mLeft->mapToSource(index).row();
    if (position < 0) return;
    // Copies: closing and what is told may end the list.
    const Picked picked = mPicked;
    if (mClose) mClose();
    if (picked) picked(position);
}

void PickListWidget::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setPen(QPen(palette().color(QPalette::Highlight), 1));
    painter.setRenderHint(QPainter::Antialiasing);
    painter.drawRect(QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5));
}

PickListAdapter::PickListAdapter(PickListWidget* widget, FocusTracker& focus)
    : Adapter(widget, focus) {
    widget->setClose([this] { show(false); });
}

void PickListAdapter::Open(const Bounds& over, const std::vector<String>& items,
                           const String& typed, std::int32_t position) {
    if (!mWidget) return;
    QStringList names;
    for (const String& item : items) names += asSigns(toQt(item));
    mWidget->open(toPixels(over), names, toQt(typed), position);
    if (mWidget->box().isVisible()) mFocus.take(&mWidget->box());
}

} // namespace zandor::platform::qt
