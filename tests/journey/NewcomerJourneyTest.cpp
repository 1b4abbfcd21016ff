#include "Designer.h"
#include "Home.h"
#include "Reference.h"

#include <QCoreApplication>
#include <QFile>

#include <gtest/gtest.h>

#include <cstdio>
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
/// screen: from a database of their own through five of its tables to the rows that a criterion
/// leaves.
class ANewcomer : public testing::TestWithParam<Desktop> {
protected:
    const QStringList tables = {"customers", "orders", "order_lines", "products", "suppliers"};
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

    void checkRows() {
        QStringList expected = reference(
            "SELECT c.name, p.name FROM customers c JOIN orders o ON o.customer_id = c.id "
            "JOIN order_lines l ON l.order_id = o.id JOIN products p ON p.id = l.product_id "
            "JOIN suppliers s ON s.id = p.supplier_id WHERE c.name LIKE 'Du%'");
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

    for (const QString& table : tables) {
        const QString row = "row tables " + table;
        turnUntil("control tables", row, 20) || turnUntil("control tables", row, 20, true);
        screen.doubleClick(designer->place(row));
        awaitTable(table);
    }
    EXPECT_EQ(designer->query().filter("join ").size(), 4);
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

    for (const QString& table : tables) {
        screen.key("ctrl+f");
        designer->type("tableFilter", table);
        screen.key("Return");
        awaitTable(table);
    }
    EXPECT_EQ(designer->query().filter("join ").size(), 4);
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
