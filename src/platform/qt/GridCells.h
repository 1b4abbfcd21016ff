#pragma once

#include <QHeaderView>
#include <QStyledItemDelegate>

class QTableView;

namespace platform::qt {

/// The margin of a text in a cell of the grid, in logical pixels.
inline constexpr int cellMargin = 4;

/// Cells of the grid: the current one has a frame, thin while the grid is without the focus.
class GridCellDelegate : public QStyledItemDelegate {
public:
    explicit GridCellDelegate(QTableView& view);

    void paint(QPainter* painter, const QStyleOptionViewItem& option,
               const QModelIndex& index) const override;

private:
    const QTableView& mView;
};

/// Paints a fixed cell, its text a margin away from its frame.
void paintFixedCell(QPainter& painter, QStyleOptionHeader option, const QWidget& widget);

/// A header whose sections stand level with the cells, whatever border and padding a style sheet
/// gives it.
class GridHeader : public QHeaderView {
public:
    using QHeaderView::QHeaderView;

    /// What a section needs for a text, in logical pixels.
    QSize sizeFor(const QString& text) const;

protected:
    void changeEvent(QEvent* event) override;
};

/// The titles of the grid's rows.
class RowTitles : public GridHeader {
public:
    explicit RowTitles(QWidget* parent) : GridHeader(Qt::Vertical, parent) {}

protected:
    void paintSection(QPainter* painter, const QRect& place, int section) const override;
};

} // namespace platform::qt
