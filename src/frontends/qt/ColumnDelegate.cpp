#include "frontends/qt/ColumnDelegate.h"

#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/Images.h"
#include "frontends/qt/OutputMarker.h"
#include "frontends/qt/ShownText.h"

#include <QApplication>
#include <QPainter>

namespace zandor::platform::qt {

namespace {

int gutter(const QFontMetrics& metrics) { return metrics.height() + 4; }

} // namespace

QRect ColumnDelegate::textPlace(const QRect& entry, const QFontMetrics& metrics, bool comesOut) {
    return entry.adjusted(gutter(metrics), 0, comesOut ? -gutter(metrics) : -3, 0);
}

void ColumnDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                           const QModelIndex& index) const {
    paintEntry(*painter, option, index);
}

void ColumnDelegate::paintEntry(QPainter& painter, const QStyleOptionViewItem& option,
                                const QModelIndex& index) {
    QStyleOptionViewItem item = option;
    item.index = index;
    // Nothing is cut off from the selection: it goes over the gutter, too.
    item.showDecorationSelected = true;
    const QStyle* style = item.widget ? item.widget->style() : QApplication::style();
    style->drawPrimitive(QStyle::PE_PanelItemViewItem, &item, &painter, item.widget);

    const bool selected = item.state & QStyle::State_Selected;
    const QPalette::ColorGroup group = !(item.state & QStyle::State_Enabled) ? QPalette::Disabled
                                       : item.state & QStyle::State_Active   ? QPalette::Active
                                                                             : QPalette::Inactive;
    const QColor colour =
        item.palette.color(group, selected ? QPalette::HighlightedText : QPalette::Text);
    const qreal side = item.fontMetrics.height() - 2;
    const qreal top = item.rect.center().y() + 0.5 - side / 2;
    if (const QVariant picture = index.data(ColumnListModel::pictureRole); picture.isValid()) {
        QColor softer = colour;
        if (!selected) softer.setAlphaF(0.75F);
        paintPicture(painter, static_cast<Picture>(picture.toInt()),
                     {item.rect.left() + 3.0, top, side, side}, softer);
    }
    const bool comesOut = index.data(ColumnListModel::outputRole).toBool();
    if (comesOut)
        paintOutputMarker(painter, {item.rect.right() - side - 1, top, side, side}, colour);
    const QRect place = textPlace(item.rect, item.fontMetrics, comesOut);
    painter.setFont(item.font);
    painter.setPen(colour);
    painter.setLayoutDirection(asItReads);
    painter.drawText(
        place, static_cast<int>(atTheLeft) | Qt::TextSingleLine,
        item.fontMetrics.elidedText(index.data().toString(), Qt::ElideRight, place.width()));
    if (item.state & QStyle::State_HasFocus) {
        QStyleOptionFocusRect focus;
        focus.QStyleOption::operator=(item);
        focus.state |= QStyle::State_KeyboardFocusChange | QStyle::State_Item;
        focus.backgroundColor =
            item.palette.color(group, selected ? QPalette::Highlight : QPalette::Base);
        style->drawPrimitive(QStyle::PE_FrameFocusRect, &focus, &painter, item.widget);
    }
}

QSize ColumnDelegate::sizeHint(const QStyleOptionViewItem& option, const QModelIndex&) const {
    return {gutter(option.fontMetrics), rowHeight(option.fontMetrics)};
}

} // namespace zandor::platform::qt
