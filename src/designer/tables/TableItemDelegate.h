#pragma once

#include <QStyledItemDelegate>

namespace zandor::designer {

/// Draws a table with its icon, and its schema, dimmed, behind the name.
class TableItemDelegate final : public QStyledItemDelegate {
    Q_OBJECT

public:
    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter* painter, const QStyleOptionViewItem& option,
               const QModelIndex& index) const override;
    QSize sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const override;
};

} // namespace zandor::designer
