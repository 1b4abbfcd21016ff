#pragma once

#include "designer/database/readTables.h"

#include <QPoint>

class QListView;

namespace zandor::designer {

class TableListModel;

/// Shows the columns of the table under the mouse. Reads them when they are asked for first, those
/// of a server on another thread.
class TableTip final : public QObject {
    Q_OBJECT

public:
    TableTip(Database& database, const TableListModel& model, QListView& list);

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void show(const reader::TableEntry& table, QPoint at);
    void read(const reader::TableEntry& table, QPoint at);

    Database& mDatabase;
    const TableListModel& mModel;
    QListView& mList;
    std::optional<reader::TableEntry> mAsked; ///< being read
};

/// The columns of a table for a tip; rich text.
QString tipText(const model::TableDescription& table, bool isView);

} // namespace zandor::designer
