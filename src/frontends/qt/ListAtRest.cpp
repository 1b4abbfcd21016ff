#include "frontends/qt/ListAtRest.h"

#include "frontends/qt/ColumnDelegate.h"
#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/OwnLooks.h"

#include <QPainter>
#include <QStyleOptionSlider>

namespace zandor::platform::qt {

namespace {

constexpr QStyle::State touched =
    QStyle::State_MouseOver | QStyle::State_HasFocus | QStyle::State_Window;

/// The bar of a list that shows its beginning, as small as the style has it.
QStyleOptionSlider barOf(const QWidget& box) {
    QStyleOptionSlider bar;
    bar.initFrom(&box);
    bar.state &= ~touched;
    bar.styleObject = nullptr;
    bar.subControls = QStyle::SC_All;
    bar.orientation = Qt::Vertical;
    const QStyle& style = *box.style();
    const int thick = style.pixelMetric(QStyle::PM_ScrollBarExtent, &bar, &box);
    const int shortest = style.pixelMetric(QStyle::PM_ScrollBarSliderMin, &bar, &box);
    bar.rect.setSize(
        style.sizeFromContents(QStyle::CT_ScrollBar, &bar, {thick, 2 * thick + shortest}, &box));
    bar.rect.moveTopLeft({});
    return bar;
}

} // namespace

bool canStandForList(const QWidget& box, const QRect& place) {
    if (box.isRightToLeft() ||
        haveOwnLooks(box, {"QListView", "QAbstractItemView", "QAbstractScrollArea", "QFrame"}))
        return false;
    const QStyle& style = *box.style();
    if (style.styleHint(QStyle::SH_ScrollBar_Transient, nullptr, &box) ||
        style.pixelMetric(QStyle::PM_ScrollView_ScrollBarOverlap, nullptr, &box) != 0)
        return false;
    const QSize least = barOf(box).rect.size();
    return place.width() >= least.width() && place.height() >= least.height();
}

void paintListAtRest(QPainter& painter, const QWidget& box, const QRect& place,
                     const ColumnListModel& model) {
    const int row = ColumnDelegate::rowHeight(box.fontMetrics());
    const int all = row * model.rowCount();
    QRect entries = place;
    painter.save();
    if (all > place.height()) {
        QStyleOptionSlider bar = barOf(box);
        bar.rect.setHeight(place.height());
        bar.maximum = all - place.height();
        bar.pageStep = place.height();
        bar.singleStep = row;
        entries.setWidth(place.width() - bar.rect.width());
        painter.translate(entries.topRight() + QPoint(1, 0));
        painter.setClipRect(bar.rect);
        box.style()->drawComplexControl(QStyle::CC_ScrollBar, &bar, &painter, &box);
        painter.restore();
        painter.save();
    }
    painter.setClipRect(entries);
    painter.translate(entries.topLeft());
    QStyleOptionViewItem entry;
    entry.initFrom(&box);
    entry.state &= ~(touched | QStyle::State_Active); // as of any list without the focus
    if (entry.state & QStyle::State_Enabled) entry.palette.setCurrentColorGroup(QPalette::Normal);
    entry.font = box.font();
    entry.widget = &box;
    for (int n = 0; n < model.rowCount() && n * row < entries.height(); ++n) {
        entry.rect = {0, n * row, entries.width(), row};
        ColumnDelegate::paintEntry(painter, entry, model.index(n));
    }
    painter.restore();
}

} // namespace zandor::platform::qt
