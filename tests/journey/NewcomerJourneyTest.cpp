#include "Designer.h"
#include "Home.h"
#include "Reference.h"

#include <QCoreApplication>
#include <QFile>

#include <gtest/gtest.h>

#include <cstdio>
#include <functional>
#include <ostream>

#include <unistd.h>

namespace {

/// A screen that people have, and how large its things are drawn.
struct Desktop {
    QSize screen;
    const char* scale;

    std::string name() const {
        return std::to_string(screen.width()) + "x" + std::to_string(screen.height()) + "_at_" +
               (std::string(scale) == "1" ? "100" : "150");
    }
};

void PrintTo(const Desktop& desktop, std::ostream* out) { *out << desktop.name(); }

/// The way of somebody who starts the designer for the first time, in a window as large as the
/// screen: from a database of their own through five of its tables, and as many more as it takes
/// until the canvas scrolls, to the rows that a criterion leaves.
class ANewcomer : public testing::TestWithParam<Desktop> {
protected:
    const QStringList tables = {"customers", "orders", "order_lines", "products", "suppliers"};
    /// Each is joined to what is there before it.
    const QStringList further = {"categories", "payments",   "contacts", "shipment_lines",
                                 "shipments",  "warehouses", "stock",    "employees"};
    const QString criterion = QStringLiteral("Like 'Du*'");

    ANewcomer() {
        QFile::copy(QStringLiteral(ZANDOR_SAMPLE_DATABASE), home.filePath("shop.sqlite"));
        // The folder that one is in when one starts a program.
        designer = std::make_unique<Designer>(
            screen, QStringLiteral("env"),
            QStringList{"-C", home.path(), QStringLiteral(ZANDOR_APPLICATION_HOST),
                        home.filePath("autosave")},
            home.environment() +
                QStringList{QStringLiteral("QT_SCALE_FACTOR=") + QLatin1String(GetParam().scale),
                            "ZANDOR_MAXIMISED=1"});
    }

    void awaitTable(const QString& name) {
        await(name + " is there", [&] { return designer->query().contains("table " + name); });
    }
    void awaitColumns(int count) {
        await(QStringLiteral("%1 output columns are there").arg(count),
              [&] { return designer->query().filter("column ").size() == count; });
    }

    bool scrolls() { return designer->ask("scrolls") != QStringList("0 0"); }

    /// Adds further tables as `add` does until the canvas is larger than what can be seen of it. On
    /// a desktop that has room for them all, one is put to its lower edge as `putAside` does.
    void addUntilItScrolls(const std::function<void(const QString&)>& add,
                           const std::function<void()>& putAside) {
        EXPECT_EQ(designer->query().filter("join ").size(), 4);
        for (const QString& table : further) {
            if (scrolls()) return;
            add(table);
        }
        if (!scrolls()) putAside();
        await("the canvas scrolls", [this] { return scrolls(); });
    }

    void checkRows() {
        QString statement = "SELECT customers.name, products.name FROM customers "
                            "JOIN orders ON orders.customer_id = customers.id "
                            "JOIN order_lines ON order_lines.order_id = orders.id "
                            "JOIN products ON products.id = order_lines.product_id "
                            "JOIN suppliers ON suppliers.id = products.supplier_id%1 "
                            "WHERE customers.name LIKE 'Du%'%2";
        QString more, joined;
        for (const QString& line : designer->query()) {
            const QStringList words = QString(line).remove(u',').split(u' ');
            const bool isFurther = [&] {
                for (const QString& table : further)
                    if (words.value(1) == table || line.contains(" " + table + ".")) return true;
                return false;
            }();
            if (isFurther && words[0] == "table") more += ", " + words[1];
            if (isFurther && words[0] == "join")
                joined += " AND " + QStringList(words.mid(1, 3)).join(u' ');
        }
        QStringList expected = reference(statement.arg(more, joined));
        ASSERT_GT(expected.size(), 3);
        QStringList rows;
        await(QStringLiteral("the rows are shown"), [&] {
            rows = designer->ask("text resultTable");
            return rows.size() == expected.size();
        });
        rows.sort();
        expected.sort();
        EXPECT_EQ(rows, expected);
    }

    void tell(const char* how) {
        const Screen::Effort& done = screen.effort();
        std::printf("%s, by %s: %d clicks, %d turns of the wheel, %d keys, %d letters typed\n",
                    GetParam().name().c_str(), how, done.clicks, done.turns, done.keys,
                    done.letters);
        std::printf("  %d tables; the canvas scrolls by %s twips\n",
                    static_cast<int>(designer->query().filter("table ").size()),
                    qPrintable(designer->ask("scrolls").join(u' ')));
        designer->picture(QString::fromStdString("newcomer-" + GetParam().name() + "-" + how));
    }

    Home home;
    Screen screen{GetParam().screen};
    std::unique_ptr<Designer> designer;
};

class ANewcomerWithAMouse : public ANewcomer {
protected:
    void command(const QString& menu, const QString& name) {
        designer->click("menu " + menu);
        designer->click("menu " + name);
    }

    /// Turns the wheel over something until a thing is in sight.
    bool turnUntil(const QString& over, const QString& thing, int most, bool away = false) {
        for (int turn = 0; turn < most && !designer->isShown(thing); ++turn) {
            if (turn == 0) screen.move(designer->place(over));
            screen.turnWheel(away);
        }
        return designer->isShown(thing);
    }

