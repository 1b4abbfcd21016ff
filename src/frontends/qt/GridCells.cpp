#include "frontends/qt/GridCells.h"

#include "frontends/qt/FocusFrame.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/GridWidget.h"
#include "frontends/qt/ShownText.h"

#include <QEvent>
#include <QPainter>
#include <QTableView>

#include <algorithm>
#include <utility>

namespace zandor::platform::qt {

namespace {

/// The frame of the current cell: thin while the grid is without the focus.
void paintCurrentFrame(QPainter& painter, const QRect& place, const QPalette& palette,
                       bool focused) {
    if (focused) return paintFocusFrame(painter, place, palette);
    QColor thin = palette.color(QPalette::Active, QPalette::Highlight);
    thin.setAlphaF(0.6F);
    painter.save();
    painter.setPen(thin);
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(place.adjusted(0, 0, -1, -1));
    painter.restore();
}

/// The wave below a text that there is something to say about.
void paintWave(QPainter& painter, const QRect& place, const QPalette& palette) {
    constexpr int period = 4;
    const bool dark = palette.color(QPalette::Base).lightness() < 128;
    QPolygonF wave;
    for (int x = place.left(); x <= place.right(); x += period / 2)
        wave << QPointF(x, place.bottom() - ((x - place.left()) / (period / 2) % 2 ? 2.5 : 0.5));
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(dark ? QColor(0xff, 0x7b, 0x72) : QColor(0xc8, 0x1e, 0x1e), 1.4));
    painter.drawPolyline(wave);
    painter.restore();
}

} // namespace

GridCellDelegate::GridCellDelegate(const GridWidget& grid, QTableView& view)
    : QStyledItemDelegate(&view), mGrid(grid), mView(view) {}

void GridCellDelegate::initStyleOption(QStyleOptionViewItem* option,
                                       const QModelIndex& index) const {
    QStyledItemDelegate::initStyleOption(option, index);
    const QString arrow = index.data(GridModel::arrowRole).toString();
    if (arrow.isEmpty()) return;
    const QStyle& style = *mView.style();
    const int margin = style.pixelMetric(QStyle::PM_FocusFrameHMargin, option, &mView) + 1;
    if (option->fontMetrics.horizontalAdvance(option->text) <= option->rect.width() - 2 * margin)
        return;
    option->text = arrow;
    option->textElideMode = Qt::ElideNone;
}

void GridCellDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                             const QModelIndex& index) const {
    QStyleOptionViewItem cell = option;
    cell.state &= ~QStyle::State_HasFocus;
    QStyledItemDelegate::paint(painter, cell, index);
    if (!index.data(GridModel::noteRole).toString().isEmpty()) {
        const int width = option.fontMetrics.horizontalAdvance(index.data().toString());
        const QRect inside = option.rect.adjusted(cellMargin, 0, -cellMargin, -2);
        paintWave(*painter, inside & QRect(inside.topLeft(), QSize(std::max(width, 16), 999)),
                  option.palette);
    }
    // While a field is the current cell, the view's own current one only keeps the place.
    if (index == mView.currentIndex() && mGrid.currentRow() > 0)
        paintCurrentFrame(*painter, option.rect, option.palette, mView.hasFocus());
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

QSize GridHeader::sizeHint() const {
    const bool across = orientation() == Qt::Horizontal;
    const bool fixed =
        across ? minimumHeight() == maximumHeight() : minimumWidth() == maximumWidth();
    return fixed ? minimumSize() : QHeaderView::sizeHint();
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
    if (event->type() == QEvent::StyleChange) dropFrame();
}

void GridHeader::dropFrame() {
    if (testAttribute(Qt::WA_StyleSheet) && styleSheet().isEmpty())
        setStyleSheet(QStringLiteral("QHeaderView { border: 0; padding: 0; margin: 0 }"));
}

bool FieldTitles::isOnBorder(int x) const {
    const int section = logicalIndexAt(x);
    if (section < 0) return count() > 0;
    const int grip = style()->pixelMetric(QStyle::PM_HeaderGripMargin, nullptr, this);
    const int left = sectionViewportPosition(section);
    return (section > 0 && x < left + grip) || x > left + sectionSize(section) - grip;
}

void FieldTitles::setGap(int column) {
    if (std::exchange(mGap, column) != column) viewport()->update();
}

void FieldTitles::paintEvent(QPaintEvent* event) {
    GridHeader::paintEvent(event);
    if (mGap == 0) return;
    const int x = mGap > count() ? length() - offset() : sectionViewportPosition(mGap - 1);
    QPainter painter(viewport());
    painter.fillRect(QRect(x - 2, 0, 4, height()),
                     palette().color(QPalette::Active, QPalette::Highlight));
}

void FieldTitles::paintSection(QPainter* painter, const QRect& place, int section) const {
    painter->save();
    painter->setLayoutDirection(asItReads);
    GridHeader::paintSection(painter, place, section);
    painter->restore();
    if (mGrid.offeredColumn() == section + 1) {
        painter->save();
        // The placeholder's colour is one for cells, and hard to read on a header.
        QColor quiet = palette().color(QPalette::ButtonText);
        quiet.setAlphaF(0.65F);
        painter->setPen(quiet);
        const QRect inside = place.adjusted(cellMargin, 0, -cellMargin, 0);
        painter->drawText(inside, static_cast<int>(Qt::AlignCenter) | Qt::TextSingleLine,
                          fontMetrics().elidedText(mGrid.offer(), Qt::ElideRight, inside.width()));
        painter->restore();
    }
    if (mGrid.currentRow() == 0 && mGrid.currentCol() == section + 1)
        paintCurrentFrame(*painter, place, palette(), mGrid.view().hasFocus());
}

void FieldTitles::initStyleOptionForIndex(QStyleOptionHeader* option, int section) const {
    GridHeader::initStyleOptionForIndex(option, section);
    // The view's own way cuts a centred text on both sides.
    const int room = std::max(1, sectionSize(section) - 2 * cellMargin);
    option->text = option->fontMetrics.elidedText(option->text, Qt::ElideRight, room);
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

} // namespace zandor::platform::qt
