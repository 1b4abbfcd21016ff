#pragma once

#include "designer/run/ColumnFormats.h"
#include "designer/run/RowOrder.h"
#include "designer/run/Spool.h"

#include <QAbstractTableModel>
#include <QCache>
#include <QItemSelection>

#include <memory>

namespace zandor::designer {

/// The rows of a spool, of which only some pages are in memory.
class ResultModel final : public QAbstractTableModel {
    Q_OBJECT

public:
    using QAbstractTableModel::QAbstractTableModel;

    /// Shows the rows of another spool, or none.
    void setSpool(const std::shared_ptr<Spool>& spool);
    /// Looks for what has come: columns, and rows.
    void refresh();
    const std::shared_ptr<Spool>& spool() const { return mSpool; }

    /// Shows the values in other formats; false when these are the ones that they have.
    bool setFormats(const ColumnFormats& formats);
    CellFormat format(int column) const { return mFormats.at(column, columnCount()); }

    /// Shows the rows in another order than they came in, or with an empty one as they came. Rows
    /// that come later stand behind it.
    void setOrder(RowOrder order);
    /// A view wants the rows sorted by a column, or with -1 as they came.
    void sort(int column, Qt::SortOrder direction) override { emit sortWished(column, direction); }

    /// The value of a cell itself, of a long text the beginning; of a blob the number of its bytes.
    Cell cell(const QModelIndex& index) const;
    /// Where a row that is shown is in the spool.
    qint64 spooled(int row) const;
    int rowCount(const QModelIndex& parent = {}) const override;
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation,
                        int role = Qt::DisplayRole) const override;

    /// The selected cells in full, as they are shown, as text with tabs between columns and a line
    /// a row, or nothing when they are more than a clipboard should hold.
    std::optional<QString> copied(const QItemSelection& selection) const;

signals:
    void sortWished(int column, Qt::SortOrder direction);

private:
    std::shared_ptr<Spool> mSpool;
    QStringList mColumns;
    ColumnFormats mFormats;
    RowOrder mOrder; ///< empty: as they came
    int mRows = 0;
    mutable QCache<qint64, std::vector<Row>> mPages;
};

} // namespace zandor::designer
