#pragma once

#include <Zandor/DatabaseReader.h>

#include <QAbstractListModel>

namespace zandor::designer {

/// The tables of a database whose names have every word of a filter in them; first those that begin
/// with the first word. One pass over all names for each change of the filter, and the view is told
/// once, which keeps typing quick over thousands of tables.
class TableListModel final : public QAbstractListModel {
    Q_OBJECT

public:
    enum Role { SchemaRole = Qt::UserRole, IsViewRole };

    explicit TableListModel(QObject* parent = nullptr);

    void setTables(const std::vector<reader::TableEntry>& tables);
    void setFilter(const QString& filter);
    std::size_t count() const { return mEntries.size(); }
    /// Of a shown row.
    const reader::TableEntry& entry(int row) const;

    int rowCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    Qt::ItemFlags flags(const QModelIndex& index) const override;
    QMimeData* mimeData(const QModelIndexList& indexes) const override;
    Qt::DropActions supportedDragActions() const override { return Qt::CopyAction; }

private:
    struct Entry {
        reader::TableEntry table;
        QString folded;     ///< "schema.name" or "name" without case
        qsizetype name = 0; ///< where the name begins in it
    };
    void filter();

    std::vector<Entry> mEntries;
    std::vector<std::size_t> mShown;
    QStringList mWords;
};

} // namespace zandor::designer
