#include "designer/tables/TableListModel.h"

#include "designer/tables/tableMime.h"
#include "frontends/qt/ShownText.h"

#include <Zandor/qt/Text.h>

#include <QMimeData>

#include <algorithm>

namespace zandor::designer {

using platform::qt::asSigns;
using platform::qt::toQt;

TableListModel::TableListModel(QObject* parent) : QAbstractListModel(parent) {}

void TableListModel::setTables(const std::vector<reader::TableEntry>& tables) {
    beginResetModel();
    mEntries.clear();
    mEntries.reserve(tables.size());
    for (const auto& table : tables) {
        const QString schema = toQt(table.id.schema).toCaseFolded();
        const QString name = toQt(table.id.name).toCaseFolded();
        const bool usual = schema.isEmpty();
        mEntries.push_back({table, usual ? name : schema + u'.' + name, //
                            usual ? 0 : schema.size() + 1});
    }
    filter();
    endResetModel();
}

void TableListModel::setFilter(const QString& filterText) {
    const QStringList words =
        filterText.toCaseFolded().simplified().split(u' ', Qt::SkipEmptyParts);
    if (words == mWords) return;
    beginResetModel();
    mWords = words;
    filter();
    endResetModel();
}

void TableListModel::filter() {
    mShown.clear();
    for (std::size_t n = 0; n < mEntries.size(); ++n)
        if (std::all_of(mWords.begin(), mWords.end(),
                        [&](const QString& word) { return mEntries[n].folded.contains(word); }))
            mShown.push_back(n);
    if (mWords.isEmpty()) return;
    std::stable_partition(mShown.begin(), mShown.end(), [&](std::size_t n) {
        return QStringView(mEntries[n].folded).mid(mEntries[n].name).startsWith(mWords.front());
    });
}

const reader::TableEntry& TableListModel::entry(int row) const {
    return mEntries.at(mShown.at(static_cast<std::size_t>(row))).table;
}

int TableListModel::rowCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : static_cast<int>(mShown.size());
}

QVariant TableListModel::data(const QModelIndex& index, int role) const {
    if (!checkIndex(index, CheckIndexOption::IndexIsValid)) return {};
    const reader::TableEntry& table = entry(index.row());
    switch (role) {
    case Qt::DisplayRole: return asSigns(toQt(table.id.name));
    case SchemaRole: return asSigns(toQt(table.id.schema));
    case IsViewRole: return table.isView;
    case Qt::AccessibleTextRole: {
        const QString name = table.id.schema.empty()
                                 ? toQt(table.id.name)
                                 : toQt(table.id.schema) + u'.' + toQt(table.id.name);
        return table.isView ? tr("%1, view").arg(asSigns(name))
                            : tr("%1, table").arg(asSigns(name));
    }
    default: return {};
    }
}

Qt::ItemFlags TableListModel::flags(const QModelIndex& index) const {
    return QAbstractListModel::flags(index) | Qt::ItemIsDragEnabled | Qt::ItemNeverHasChildren;
}

QMimeData* TableListModel::mimeData(const QModelIndexList& indexes) const {
    std::vector<reader::TableId> tables;
    for (const QModelIndex& index : indexes) tables.push_back(entry(index.row()).id);
    return tablesAsMime(tables).release();
}

} // namespace zandor::designer
