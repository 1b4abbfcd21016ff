#include "Designer.h"
#include "Home.h"
#include "Reference.h"

#include <QCoreApplication>
#include <QFile>

#include <gtest/gtest.h>

#include <cstdio>

#include <unistd.h>

// The questions of docs/questions.md, asked of the sample database by somebody who writes no SQL:
// from the empty drawing to the rows, as the page says it, and with as much work.

namespace {

std::string nameOf(const QSize& size) {
    return std::to_string(size.width()) + "x" + std::to_string(size.height());
}

class Asking : public testing::TestWithParam<QSize> {
protected:
    Asking() {
        QFile::copy(QStringLiteral(ZANDOR_SAMPLE_DATABASE), home.filePath("shop.sqlite"));
        designer = std::make_unique<Designer>(
            screen, QStringLiteral(ZANDOR_APPLICATION_HOST),
            QStringList{home.filePath("autosave"), home.filePath("shop.sqlite")},
            home.environment() + QStringList{"ZANDOR_MAXIMISED=1"});
    }

    void awaitTable(const QString& name) {
        await(name + " is there", [&] { return designer->query().contains("table " + name); });
    }
    void awaitColumns(int count) {
        await(QStringLiteral("%1 output columns are there").arg(count),
              [&] { return designer->query().filter("column ").size() == count; });
    }
    /// In the line of an output column.
    void awaitSaid(int column, const QString& what) {
        await(QStringLiteral("column %1 says %2").arg(column).arg(what),
              [&] { return designer->query().filter("column ").value(column - 1).contains(what); });
    }
    void awaitJoin(int type) {
        await(QStringLiteral("the join is of type %1").arg(type), [&] {
            return designer->query().filter(QStringLiteral(", type %1").arg(type)).size() == 1;
        });
    }

    /// Into the number that has the keyboard, which is selected.
    void writeNumber(const QString& number) {
        await("the number has the keyboard",
              [&] { return !designer->ask("focused queryFirst").isEmpty(); });
        screen.type(number);
        screen.key("Return");
    }

    /// Rows as the panel shows them, of as many as there have to be; fractions to two decimals.
    QStringList rows(qsizetype count) {
        QStringList shown;
        await(QStringLiteral("%1 rows are shown").arg(count), [&] {
            shown = designer->ask("text resultTable");
            return shown.size() == count;
        });
        return rounded(shown);
    }
    static QStringList rounded(QStringList lines) {
        for (QString& line : lines) {
            QStringList cells = line.split(" | ");
            for (QString& cell : cells) {
                bool isNumber = false;
                const double value = cell.toDouble(&isNumber);
                if (isNumber) cell = QString::number(value, 'f', 2);
            }
            line = cells.join(" | ");
        }
        return lines;
    }
    /// Of a statement of two columns.
    static QStringList expected(const QString& statement) { return rounded(reference(statement)); }
    static QStringList sorted(QStringList lines) {
        lines.sort();
        return lines;
    }
    /// The first line that is not as it should be.
    static std::string difference(const QStringList& rows, const QStringList& wanted) {
        for (qsizetype n = 0; n < std::max(rows.size(), wanted.size()); ++n)
            if (rows.value(n) != wanted.value(n))
                return "row " + std::to_string(n + 1) + " is " + rows.value(n).toStdString() +
                       " instead of " + wanted.value(n).toStdString();
        return {};
    }

    void tell(const char* question, const char* how) {
        const Screen::Effort& done = screen.effort();
        std::printf("%s, %s by %s: %d clicks, %d turns of the wheel, %d keys, %d letters typed\n",
                    question, nameOf(GetParam()).c_str(), how, done.clicks, done.turns, done.keys,
                    done.letters);
        designer->picture(QStringLiteral("question-%1-%2-%3")
                              .arg(question, QString::fromStdString(nameOf(GetParam())), how));
    }

