#include "Designer.h"
#include "Home.h"
#include "Reference.h"

#include <QCoreApplication>
#include <QFile>

#include <gtest/gtest.h>

#include <cstdio>

#include <unistd.h>

namespace {

std::string nameOf(const QSize& size) {
    return std::to_string(size.width()) + "x" + std::to_string(size.height());
}

/// How many orders has each customer, and for how much? Asked of the sample database by somebody
/// who writes no SQL.
class TheOrdersOfEachCustomer : public testing::TestWithParam<QSize> {
protected:
    const QString amount = QStringLiteral("quantity * unit_price * (1 - discount)");

    TheOrdersOfEachCustomer() {
        QFile::copy(QStringLiteral(ZANDOR_SAMPLE_DATABASE), home.filePath("shop.sqlite"));
        designer = std::make_unique<Designer>(
            screen, QStringLiteral(ZANDOR_APPLICATION_HOST),
            QStringList{home.filePath("autosave"), home.filePath("shop.sqlite"), "--tables",
                        "customers,orders,order_lines"},
            home.environment() + QStringList{"ZANDOR_MAXIMISED=1"});
        await("the tables are there",
              [this] { return designer->query().filter("join ").size() == 2; });
    }

    /// Scrolls the canvas until a thing is in sight.
    QPoint find(const QString& thing) {
        for (const bool away : {false, true})
            for (int turn = 0; turn < 20 && !designer->isShown(thing); ++turn) {
                screen.move(designer->place("control vsbTable"));
                screen.turnWheel(away);
            }
        return designer->place(thing);
    }

    void awaitColumns(int count) {
        await(QStringLiteral("%1 output columns are there").arg(count),
              [&] { return designer->query().filter("column ").size() == count; });
    }

    void awaitTotal(const QString& total) {
        await("there is the total " + total,
              [&] { return designer->query().filter(" total " + total).size() == 1; });
    }
    void awaitCell(int row, int column) {
        await("the cell changes", [&] {
            return designer->ask("cell") == QStringList(QString("%1 %2").arg(row).arg(column));
        });
    }

    void checkRows() {
        QStringList expected = reference(
            "SELECT name, orders || ' | ' || sum FROM (SELECT customers.name AS name, "
            "count(DISTINCT orders.id) AS orders, "
            "sum(quantity * unit_price * (1 - discount)) AS sum FROM customers "
            "JOIN orders ON orders.customer_id = customers.id "
            "JOIN order_lines ON order_lines.order_id = orders.id GROUP BY customers.name)");
        ASSERT_GT(expected.size(), 10);
        QStringList rows;
        await(QStringLiteral("the rows are shown"), [&] {
            rows = designer->ask("text resultTable");
            return rows.size() == expected.size();
        });
        // The third column is a fraction, of which engines print as many digits as they like.
        const auto rounded = [](QStringList lines) {
            for (QString& line : lines) {
                const QStringList cells = line.split(" | ");
                line = cells.value(0) + " | " + cells.value(1) + " | " +
                       QString::number(cells.value(2).toDouble(), 'f', 2);
            }
            lines.sort();
            return lines;
        };
        EXPECT_EQ(rounded(rows), rounded(expected));
    }

    static std::string size() { return nameOf(GetParam()); }

    void tell(const char* how) {
        const Screen::Effort& done = screen.effort();
        std::printf("%s by %s: %d clicks, %d turns of the wheel, %d keys, %d letters typed\n",
                    size().c_str(), how, done.clicks, done.turns, done.keys, done.letters);
        designer->picture(QString::fromStdString("sums-" + size() + "-" + how));
    }

    Home home;
    Screen screen{GetParam()};
    std::unique_ptr<Designer> designer;
};

} // namespace

TEST_P(TheOrdersOfEachCustomer, AreAskedForWithAMouse) {
    screen.doubleClick(find("entry customers name"));
    awaitColumns(1);
    screen.doubleClick(find("entry orders id"));
    awaitColumns(2);
    designer->choose("cell 3 2", "mnuHost4"); // Count different values
    awaitTotal("different");
    designer->click("cell 3 3");
    designer->click("menu viewMenu");
    designer->click("menu columnDockShown");
    designer->click("control columnField");
    screen.type(amount);
    screen.key("Escape"); // the list of names
    screen.key("Return");
    awaitColumns(3);
    designer->click("control totals");
    designer->click("menu total4");
    awaitTotal("sum");
    designer->click("menu queryMenu");
    designer->click("menu run");
    checkRows();
    tell("mouse");
}

TEST_P(TheOrdersOfEachCustomer, AreAskedForWithoutAMouse) {
    screen.key("ctrl+1");
    screen.key("F6");
    await("the grid has the keyboard",
          [this] { return !designer->ask("focused sprColumn").isEmpty(); });
    screen.key("ctrl+6");
    const auto writeField = [this](const QString& text, int columns) {
        designer->type("columnField", text);
        screen.key("Escape"); // the list of names
        screen.key("Return");
        awaitColumns(columns);
    };
    const auto goRight = [this](int column) {
        screen.key("ctrl+1");
        screen.key("F6");
        await("the grid has the keyboard",
              [this] { return !designer->ask("focused sprColumn").isEmpty(); });
        screen.key("Right");
        awaitCell(1, column);
        screen.key("ctrl+6");
    };
    writeField("customers.name", 1);
    goRight(2);
    writeField("orders.id", 2);
    screen.key("ctrl+t");
    designer->place("menu total3");
    screen.key("d"); // Count different values
    awaitTotal("different");
    goRight(3);
    writeField(amount, 3);
    screen.key("ctrl+t");
    designer->place("menu total4");
    screen.key("s");
    awaitTotal("sum");
    screen.key("F5");
    checkRows();
    tell("keys");
}

INSTANTIATE_TEST_SUITE_P(On, TheOrdersOfEachCustomer,
                         testing::Values(QSize(1024, 600), QSize(1366, 900)),
                         [](const auto& info) { return nameOf(info.param); });

int main(int argc, char** argv) {
    // Whatever happens, nothing is left behind: the children die with this program.
    alarm(120);
    const QCoreApplication application(argc, argv);
    testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}
