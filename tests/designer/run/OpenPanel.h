#pragma once

#include "Databases.h"
#include "Queries.h"
#include "designer/database/Answers.h"

#include "designer/document/Document.h"
#include "designer/run/ResultTable.h"
#include "designer/run/ResultsPanel.h"

#include <gmock/gmock.h>

#include <QAction>
#include <QLabel>
#include <QToolButton>

/// The panel of rows, and what a person does with it.
class OpenPanel : public testing::Test {
protected:
    void open(const QStringList& statements) {
        file = folder.database("panel.db", statements);
        ASSERT_EQ(database.open(file), std::nullopt);
        panel.resize(500, 400);
        panel.show();
    }
    void show(const QStringList& tables, const std::vector<Drawn>& columns = {}) {
        document.setQuery(draw(file, tables, columns));
    }
    /// Presses the tool button of an action.
    void press(QAction* action) {
        for (QToolButton* button : panel.findChildren<QToolButton*>())
            if (button->defaultAction() == action)
                return hands::click(*button, button->rect().center());
        FAIL() << "no button for " << action->text().toStdString();
    }
    void pressRun() { press(panel.runAction()); }
    bool ended() {
        return until([&] { return !panel.isRunning(); });
    }
    std::string status() { return panel.findChild<QLabel*>("runStatus")->text().toStdString(); }
    std::string message() {
        const auto* label = panel.findChild<QLabel*>("runMessage");
        return label->isVisible() ? label->text().toStdString() : "";
    }
    zandor::designer::ResultTable& table() {
        return *panel.findChild<zandor::designer::ResultTable*>();
    }
    QToolButton& all() { return *panel.findChild<QToolButton*>("allRows"); }
    QString at(int row, int column) { return table().rows().index(row, column).data().toString(); }

    DatabaseFolder folder;
    QString file;
    zandor::designer::Document document;
    zandor::designer::Database database;
    zandor::designer::ResultsPanel panel{document, database};
};
