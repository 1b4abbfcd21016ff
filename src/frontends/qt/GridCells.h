#pragma once

#include <QHeaderView>
#include <QStyledItemDelegate>

class QTableView;

namespace zandor::platform::qt {

class GridWidget;

/// The margin of a text in a cell of the grid, in logical pixels.
inline constexpr int cellMargin = 4;

/// Cells of the grid: the current one has a frame, thin while the grid is without the focus. A sort
/// order that its column is too narrow for is an arrow.
class GridCellDelegate : public QStyledItemDelegate {
public:
    GridCellDelegate(const GridWidget& grid, QTableView& view);

    void paint(QPainter* painter, const QStyleOptionViewItem& option,
               const QModelIndex& index) const override;

    void initStyleOption(QStyleOptionViewItem* option, const QModelIndex& index) const override;

private:
    const GridWidget& mGrid;
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
    /// Of a header of a fixed size, which the view asks for at every change, no text is measured.
    QSize sizeHint() const override;
    /// What a host's style sheet puts around headers would move them off their cells.
    void dropFrame();

protected:
    void changeEvent(QEvent* event) override;
};

/// The fields at the head of the grid's columns. The current one has a frame as cells have; the
/// first blank one says what it is for; a column that is being dragged shows where it would come.
class FieldTitles : public GridHeader {
public:
    FieldTitles(const GridWidget& grid, QWidget* parent)
        : GridHeader(Qt::Horizontal, parent), mGrid(grid) {}

    /// Whether a place belongs to the border of a column, which is there for its width.
    bool isOnBorder(int x) const;
    /// Shows the gap before a column, counted from 1; 0 shows none.
    void setGap(int column);
    int gap() const { return mGap; }

protected:
    void paintEvent(QPaintEvent* event) override;
    void paintSection(QPainter* painter, const QRect& place, int section) const override;
    void initStyleOptionForIndex(QStyleOptionHeader* option, int section) const override;

private:
    const GridWidget& mGrid;
    int mGap = 0;
};

/// The titles of the grid's rows.
class RowTitles : public GridHeader {
public:
    explicit RowTitles(QWidget* parent) : GridHeader(Qt::Vertical, parent) {}

protected:
    void paintSection(QPainter* painter, const QRect& place, int section) const override;
};

} // namespace zandor::platform::qt
