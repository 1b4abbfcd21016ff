#include "Designer.h"
#include "Home.h"
#include "Reference.h"

#include "support/PostgresServer.h"

#include <QFile>
#include <QFileInfo>
#include <QSqlError>
#include <QSqlQuery>

#include <gtest/gtest.h>

#include <QCoreApplication>
#include <QDir>

#include <unistd.h>

namespace {

/// A new user's way with the designer itself, with settings and a home of its own.
class ADesignersDay : public testing::Test {
protected:
    void start(const QStringList& arguments = {}) {
        designer.reset();
        designer = std::make_unique<Designer>(screen, QStringLiteral(ZANDOR_APPLICATION_HOST),
                                              QStringList(home.filePath("autosave")) + arguments,
                                              home.environment());
    }

    void command(const QString& menu, const QString& name) {
        designer->click("menu " + menu);
        designer->click("menu " + name);
        designer->awaitGone("menu " + name);
    }

    void addTable(const QString& name) {
        designer->click("control tableFilter");
        screen.key("ctrl+a");
        designer->type("tableFilter", name);
        screen.key("Return");
        designer->place("title " + name);
    }

    void giveCriterion(const QString& cell, const QString& text) {
        designer->click(cell);
        designer->type("txtValue", text);
        screen.key("Return");
        designer->awaitGone("control txtValue");
    }

    void quit() {
        designer->click("menu fileMenu");
        designer->click("menu quit");
    }

    void quitWithoutSaving() {
        quit();
        designer->click("button Discard");
        EXPECT_TRUE(designer->endsWell());
    }

    QStringList awaitRows(int count) {
        QStringList rows;
        await(QStringLiteral("%1 rows are shown").arg(count), [&] {
            rows = designer->ask("text resultTable");
            return rows.size() == count;
        });
        return rows;
    }

    Home home;
    Screen screen;
    std::unique_ptr<Designer> designer;
};

} // namespace

TEST_F(ADesignersDay, LeadsFromAnEmptyDrawingToRowsAndAFileAndBack) {
    start();
    command("fileMenu", "new");
    for (const char* table : {"suppliers", "products", "customers"}) addTable(table);
    EXPECT_EQ(designer->query().filter("join "),
              QStringList("join products.supplier_id = suppliers.id, type 0"));
    designer->picture("application-1-three-tables");

    designer->click("entry customers country_code");
    designer->carry("entry customers country_code", "entry suppliers country_code");
    designer->drop();
    designer->place("join 2");

    designer->click("entry customers name");
    designer->carry("entry customers name", "cell 1 1");
    designer->drop();
    await("the column is there", [&] { return designer->query().filter("column ").size() == 1; });
    designer->click("entry products name");
    designer->carry("entry products name", "cell 1 2");
    designer->drop();
    await("the column is there", [&] { return designer->query().filter("column ").size() == 2; });

    designer->click("cell 2 1");
    designer->place("item cobSortOrder 1"); // the list drops down by itself
    screen.key("Down");
    screen.key("Return");
    designer->awaitGone("control cobSortOrder");
    await("the order is set", [&] { return designer->query().filter("sort 1").size() == 1; });
    giveCriterion("cell 4 1", "Like 'A*'");
    giveCriterion("cell 4 2", "Like '*e*'");

    command("queryMenu", "run");
    const QStringList expected = reference(
        "SELECT c.name, p.name FROM customers c JOIN suppliers s ON c.country_code = "
        "s.country_code JOIN products p ON p.supplier_id = s.id WHERE c.name LIKE 'A%' AND p.name "
        "LIKE '%e%' ORDER BY c.name");
    ASSERT_GT(expected.size(), 3);
    QStringList rows = awaitRows(static_cast<int>(expected.size()));
    // Products of one customer come in any order.
    EXPECT_EQ(QStringList(rows.begin(), rows.end()).filter(" | ").size(), expected.size());
    QStringList sorted = rows;
    QStringList sortedReference = expected;
    sorted.sort();
    sortedReference.sort();
    EXPECT_EQ(sorted, sortedReference);
    designer->picture("application-2-rows");

    const QString file = home.filePath("mine.json");
    screen.key("ctrl+s");
    designer->type("fileNameEdit", file);
    screen.key("Return");
    await("the file is there", [&] { return QFileInfo::exists(file); });
    const QStringList saved = designer->query();
    quit();
    EXPECT_TRUE(designer->endsWell());

    start({file});
    EXPECT_EQ(designer->query(), saved);
    designer->click("close customers");
    designer->awaitGone("title customers");
    EXPECT_NE(designer->query(), saved);
    command("editMenu", "undo");
    designer->place("title customers");
    EXPECT_EQ(designer->query(), saved);
    command("queryMenu", "run");
    rows = awaitRows(static_cast<int>(expected.size()));
    quit();
    EXPECT_TRUE(designer->endsWell());
}