    Home home;
    Screen screen{GetParam()};
    std::unique_ptr<Designer> designer;
};

class AskingByMouse : public Asking {
protected:
    /// Turns the wheel over something until a thing is in sight.
    void find(const QString& thing, const QString& over) {
        for (const bool away : {false, true})
            for (int turn = 0; turn < 20 && !designer->isShown(thing); ++turn) {
                screen.move(designer->place("control " + over));
                screen.turnWheel(away);
            }
    }
    void add(const QString& table) {
        const QString row = "row tables " + table;
        find(row, "tables");
        screen.doubleClick(designer->place(row));
        awaitTable(table);
    }
    void takeOut(const QString& table, const QString& column) {
        const QString entry = "entry " + table + ' ' + column;
        find(entry, "vsbTable");
        const int before = static_cast<int>(designer->query().filter("column ").size());
        screen.doubleClick(designer->place(entry));
        awaitColumns(before + 1);
    }
    void show(const QString& panel) {
        designer->click("menu viewMenu");
        designer->click("menu " + panel + "Shown");
        designer->awaitGone("menu " + panel + "Shown");
    }
    void total(const QString& entry) {
        designer->click("control totals");
        designer->click("menu " + entry);
    }
    /// Of an input of a panel, in sight or below.
    void clickInput(const QString& input, const QString& above) {
        find("control " + input, above);
        designer->click("control " + input);
    }
    /// From a list that is open.
    void choose(const QString& combo, int item) {
        const QString entry = QStringLiteral("item %1 %2").arg(combo).arg(item);
        const QPoint at = designer->place(entry);
        await("the list closes", [&] {
            // A click that comes very soon counts as part of the one that opened the list.
            if (designer->isShown(entry)) screen.click(at);
            return !designer->isShown(entry);
        });
    }
    void write(const QString& input, const QString& text) {
        designer->type(input, text);
        screen.key("Return");
    }
    void run() { designer->click("control runButton"); }
};

class AskingByKeys : public Asking {
protected:
    void add(const QString& table) {
        screen.key("ctrl+f");
        designer->type("tableFilter", table);
        screen.key("Return");
        awaitTable(table);
    }
    void awaitFocus(const QString& control) {
        await(control + " has the keyboard",
              [&] { return !designer->ask("focused " + control).isEmpty(); });
    }
    /// Into the column that the grid is in.
    void takeOut(const QString& field) {
        const int before = static_cast<int>(designer->query().filter("column ").size());
        screen.key("ctrl+6");
        designer->type("columnField", field);
        screen.key("Return");
        awaitColumns(before + 1);
    }
    void goToGrid() {
        screen.key("ctrl+1");
        screen.key("F6");
        awaitFocus("sprColumn");
    }
    void goRight() {
        goToGrid();
        const QString before = designer->ask("cell").value(0);
        screen.key("Right");
        await("the next column is there", [&] { return designer->ask("cell").value(0) != before; });
    }
    void goDown(int row) {
        const auto now = [&] { return designer->ask("cell").value(0).section(u' ', 0, 0).toInt(); };
        for (int at = now(); at < row; at = now()) {
            screen.key("Down");
            await("the next row is there", [&] { return now() > at; });
        }
    }
    void total(const char* letter, const QString& entry) {
        screen.key("ctrl+t");
        designer->place("menu " + entry);
        screen.key(letter);
        designer->awaitGone("menu " + entry);
    }
    void sortDescending() {
        screen.key("alt+s");
        awaitFocus("columnSort");
        screen.key("Down");
        screen.key("Down");
    }
    /// By the last entry of the menu over the line between orders and payments.
    void keepAllOrders() {
        screen.key("ctrl+1");
        const auto focus = [&] { return designer->ask("focus").value(0); };
        for (int n = 0; n < 5 && !isOnLine(); ++n) {
            const QString before = focus();
            screen.key("Tab");
            await("the next part has the keyboard",
                  [&] { return isOnLine() || focus() != before; });
        }
        screen.key("Menu");
        designer->place("menu mnuHost2");
        screen.key("Up");
        screen.key("Return");
        awaitJoin(2);
    }
    bool isOnLine() { return designer->ask("focus") == QStringList("fraTable"); }

