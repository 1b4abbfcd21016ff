#pragma once

#include "frontends/qt/Canvas.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/GridWidget.h"
#include "frontends/qt/TabuletWidget.h"
#include "support/FakeModel.h"
#include "support/QtHands.h"

#include <Zandor/ZandorWidget.h>

#include <QDeadlineTimer>
#include <QMessageBox>
#include <QScrollBar>
#include <QTimer>

#include <gtest/gtest.h>

/// A window with the widget on it and a query of three tables shown.
class Desk : public testing::Test {
protected:
    using String = zandor::platform::String;
    template <class T>
    using Ref = zandor::platform::Ref<T>;

    Desk() { open(); }

    void open(QWidget* parent = nullptr) {
        widget = std::make_unique<ZandorWidget>(library, parent);
        widget->setDebugSwitch(0);
        widget->resize(900, 600);
    }

    void show() {
        widget->show();
        widget->activateWindow(); // a display without a window manager waits to be asked
        waitForKeyboard(*widget);
        settle();
    }

    /// A display gives the keyboard to a window that is shown when it finds the time.
    static void waitForKeyboard(const QWidget& window) {
        const QDeadlineTimer end(5'000);
        while (window.isVisible() && !window.isActiveWindow() && !end.hasExpired())
            qApp->processEvents(QEventLoop::AllEvents, 10);
    }

    /// Shows three tables, two joins and three output columns.
    void bind() {
        model = library.newModel();
        orders = model->table(u"ORDERS",
                              {u"*", u"ORDER_ID", u"CUSTOMER_ID", u"EMPLOYEE_ID", u"ORDERED_ON",
                               u"SHIPPED_ON", u"FREIGHT", u"REMARKS", u"STATE", u"PRIORITY"});
        orders->place(600, 600, 2400, 2700);
        orders->column(u"ORDER_ID").marker = true;
        customers = model->table(u"CUSTOMERS", {u"*", u"CUSTOMER_ID", u"NAME", u"TOWN"});
        customers->place(5100, 450, 2400, 1800);
        customers->column(u"CUSTOMER_ID").marker = true;
        lines = model->table(u"ORDER_LINES_OF_ALL_THE_YEARS_TOGETHER",
                             {u"*", u"ORDER_ID", u"AMOUNT_OF_MONEY_INCLUDING_EVERY_TAX_THERE_IS"});
        lines->place(5400, 2700, 2550, 1650);
        model->join(orders, u"CUSTOMER_ID", customers, u"CUSTOMER_ID");
        model->join(orders, u"ORDER_ID", lines, u"ORDER_ID", 1);
        model->definition(orders, u"ORDER_ID", {u"> 1000"});
        model->definition(customers, u"NAME")->sortOrder = 1;
        model->definition(lines, u"AMOUNT_OF_MONEY_INCLUDING_EVERY_TAX_THERE_IS");
        widget->setOnlyJoin(false);
        widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        settle();
    }

    static void settle() {
        for (int i = 0; i < 3; ++i) {
            qApp->processEvents();
            QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        }
    }

    zandor::platform::qt::TabuletWidget& table(int index) {
        return child<zandor::platform::qt::TabuletWidget>("lstTable(" + std::to_string(index) +
                                                          ")");
    }
    zandor::platform::qt::GridWidget& grid() {
        return child<zandor::platform::qt::GridWidget>("sprColumn");
    }
    template <class W>
    W& child(const std::string& name) {
        auto* found = dynamic_cast<W*>(widget->findChild<QWidget*>(QString::fromStdString(name)));
        if (!found) throw std::logic_error("there is no " + name);
        return *found;
    }

    /// Presses the middle of a grid cell.
    void press(int row, int col) {
        const QPoint at = grid().cellRect(row, col).center();
        QWidget* part = grid().childAt(at);
        hands::mouse(*part, QEvent::MouseButtonPress, part->mapFrom(&grid(), at), Qt::LeftButton,
                     Qt::LeftButton);
        settle();
    }

    fake::Library library;
    Ref<fake::Model> model;
    Ref<fake::Table> orders, customers, lines;
    std::unique_ptr<ZandorWidget> widget;
};