TEST_F(ADesignersDay, GoesOnAfterAPowerFailure) {
    start();
    command("fileMenu", "new");
    addTable("suppliers");
    addTable("products");
    const QStringList drawn = designer->query();
    await("it is kept safe", [&] {
        const QDir folder(home.filePath("autosave"));
        return !folder.entryList({"*.autosave"}, QDir::Files).isEmpty();
    });
    designer->kill();

    start();
    designer->click("button Recover");
    await("the query is there again", [&] { return designer->query() == drawn; });
    quitWithoutSaving();
}

// Nobody sees what a program says that was started from a desktop.
TEST_F(ADesignersDay, BeginsWithAWindowEvenIfItsFileCannotBeOpened) {
    QFile broken(home.filePath("broken.json"));
    ASSERT_TRUE(broken.open(QIODevice::WriteOnly));
    broken.write("{");
    broken.close();
    Program program(QStringLiteral(ZANDOR_DESIGNER), {broken.fileName()},
                    home.environment() + QStringList(screen.variable()));
    await("its window is there", [this] { return screen.shows("Zandor"); });
    program.kill();
}

TEST_F(ADesignersDay, ShowsWhereAFindingIs) {
    start();
    command("fileMenu", "new");
    designer->place("control invitation");
    designer->picture("application-4-empty");
    designer->carry("row tables orders", "canvas 40 20");
    designer->drop();
    designer->place("title orders");
    designer->carry("row tables customers", "canvas 400 20");
    designer->drop();
    designer->place("join 1");
    EXPECT_FALSE(designer->isShown("control invitation"));
    int column = 0;
    for (const char* table : {"customers", "orders"}) {
        const QString id = QStringLiteral("entry %1 id").arg(QLatin1String(table));
        designer->click(id);
        designer->carry(id, QStringLiteral("cell 1 %1").arg(++column));
        designer->drop();
        await("the column is there",
              [&] { return designer->query().filter("column ").size() == column; });
    }
    designer->click("entry customers name");
    designer->click("row findings Two output columns are named id, so that nobody can tell them "
                    "apart: give one of them a synonym.");
    await("its column is selected",
          [&] { return designer->ask("selected orders") == QStringList("id"); });
    designer->picture("application-5-finding");
    quitWithoutSaving();
}

TEST_F(ADesignersDay, GoesOnWhenTheServerComesBack) {
    PostgresServer server;
    {
        const QSqlDatabase database = server.connect("journey");
        for (const char* statement :
             {"CREATE TABLE teams (id integer PRIMARY KEY, name text)",
              "CREATE TABLE players (id integer PRIMARY KEY, team_id integer REFERENCES teams, "
              "name text)",
              "INSERT INTO teams VALUES (1, 'Reds'), (2, 'Blues')",
              "INSERT INTO players VALUES (1, 1, 'Ann'), (2, 2, 'Bob'), (3, 2, 'Cid')"}) {
            QSqlQuery query(database);
            ASSERT_TRUE(query.exec(statement)) << query.lastError().text().toStdString();
        }
    }
    QSqlDatabase::removeDatabase("journey");

    start({"--tables", "teams,players",
           "postgresql://postgres@localhost/postgres?host=" + server.folder()});
    EXPECT_EQ(designer->query().filter("join "),
              QStringList("join players.team_id = teams.id, type 0"));
    designer->click("entry players name");
    designer->carry("entry players name", "cell 1 1");
    designer->drop();
    await("the column is there", [&] { return designer->query().filter("column ").size() == 1; });
    command("queryMenu", "run");
    awaitRows(3);

    server.kill();
    command("queryMenu", "run");
    designer->place("control reconnect");
    designer->picture("application-3-connection-lost");
    const QStringList drawn = designer->query();
    server.restart();
    designer->click("control reconnect");
    designer->awaitGone("control reconnect");
    EXPECT_EQ(designer->query(), drawn);
    command("queryMenu", "run");
    awaitRows(3);
    quitWithoutSaving();
}

int main(int argc, char** argv) {
    // Whatever happens, nothing is left behind: the children die with this program.
    alarm(300);
    const QCoreApplication application(argc, argv);
    testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}
