#include "Designer.h"
#include "Home.h"

#include <gtest/gtest.h>

#include <QCoreApplication>
#include <QFile>

#include <unistd.h>

// From a statement that somebody has to its drawing, a change in that, and the statement again.

namespace {

const QString statement =
    QStringLiteral("SELECT c.name, o.id, p.name AS product, l.quantity, s.name AS supplier "
                   "FROM customers c, orders o, order_lines l, products p, suppliers s "
                   "WHERE o.customer_id = c.id AND l.order_id = o.id AND l.product_id = p.id "
                   "AND p.supplier_id = s.id AND l.quantity > 10");

const QString commented = statement + " -- what sells";

class AStatementOnAScreen : public testing::Test {
protected:
    AStatementOnAScreen() {
        QFile::copy(QStringLiteral(ZANDOR_SAMPLE_DATABASE), home.filePath("shop.sqlite"));
        designer = std::make_unique<Designer>(
            screen, QStringLiteral(ZANDOR_APPLICATION_HOST),
            QStringList{home.filePath("autosave"), home.filePath("shop.sqlite")},
            home.environment() + QStringList{"ZANDOR_MAXIMISED=1"});
    }
    QString text() { return designer->ask("text statement").join('\n'); }
    void goToStatement() {
        screen.key("ctrl+3");
        await("the statement has the keyboard",
              [this] { return !designer->ask("focused statement").isEmpty(); });
    }
    qsizetype tables() { return designer->query().filter("table ").size(); }

    Home home;
    Screen screen;
    std::unique_ptr<Designer> designer;
};

} // namespace

TEST_F(AStatementOnAScreen, IsPastedChangedInTheDrawingAndCopied) {
    // Onto the clipboard from where it was typed, with an end that no drawing has.
    goToStatement();
    screen.type(statement + " FOR UPDATE");
    await("it is refused", [this] { return designer->isShown("control asleep"); });
    designer->picture("statement-1-refused");
    EXPECT_EQ(tables(), 0);
    for (int n = 0; n < 11; ++n) screen.key("BackSpace");
    screen.type(" -- what sells");
    screen.key("ctrl+a");
    screen.key("ctrl+x");
    await("there is none any more", [this] { return text().isEmpty(); });
    screen.key("ctrl+1");
    screen.key("ctrl+shift+v");
    await("five tables are drawn", [this] { return tables() == 5; });
    EXPECT_EQ(designer->query().filter("join ").size(), 4);
    EXPECT_EQ(text(), commented);
    designer->picture("statement-2-drawn");

    const QPoint title = designer->place("title c");
    screen.move(title);
    screen.press(1);
    screen.move(title + QPoint(40, 60));
    screen.move(title + QPoint(60, 90));
    screen.release(1);
    await("the table has moved", [&] { return designer->place("title c") != title; });
    const QPoint moved = designer->place("title c");
    EXPECT_EQ(text(), commented) << "a place is nothing that a statement says";

    designer->click("cell 4 1");
    designer->type("txtValue", "Like 'A*'");
    screen.key("Return");
    await("the statement says it", [this] { return text().contains("LIKE 'A%'"); });
    designer->picture("statement-3-criterion");

    // Copied with its comment: put in the place of all, it is there.
    const QString said = text();
    EXPECT_TRUE(said.contains("l.quantity > 10 -- what sells")) << said.toStdString();
    designer->click("control copy");
    goToStatement();
    screen.key("ctrl+a");
    screen.key("ctrl+v");
    await("what was copied is there", [this] { return text().endsWith(';'); });
    EXPECT_EQ(text().remove(';').trimmed(), said.trimmed());
    EXPECT_EQ(tables(), 5);

    // Typed on, and the table stays where it was put.
    goToStatement();
    screen.key("ctrl+End");
    screen.key("BackSpace");
    screen.type("AND o.id > 5");
    await("the drawing says it", [this] { return !designer->query().filter("> 5").isEmpty(); });
    EXPECT_EQ(designer->place("title c"), moved);
    screen.key("ctrl+a");
    screen.key("ctrl+c");
    screen.key("ctrl+shift+v");
    EXPECT_EQ(designer->place("title c"), moved);
}

TEST_F(AStatementOnAScreen, ThatHasNoDrawingIsRunSavedOpenedAndGivenUp) {
    const QString ranked = "SELECT name, rank() OVER (ORDER BY name DESC) AS place FROM customers "
                           "WHERE id < 8";
    goToStatement();
    screen.type("SELECT name FROM customers");
    await("it is drawn", [this] { return tables() == 1; });
    screen.key("ctrl+a");
    screen.type(ranked);
    await("it is refused", [this] { return designer->isShown("control asleep"); });
    designer->picture("statement-4-asleep");

    screen.key("F5");
    await("its rows have come", [this] {
        return designer->ask("text runStatus").join(' ').contains("of the text that was typed");
    });
    EXPECT_TRUE(designer->ask("text runStatus").join(' ').startsWith("Rows: 7"));
    designer->picture("statement-5-rows");

    screen.key("ctrl+s");
    const QString file = home.filePath("ranked.json");
    designer->place("control fileNameEdit");
    screen.key("ctrl+a");
    screen.type(file);
    screen.key("Return");
    await("it is saved", [&] { return QFile::exists(file); });
    EXPECT_TRUE(designer->quit()) << "nothing is left to be asked for";

    designer = std::make_unique<Designer>(screen, QStringLiteral(ZANDOR_APPLICATION_HOST),
                                          QStringList{home.filePath("autosave"), file},
                                          home.environment() + QStringList{"ZANDOR_MAXIMISED=1"});
    await("it sleeps", [this] { return designer->isShown("control asleep"); });
    EXPECT_EQ(text(), ranked);
    EXPECT_EQ(tables(), 1);
    screen.key("F5");
    await("its rows have come again", [this] {
        return designer->ask("text runStatus").join(' ').contains("of the text that was typed");
    });
    screen.key("ctrl+3");
    designer->click("control backToDrawing");
    designer->awaitGone("control asleep");
    await("the drawing is awake", [this] { return text().startsWith("SELECT\n"); });
    screen.key("ctrl+z");
    await("the text is back", [&] { return text() == ranked; });
    await("and sleeps", [this] { return designer->isShown("control asleep"); });
}

int main(int argc, char** argv) {
    // Whatever happens, nothing is left behind: the children die with this program.
    alarm(120);
    const QCoreApplication application(argc, argv);
    testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}
