#include "frontends/qt/ColumnListModel.h"

#include "frontends/qt/ShownText.h"

#include <Zandor/qt/Text.h>

#include <utility>

namespace zandor::platform::qt {

int ColumnListModel::rowCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : static_cast<int>(mRows.size());
}

QVariant ColumnListModel::data(const QModelIndex& index, int role) const {
    if (!index.isValid() || index.row() >= rowCount()) return {};
    if (role == Qt::DisplayRole) return asSigns(text(index.row()));
    if (role == pictureRole && picture(index.row())) return static_cast<int>(*picture(index.row()));
    if (role == outputRole) return at(index.row()).comesOut;
    if (role == Qt::AccessibleDescriptionRole) return description(at(index.row()));
    return {};
}

QVariant ColumnListModel::description(const Row& row) const {
    const String said = comforts::spokenOfEntry(mWords, row.picture, row.comesOut);
    return said.empty() ? QVariant() : toQt(said);
}

QString ColumnListModel::text(int row) const { return toQt(mTexts->text(row)); }

void ColumnListModel::append(StringView text, StringView key) {
    const int row = rowCount();
    mTexts->add(key, text);
    beginInsertRows({}, row, row);
    mRows.emplace_back();
    endInsertRows();
}

void ColumnListModel::squeeze() {
    mTexts->squeeze();
    mRows.shrink_to_fit();
}

void ColumnListModel::setPicture(int row, std::optional<Picture> picture) {
    if (std::exchange(at(row).picture, picture) == picture) return;
    Q_EMIT dataChanged(index(row), index(row), {pictureRole, Qt::AccessibleDescriptionRole});
}

void ColumnListModel::setComesOut(int row, bool comesOut) {
    if (std::exchange(at(row).comesOut, comesOut) == comesOut) return;
    Q_EMIT dataChanged(index(row), index(row), {outputRole, Qt::AccessibleDescriptionRole});
}

void ColumnListModel::clear() {
    beginResetModel();
    mRows.clear();
    mTexts->clear();
    endResetModel();
}

} // namespace zandor::platform::qt
