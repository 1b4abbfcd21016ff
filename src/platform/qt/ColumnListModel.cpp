#include "platform/qt/ColumnListModel.h"

#include "platform/qt/ShownText.h"

#include <utility>

namespace platform::qt {

int ColumnListModel::rowCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : static_cast<int>(mRows.size());
}

QVariant ColumnListModel::data(const QModelIndex& index, int role) const {
    if (!index.isValid() || index.row() >= rowCount()) return {};
    if (role == Qt::DisplayRole) return mRows[static_cast<std::size_t>(index.row())].shown;
    if (role == markedRole) return marked(index.row());
    if (role == outputRole) return at(index.row()).comesOut;
    if (role == Qt::AccessibleDescriptionRole) return description(at(index.row()));
    return {};
}

QVariant ColumnListModel::description(const Row& row) {
    QStringList parts;
    if (row.marked) parts += tr("key column");
    if (row.comesOut) parts += tr("comes out");
    return parts.isEmpty() ? QVariant() : parts.join(QStringLiteral(", "));
}

void ColumnListModel::append(const QString& text) {
    const int row = rowCount();
    beginInsertRows({}, row, row);
    mRows.push_back({text, asSigns(text), false});
    endInsertRows();
}

void ColumnListModel::setMarked(int row, bool marked) {
    if (std::exchange(mRows[static_cast<std::size_t>(row)].marked, marked) == marked) return;
    Q_EMIT dataChanged(index(row), index(row), {markedRole, Qt::AccessibleDescriptionRole});
}

void ColumnListModel::setComesOut(int row, bool comesOut) {
    if (std::exchange(at(row).comesOut, comesOut) == comesOut) return;
    Q_EMIT dataChanged(index(row), index(row), {outputRole, Qt::AccessibleDescriptionRole});
}

void ColumnListModel::clear() {
    beginResetModel();
    mRows.clear();
    endResetModel();
}

} // namespace platform::qt
