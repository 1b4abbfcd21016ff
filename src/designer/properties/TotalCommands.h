#pragma once

#include "designer/properties/CurrentColumn.h"

#include <Zandor/Questions.h>
#include <Zandor/model/Total.h>

#include <QMenu>

namespace zandor::designer {

/// Sets the total of an output column in one step: by a menu for the column that the grid is in,
/// and by entries of the grid's own menu.
class TotalCommands final : public QObject {
    Q_OBJECT

public:
    /// The first two outlive the object.
    TotalCommands(Document& document, CurrentColumn& column, QWidget* parent);

    QMenu& menu() { return *mMenu; }
    /// For the grid's menu over an output column.
    std::vector<TalvikDBxZandor::HostEntry>
    entries(const platform::Ref<model::ColumnDefinition>& definition);

    /// Nothing happens when the query has no such column any more.
    void setTotal(const platform::String& key, model::Total total);

private:
    void follow();

    Document& mDocument;
    CurrentColumn& mColumn;
    QMenu* mMenu;
};

} // namespace zandor::designer