    void nameIt(const QString& name) {
        screen.key("alt+n");
        designer->type("columnName", name);
    }
};

// What each of the questions comes to, by a statement that was written by hand.

const QString ordersOfEachCustomer =
    "SELECT name, orders || ' | ' || worth FROM (SELECT customers.name AS name, "
    "count(DISTINCT orders.id) AS orders, sum(quantity * unit_price) AS worth FROM customers "
    "JOIN orders ON orders.customer_id = customers.id "
    "JOIN order_lines ON order_lines.order_id = orders.id GROUP BY customers.name "
    "ORDER BY worth DESC)";

QStringList cities() {
    QStringList names;
    for (const QString& row : reference("SELECT DISTINCT city, '' FROM customers"))
        names += row.section(" | ", 0, 0);
    return names;
}

const QString tenDearest =
    "SELECT name, unit_price FROM products ORDER BY unit_price DESC LIMIT 10";

const QString amounts =
    "SELECT order_id, name || ' | ' || (quantity * order_lines.unit_price) FROM order_lines "
    "JOIN products ON products.id = order_lines.product_id";

const QString notPaid =
    "SELECT id, ordered_at || ' | ' || status || ' | %1' FROM orders "
    "WHERE NOT EXISTS (SELECT 1 FROM payments WHERE payments.order_id = orders.id)";

} // namespace

TEST_P(AskingByMouse, HowManyOrdersEachCustomerHasAndForHowMuch) {
    for (const char* table : {"customers", "orders", "order_lines"}) add(table);
    takeOut("customers", "name");
    takeOut("orders", "id");
    total("total3"); // Count different values
    awaitSaid(2, "total different");
    designer->click("cell 4 3");
    show("columnDock");
    clickInput("columnField", "columnDock");
    write("columnField", "quantity * unit_price");
    awaitColumns(3);
    total("total4"); // Sum
    awaitSaid(3, "total sum");
    clickInput("columnName", "columnDock");
    designer->type("columnName", "worth");
    clickInput("columnSort", "columnDock");
    choose("columnSort", 2);
    awaitSaid(3, "'worth' sort 2");
    run();
    const QStringList wanted = expected(ordersOfEachCustomer);
    EXPECT_EQ(difference(rows(260), wanted), "");
    tell("1", "mouse");
}

TEST_P(AskingByKeys, HowManyOrdersEachCustomerHasAndForHowMuch) {
    for (const char* table : {"customers", "orders", "order_lines"}) add(table);
    takeOut("customers.name");
    goRight();
    takeOut("orders.id");
    total("d", "total3");
    awaitSaid(2, "total different");
    goRight();
    takeOut("quantity * unit_price");
    total("s", "total4");
    awaitSaid(3, "total sum");
    nameIt("worth");
    sortDescending();
    screen.key("F5");
    EXPECT_EQ(difference(rows(260), expected(ordersOfEachCustomer)), "");
    tell("1", "keys");
}

TEST_P(AskingByMouse, WhichCitiesThereAreEachOnce) {
    add("customers");
    takeOut("customers", "city");
    show("queryDock");
    clickInput("queryDistinct", "queryDock");
    run();
    EXPECT_EQ(difference(sorted(rows(23)), sorted(cities())), "");
    tell("2", "mouse");
}

TEST_P(AskingByKeys, WhichCitiesThereAreEachOnce) {
    add("customers");
    takeOut("customers.city");
    screen.key("ctrl+7");
    awaitFocus("queryDistinct");
    screen.key("space");
    screen.key("F5");
    EXPECT_EQ(difference(sorted(rows(23)), sorted(cities())), "");
    tell("2", "keys");
}

TEST_P(AskingByMouse, WhichTenProductsAreTheDearest) {
    add("products");
    takeOut("products", "name");
    takeOut("products", "unit_price");
    designer->click("cell 2 2"); // and the list of orders drops down
    choose("cobSortOrder", 2);
    show("queryDock");
    find("control queryFirst", "queryDock");
    screen.doubleClick(designer->place("control queryFirst"));
    writeNumber("10");
    run();
    EXPECT_EQ(difference(rows(10), expected(tenDearest)), "");
    tell("3", "mouse");
}

TEST_P(AskingByKeys, WhichTenProductsAreTheDearest) {
    add("products");
    takeOut("products.name");
    goRight();
    takeOut("products.unit_price");
    sortDescending();
    screen.key("ctrl+7");
    awaitFocus("queryDistinct");
    screen.key("alt+r");
    writeNumber("10");
    screen.key("F5");
    EXPECT_EQ(difference(rows(10), expected(tenDearest)), "");
    tell("3", "keys");
}

