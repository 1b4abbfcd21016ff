#include "platform/qt/GridCells.h"

#include "platform/qt/FocusFrame.h"
#include "platform/qt/ShownText.h"

#include <QEvent>
#include <QPainter>
#include <QTableView>

namespace platform::qt {

GridCellDelegate::GridCellDelegate(QTableView& view) : QStyledItemDelegate(&view), mView(view) {}

void GridCellDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                             const QModelIndex& index) const {
    QStyleOptionViewItem cell = option;
    cell.state &= ~QStyle::State_HasFocus;
    QStyledItemDelegate::paint(painter, cell, index);
    if (index != mView.currentIndex()) return;
    if (mView.hasFocus()) return paintFocusFrame(*painter, option.rect, option.palette);
    QColor thin = option.palette.color(QPalette::Active, QPalette::Highlight);
    thin.setAlphaF(0.6F);
    painter->save();
    painter->setPen(thin);
    painter->setBrush(Qt::NoBrush);
    painter->drawRect(option.rect.adjusted(0, 0, -1, -1));
    painter->restore();
}

void paintFixedCell(QPainter& painter, QStyleOptionHeader option, const QWidget& widget) {
    const QStyle& style = *widget.style();
    style.drawControl(QStyle::CE_HeaderSection, &option, &painter, &widget);
    option.textAlignment |= Qt::AlignAbsolute;
    painter.setLayoutDirection(asItReads);
    option.rect.adjust(cellMargin, 0, -cellMargin, 0);
    option.text = option.fontMetrics.elidedText(option.text, Qt::ElideRight, option.rect.width());
    style.drawControl(QStyle::CE_HeaderLabel, &option, &painter, &widget);
}

QSize GridHeader::sizeFor(const QString& text) const {
    ensurePolished();
    QStyleOptionHeader option;
    initStyleOption(&option);
    option.section = 0;
    option.text = text;
    return style()->sizeFromContents(QStyle::CT_HeaderSection, &option, {}, this);
}

void GridHeader::changeEvent(QEvent* event) {
    QHeaderView::changeEvent(event);
    if (event->type() != QEvent::StyleChange || !testAttribute(Qt::WA_StyleSheet)) return;
    if (styleSheet().isEmpty())
        setStyleSheet(QStringLiteral("QHeaderView { border: 0; padding: 0; margin: 0 }"));
}

void RowTitles::paintSection(QPainter* painter, const QRect& place, int section) const {
    QStyleOptionHeader option;
    initStyleOption(&option);
    option.rect = place;
    option.section = section;
    option.text = model()->headerData(section, orientation(), Qt::DisplayRole).toString();
    option.textAlignment = atTheLeft;
    option.position = count() == 1            ? QStyleOptionHeader::OnlyOneSection
                      : section == 0          ? QStyleOptionHeader::Beginning
                      : section + 1 < count() ? QStyleOptionHeader::Middle
                                              : QStyleOptionHeader::End;
    painter->save();
    paintFixedCell(*painter, option, *this);
    painter->restore();
}

} // namespace platform::qt