    /// Looks all over the canvas for a thing.
    void find(const QString& thing) {
        constexpr int turn = 720; // twips
        const QStringList ends = designer->ask("scrolls").value(0).split(u' ');
        const int across = ends.value(0).toInt() / turn + 1;
        const int down = ends.value(1).toInt() / turn + 1;
        bool found = designer->isShown(thing);
        for (int n = 0; n <= across && !found; ++n) {
            if (n > 0) {
                screen.move(designer->place("control hsbTable"));
                screen.turnWheel(true);
            }
            found = turnUntil("control vsbTable", thing, down, n % 2 != 0);
        }
        for (int n = 0; n <= across && !found; ++n) {
            screen.move(designer->place("control hsbTable"));
            screen.turnWheel();
            found = turnUntil("control vsbTable", thing, down, n % 2 != 0);
        }
        EXPECT_TRUE(found) << thing.toStdString() << " is nowhere";
    }
};

class ANewcomerWithoutAMouse : public ANewcomer {
protected:
    /// From one table to another by its slot, the shorter way.
    void goTo(int table) {
        const auto now = [this] {
            const QString name = designer->ask("focus").value(0);
            return name.startsWith(u"lstTable(") ? name.mid(9).split(u')').first().toInt() : 0;
        };
        await("a table has the keyboard", [&] { return now() != 0; });
        for (int before = now(); before != table; before = now()) {
            screen.key(before < table ? "Tab" : "shift+Tab");
            await("the next table has the keyboard", [&] { return now() != 0 && now() != before; });
        }
    }

    void select(const QString& table, const QString& column) {
        for (int n = 0; n < 20 && designer->ask("selected " + table) != QStringList(column); ++n) {
            const QStringList before = designer->ask("selected " + table);
            screen.key("Down");
            await("the selection moves",
                  [&] { return designer->ask("selected " + table) != before; });
        }
        EXPECT_EQ(designer->ask("selected " + table), QStringList(column));
    }

    void goToCell(int row, int column) {
        const auto step = [this](int part, int wanted, const char* less, const char* more) {
            const auto now = [&] {
                return designer->ask("cell").value(0).split(u' ').value(part).toInt();
            };
            for (int at = now(); at != wanted; at = now()) {
                screen.key(at < wanted ? more : less);
                await("the cell changes", [&] { return now() != at; });
            }
        };
        step(0, row, "Up", "Down");
        step(1, column, "Left", "Right");
    }
};

const Desktop desktops[] = {{{1024, 600}, "1"},
                            {{1366, 768}, "1"},
                            {{1920, 1080}, "1"},
                            {{3840, 2160}, "1"},
                            {{1600, 1000}, "1.5"}};

std::string nameOf(const testing::TestParamInfo<Desktop>& info) { return info.param.name(); }

} // namespace

TEST_P(ANewcomerWithAMouse, ReachesTheRowsThatACriterionLeaves) {
    command("databaseMenu", "openDatabaseFile");
    screen.doubleClick(designer->place("row treeView shop.sqlite"));
    designer->awaitGone("control treeView");
    await("the drawing is empty", [this] { return designer->query().isEmpty(); });

    const auto add = [this](const QString& table) {
        const QString row = "row tables " + table;
        turnUntil("control tables", row, 20) || turnUntil("control tables", row, 20, true);
        screen.doubleClick(designer->place(row));
        awaitTable(table);
    };
    for (const QString& table : tables) add(table);
    addUntilItScrolls(add, [this] {
        const QPoint title = designer->place("title suppliers");
        screen.move(title);
        screen.press(1);
        screen.move({title.x(), designer->place("cell 0 1").y()});
        screen.release(1);
    });
    find("entry customers name");
    screen.doubleClick(designer->place("entry customers name"));
    awaitColumns(1);
    find("entry products name");
    screen.doubleClick(designer->place("entry products name"));
    awaitColumns(2);

    turnUntil("control sprColumn", "cell 4 1", 5);
    designer->click("cell 4 1");
    designer->type("txtValue", criterion);
    designer->click("control cmdSetTextValue");
    designer->awaitGone("control txtValue");
    command("queryMenu", "run");
    checkRows();
    tell("mouse");
}

TEST_P(ANewcomerWithoutAMouse, ReachesTheRowsThatACriterionLeaves) {
    screen.key("alt+d");
    designer->place("menu openDatabaseFile");
    screen.key("f");
    designer->type("fileNameEdit", "shop.sqlite");
    screen.key("Return");
    designer->awaitGone("control fileNameEdit");
    await("the drawing is empty", [this] { return designer->query().isEmpty(); });

    const auto add = [this](const QString& table) {
        screen.key("ctrl+f");
        designer->type("tableFilter", table);
        screen.key("Return");
        awaitTable(table);
    };
    for (const QString& table : tables) add(table);
    addUntilItScrolls(add, [this] {
        screen.key("ctrl+1");
        goTo(1);
        for (int n = 0; n < 300 && !scrolls(); ++n) screen.key("alt+Down");
    });
    screen.key("ctrl+1");
    goTo(1);
    select("customers", "name");
    screen.key("Return");
    awaitColumns(1);
    goTo(4);
    select("products", "name");
    screen.key("Return");
    awaitColumns(2);

    screen.key("F6");
    await("the grid has the keyboard",
          [this] { return !designer->ask("focused sprColumn").isEmpty(); });
    goToCell(4, 1);
    screen.type(criterion);
    await("it is typed",
          [this] { return designer->ask("text txtValue") == QStringList(criterion); });
    screen.key("Return");
    screen.key("F5");
    checkRows();
    tell("keys");
}

INSTANTIATE_TEST_SUITE_P(On, ANewcomerWithAMouse, testing::ValuesIn(desktops), nameOf);
INSTANTIATE_TEST_SUITE_P(On, ANewcomerWithoutAMouse, testing::ValuesIn(desktops), nameOf);

int main(int argc, char** argv) {
    // Whatever happens, nothing is left behind: the children die with this program.
    alarm(120);
    const QCoreApplication application(argc, argv);
    testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}
