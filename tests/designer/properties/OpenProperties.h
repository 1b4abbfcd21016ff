#pragma once

#include "OpenWindow.h"

#include <QComboBox>
#include <QLineEdit>
#include <QUndoStack>

/// The window over a query of two columns, and the panels of what they are.
class OpenProperties : public OpenWindow {
protected:
    /// orders with the columns "status" and "id" in the grid, which is in the first of them.
    OpenProperties() {
        open({.file = sampleDatabase(), .tables = {"orders", "order_lines"}});
        window->document().change("Add", [](zandor::model::Query& query) {
            for (const auto& [table, column] :
                 {std::pair(u"orders", u"status"), std::pair(u"order_lines", u"quantity")}) {
                const auto definition =
                    zandor::platform::makeRef<zandor::model::ColumnDefinition>();
                definition->Column(query.tableNamed(table)->columnNamed(column));
                query.AddColumnDefinition(definition);
            }
        });
        before = steps();
        goToColumn(1);
    }

    int steps() { return window->document().steps().index(); }
    /// How many steps have been made since the beginning.
    int made() { return steps() - before; }
    std::string lastStep() { return window->document().steps().undoText().toStdString(); }

    zandor::platform::qt::GridWidget& grid() {
        return part<zandor::platform::qt::GridWidget>("sprColumn");
    }
    /// By a click on its first criterion, whose editor opens.
    void goToColumn(int column) {
        calm();
        hands::click(
            *grid().view().viewport(),
            grid().view().visualRect(grid().view().model()->index(4 - 1, column - 1)).center());
        calm();
    }
    zandor::model::ColumnDefinition& definition(int column) {
        return dynamic_cast<zandor::model::ColumnDefinition&>(
            *query().ColumnDefinitions().Item(column));
    }
    template <class Widget>
    Widget& found(const char* name) {
        auto* const widget = window->findChild<Widget*>(name);
        if (!widget) throw std::runtime_error(std::string("no ") + name);
        return *widget;
    }
    /// As a person does who goes there first.
    void write(const char* name, const QString& text) {
        auto& edit = found<QLineEdit>(name);
        window->activateWindow();
        edit.setFocus();
        EXPECT_TRUE(until([&] { return edit.hasFocus(); })) << name;
        edit.selectAll();
        hands::key(edit, Qt::Key_Backspace);
        for (const QChar sign : text) hands::key(edit, 0, QString(sign));
    }

    int before = 0;
};