TEST_P(AskingByMouse, WhatEachLineOfAnOrderComesTo) {
    for (const char* table : {"order_lines", "products"}) add(table);
    takeOut("order_lines", "order_id");
    takeOut("products", "name");
    designer->click("cell 4 3");
    show("columnDock");
    clickInput("columnField", "columnDock");
    write("columnField", "quantity * order_lines.unit_price");
    awaitColumns(3);
    clickInput("columnName", "columnDock");
    designer->type("columnName", "amount");
    run();
    EXPECT_EQ(difference(sorted(rows(5400)), sorted(expected(amounts))), "");
    tell("4", "mouse");
}

TEST_P(AskingByKeys, WhatEachLineOfAnOrderComesTo) {
    for (const char* table : {"order_lines", "products"}) add(table);
    takeOut("order_lines.order_id");
    goRight();
    takeOut("products.name");
    goRight();
    takeOut("quantity * order_lines.unit_price");
    nameIt("amount");
    screen.key("F5");
    EXPECT_EQ(difference(sorted(rows(5400)), sorted(expected(amounts))), "");
    tell("4", "keys");
}

TEST_P(AskingByMouse, WhichOrdersNobodyHasPaid) {
    for (const char* table : {"orders", "payments"}) add(table);
    designer->choose("join 1", "mnuHost2"); // All rows of orders
    awaitJoin(2);
    for (const char* column : {"id", "ordered_at", "status"}) takeOut("orders", column);
    takeOut("payments", "id");
    designer->click("cell 4 4");
    designer->type("txtValue", "Is Null");
    run();
    EXPECT_EQ(difference(sorted(rows(397)), sorted(expected(notPaid.arg("NULL")))), "");
    tell("5", "mouse");
}

TEST_P(AskingByKeys, WhichOrdersNobodyHasPaid) {
    for (const char* table : {"orders", "payments"}) add(table);
    keepAllOrders();
    takeOut("orders.id");
    for (const char* field : {"ordered_at", "status", "payments.id"}) {
        goRight();
        takeOut(field);
    }
    goToGrid();
    goDown(4);
    screen.type("Is Null");
    screen.key("F5");
    EXPECT_EQ(difference(sorted(rows(397)), sorted(expected(notPaid.arg("NULL")))), "");
    tell("5", "keys");
}

TEST_P(AskingByMouse, HowOftenEachOrderHasBeenPaid) {
    for (const char* table : {"orders", "payments"}) add(table);
    designer->choose("join 1", "mnuHost2"); // All rows of orders
    awaitJoin(2);
    for (const char* column : {"id", "ordered_at", "status"}) takeOut("orders", column);
    takeOut("payments", "id");
    total("total2"); // Count
    awaitSaid(4, "total count");
    designer->click("cell 4 4");
    designer->type("txtValue", "0");
    run();
    EXPECT_EQ(difference(sorted(rows(397)), sorted(expected(notPaid.arg("0")))), "");
    tell("5-by-count", "mouse");
}

TEST_P(AskingByKeys, HowOftenEachOrderHasBeenPaid) {
    for (const char* table : {"orders", "payments"}) add(table);
    keepAllOrders();
    takeOut("orders.id");
    for (const char* field : {"ordered_at", "status", "payments.id"}) {
        goRight();
        takeOut(field);
    }
    total("c", "total2");
    awaitSaid(4, "total count");
    goToGrid();
    goDown(4);
    screen.type("0");
    screen.key("F5");
    EXPECT_EQ(difference(sorted(rows(397)), sorted(expected(notPaid.arg("0")))), "");
    tell("5-by-count", "keys");
}

INSTANTIATE_TEST_SUITE_P(On, AskingByMouse, testing::Values(QSize(1024, 600), QSize(1366, 900)),
                         [](const auto& info) { return nameOf(info.param); });
INSTANTIATE_TEST_SUITE_P(On, AskingByKeys, testing::Values(QSize(1024, 600), QSize(1366, 900)),
                         [](const auto& info) { return nameOf(info.param); });

int main(int argc, char** argv) {
    // Whatever happens, nothing is left behind: the children die with this program.
    alarm(120);
    const QCoreApplication application(argc, argv);
    testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}
