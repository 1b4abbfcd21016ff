#pragma once

#include <QStyledItemDelegate>

namespace zandor::platform::qt {

/// Draws an entry of a table list: the mark in a gutter of its own, then the name.
class ColumnDelegate : public QStyledItemDelegate {
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter* painter, const QStyleOptionViewItem& option,
               const QModelIndex& index) const override;
    QSize sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const override;

    static void paintEntry(QPainter& painter, const QStyleOptionViewItem& option,
                           const QModelIndex& index);
    static int rowHeight(const QFontMetrics& metrics) { return metrics.height() + 4; }
    /// The part of an entry's rectangle that its name has.
    static QRect textPlace(const QRect& entry, const QFontMetrics& metrics, bool comesOut);
};

} // namespace zandor::platform::qt
