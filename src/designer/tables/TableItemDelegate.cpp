#include "designer/tables/TableItemDelegate.h"

#include "designer/tables/TableListModel.h"

#include <QApplication>
#include <QPainter>

namespace zandor::designer {

namespace {

constexpr int iconSize = 16;
constexpr int gap = 6;

/// Rows below a head; of a view the frame is broken, for it has no rows of its own.
void paintIcon(QPainter& painter, const QRect& place, bool isView, const QColor& line,
               const QColor& head) {
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    const QRectF frame = QRectF(place).adjusted(1.5, 2.5, -1.5, -2.5);
    const QRectF title(frame.left(), frame.top(), frame.width(), 3);
    painter.fillRect(title, head);
    QPen pen(line, 1);
    if (isView) pen.setDashPattern({2, 1.5});
    painter.setPen(pen);
    painter.drawRoundedRect(frame, 1.5, 1.5);
    painter.setRenderHint(QPainter::Antialiasing, false);
    if (!isView) {
        const QColor inner(line.red(), line.green(), line.blue(), 130);
        painter.setPen(inner);
        painter.drawLine(QPointF(frame.left() + 1, frame.top() + 6),
                         QPointF(frame.right() - 1, frame.top() + 6));
        painter.drawLine(QPointF(frame.left() + 4, frame.top() + 3),
                         QPointF(frame.left() + 4, frame.bottom() - 1));
    }
    painter.restore();
}

} // namespace

void TableItemDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                              const QModelIndex& index) const {
    QStyleOptionViewItem item = option;
    initStyleOption(&item, index);
    const QString name = std::exchange(item.text, QString());
    const QStyle* const style = item.widget ? item.widget->style() : QApplication::style();
    style->drawControl(QStyle::CE_ItemViewItem, &item, painter, item.widget);

    const bool selected = item.state & QStyle::State_Selected;
    const auto group = item.state & QStyle::State_Active ? QPalette::Active : QPalette::Inactive;
    const QColor text =
        item.palette.color(group, selected ? QPalette::HighlightedText : QPalette::Text);
    QColor dim = text;
    dim.setAlphaF(0.6F);
    const QColor head = selected ? text : item.palette.color(QPalette::Highlight);

    QRect rest = item.rect.adjusted(gap, 0, -gap, 0);
    const QRect icon(rest.left(), rest.center().y() - iconSize / 2 + 1, iconSize, iconSize);
    paintIcon(*painter, icon, index.data(TableListModel::IsViewRole).toBool(), dim, head);
    rest.setLeft(icon.right() + gap);
    painter->save();
    painter->setFont(item.font);
    const auto write = [&](const QString& words, const QColor& colour) {
        painter->setPen(colour);
        painter->drawText(rest, Qt::AlignVCenter | Qt::AlignLeft,
                          item.fontMetrics.elidedText(words, Qt::ElideRight, rest.width()));
        rest.setLeft(rest.left() + item.fontMetrics.horizontalAdvance(words) + gap);
    };
    write(name, text);
    const QString schema = index.data(TableListModel::SchemaRole).toString();
    if (!schema.isEmpty() && rest.width() > 2 * gap) write(schema, dim);
    painter->restore();
}

QSize TableItemDelegate::sizeHint(const QStyleOptionViewItem& option, const QModelIndex&) const {
    // The width is the list's.
    return {iconSize, std::max(option.fontMetrics.height(), iconSize) + gap};
}

} // namespace zandor::designer
