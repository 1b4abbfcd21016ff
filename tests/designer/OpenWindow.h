#pragma once

#include "Databases.h"
#include "document/Answers.h"

#include "designer/DesignerWindow.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/GridWidget.h"
#include "frontends/qt/TabuletWidget.h"

#include <gmock/gmock.h>

#include <QDeadlineTimer>
#include <QListView>
#include <QMenuBar>

/// The designer's window, and what a person does with it.
class OpenWindow : public testing::Test {
protected:
    ~OpenWindow() override {
        window.reset();
        QSettings().clear();
    }

    void open(const zandor::designer::Arguments& arguments = {}) {
        window.reset();
        window = std::make_unique<zandor::designer::DesignerWindow>();
        EXPECT_EQ(window->openAtFirst(arguments, sampleDatabase()).value_or(QString()), QString());
        window->show();
        calm();
    }

    static void calm() {
        for (int n = 0; n < 3; ++n) {
            QCoreApplication::processEvents();
            QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        }
    }

    static bool until(const std::function<bool()>& so) {
        const QDeadlineTimer end(30'000);
        while (!so() && !end.hasExpired())
            QCoreApplication::processEvents(QEventLoop::AllEvents, 20);
        return so();
    }

    /// Opens a menu and clicks an entry of it, the first of those that `is` says yes to.
    void click(QMenu& menu, const std::function<bool(const QAction&)>& is) {
        menu.popup(window->mapToGlobal(QPoint(20, 20)));
        for (QAction* action : menu.actions()) {
            if (!is(*action)) continue;
            EXPECT_TRUE(action->isEnabled()) << action->text().toStdString();
            hands::click(menu, menu.actionGeometry(action).center());
            return calm();
        }
        ADD_FAILURE() << "no such entry in " << menu.title().toStdString();
        menu.close();
    }

    /// By the name of the entry, in whatever menu of the bar.
    void command(const QString& name) {
        for (QMenu* menu : menus())
            for (const QAction* action : menu->actions())
                if (action->objectName() == name)
                    return click(*menu, [&](const QAction& each) { return &each == action; });
        ADD_FAILURE() << "no command " << name.toStdString();
    }
    bool offers(const QString& name) {
        for (const QMenu* menu : menus())
            for (const QAction* action : menu->actions())
                if (action->objectName() == name) return action->isEnabled();
        ADD_FAILURE() << "no command " << name.toStdString();
        return false;
    }
    QList<QMenu*> menus() {
        QList<QMenu*> result;
        for (const QAction* title : window->menuBar()->actions()) result << title->menu();
        return result;
    }
    QMenu& menu(const QString& name) { return *window->findChild<QMenu*>(name); }

    /// Lets a command run that asks for a file.
    void commandWithFile(const QString& name, const QString& path) {
        const Answering answers({[&](QDialog& dialog) { choose(dialog, path); }});
        command(name);
    }

    template <class Widget>
    Widget& part(const QString& name) {
        for (QWidget* widget : window->drawing().control().findChildren<QWidget*>(name))
            if (auto* found = dynamic_cast<Widget*>(widget)) return *found;
        throw std::runtime_error("no part " + name.toStdString());
    }

    zandor::platform::qt::TabuletWidget* shownTable(const QString& title) {
        for (QWidget* widget : window->drawing().control().findChildren<QWidget*>())
            if (auto* table = dynamic_cast<zandor::platform::qt::TabuletWidget*>(widget);
                table && table->isVisible() && table->title() == title)
                return table;
        return nullptr;
    }
    std::vector<std::string> shownTables() {
        std::vector<std::string> titles;
        for (QWidget* widget : window->drawing().control().findChildren<QWidget*>())
            if (const auto* table = dynamic_cast<zandor::platform::qt::TabuletWidget*>(widget);
                table && table->isVisible())
                titles.push_back(table->title().toStdString());
        return titles;
    }

    QListView& list() { return *window->findChild<QListView*>("tables"); }
    QModelIndex row(const QString& table) {
        const auto& model = *list().model();
        for (int n = 0; n < model.rowCount(); ++n)
            if (model.index(n, 0).data().toString() == table) return model.index(n, 0);
        ADD_FAILURE() << "no table " << table.toStdString();
        return {};
    }
    /// Double-clicks a table of the panel.
    void add(const QString& table) {
        QWidget& view = *list().viewport();
        list().scrollTo(row(table));
        const QPointF at = QRectF(list().visualRect(row(table))).center();
        hands::click(view, at);
        hands::mouse(view, QEvent::MouseButtonDblClick, at, Qt::LeftButton, Qt::LeftButton);
        hands::mouse(view, QEvent::MouseButtonRelease, at, Qt::LeftButton);
        calm();
    }

    zandor::model::Query& query() { return *window->document().query(); }
    std::string title() { return window->windowTitle().toStdString(); }

    DatabaseFolder folder;
    std::unique_ptr<zandor::designer::DesignerWindow> window;
};
