#include "platform/qt/ColumnListModel.h"

#include "platform/qt/ShownText.h"

namespace platform::qt {

int ColumnListModel::rowCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : static_cast<int>(mRows.size());
}

QVariant ColumnListModel::data(const QModelIndex& index, int role) const {
    if (!index.isValid() || index.row() >= rowCount()) return {};
    if (role == Qt::DisplayRole) return mRows[static_cast<std::size_t>(index.row())].shown;
    if (role == markedRole) return marked(index.row());
    if (role == Qt::AccessibleDescriptionRole && marked(index.row())) return tr("key column");
    return {};
}

void ColumnListModel::append(const QString& text) {
    const int row = rowCount();
    beginInsertRows({}, row, row);
    mRows.push_back({text, asSigns(text), false});
    endInsertRows();
}

void ColumnListModel::setMarked(int row, bool marked) {
    mRows[static_cast<std::size_t>(row)].marked = marked;
    Q_EMIT dataChanged(index(row), index(row), {markedRole, Qt::AccessibleDescriptionRole});
}

void ColumnListModel::clear() {
    beginResetModel();
    mRows.clear();
    endResetModel();
}

} // namespace platform::qt
