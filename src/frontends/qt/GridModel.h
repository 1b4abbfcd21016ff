#pragma once

#include <Zandor/comforts/Spoken.h>
#include <Zandor/platform/Words.h>

#include <QAbstractTableModel>

#include <vector>

namespace zandor::platform::qt {

/// The cells of the grid, fixed ones included. To a view, row 0 and column 0 are the headers and
/// the rest is the body; nothing is announced until `announce`, so that filling the grid and
/// moving its columns costs no more than the data.
class GridModel : public QAbstractTableModel {
public:
    static constexpr int noteRole = Qt::UserRole;
    /// Of a cell with a sort order: what says as much in little room.
    static constexpr int arrowRole = Qt::UserRole + 1;

    GridModel(int rows, int cols, QObject* parent);

    int rows() const { return mRows; }
    int cols() const { return static_cast<int>(mColumns.size()); }

    const QString& text(int row, int col) const { return cell(row, col).text; }
    void setText(int row, int col, const QString& text);
    void setAlignment(int row, int col, std::int16_t alignment);
    /// What there is to say about a cell; empty: nothing.
    const QString& note(int row, int col) const { return cell(row, col).note; }
    void setNote(int row, int col, const QString& note);
    /// Twips.
    float width(int col) const { return column(col).width; }
    void setWidth(int col, float width) { column(col).width = width; }
    std::int32_t columnData(int col) const { return column(col).data; }
    void setColumnData(int col, std::int32_t value) { column(col).data = value; }
    /// Moves a column with all it has; those in between shift by one.
    void move(int from, int to);

    /// Nothing is announced of it, either.
    void setWords(const Words& words);
    /// A cell as it is spoken, without its text: the row's title and the column's field.
    QString titleOf(int row, int col) const;

    /// Tells the views to show everything afresh.
    void announce();

    int rowCount(const QModelIndex& parent = {}) const override;
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

private:
    struct Cell {
        QString text;
        QString note;
        Qt::Alignment alignment = Qt::AlignLeft | Qt::AlignVCenter;
    };

    struct Column {
        std::vector<Cell> cells; ///< none until one of them is written; most columns are blank
        float width = 0;
        std::int32_t data = 0;
    };

    static QVariant valueOf(const Cell& cell, int role);
    const Column& column(int col) const { return mColumns[static_cast<std::size_t>(col)]; }
    Column& column(int col) { return mColumns[static_cast<std::size_t>(col)]; }
    const Cell& cell(int row, int col) const;
    Cell& writable(int row, int col);

    QVariant arrow(int row, int col) const;
    comforts::CellText reader() const;

    const int mRows;
    QString mAscending;
    QString mDescending;
    Words mWords;
    std::vector<Column> mColumns;
};

} // namespace zandor::platform::qt
