#include "OpenWindow.h"

#include "designer/Banner.h"
#include "designer/document/Autosave.h"
#include "designer/run/ResultTable.h"
#include "designer/run/ResultsPanel.h"
#include "designer/statement/SqlView.h"
#include "designer/statement/StatementPanel.h"

#include <QClipboard>
#include <QComboBox>
#include <QDir>
#include <QGuiApplication>
#include <QLabel>
#include <QPushButton>
#include <QSqlDatabase>
#include <QSqlQuery>
#include <QUndoStack>

using namespace zandor;

using testing::HasSubstr;
using testing::StartsWith;
using testing::UnorderedElementsAre;

// A statement that has no drawing is run, saved, opened again and given up, and is never lost.

namespace {

const QString ranked = "SELECT name, rank() OVER (ORDER BY name) AS place\nFROM customers";

class ASleepingDrawing : public OpenWindow {
protected:
    designer::SqlView& view() { return *window->findChild<designer::SqlView*>(); }
    designer::StatementTyping& typing() {
        return *window->findChild<designer::StatementPanel*>()->typing();
    }
    std::string text() { return view().text().toStdString(); }
    std::string banner() {
        const auto& asleep = *window->findChild<designer::Banner*>("asleep");
        return asleep.isVisible() ? asleep.text().toStdString() : std::string();
    }
    void write(const QString& statement) {
        view().setFocus();
        view().type(statement);
        typing().readNow();
        calm();
    }
    bool isRefused() {
        return until([&] { return typing().refusal().has_value(); });
    }
    void run() {
        window->results().runAction()->trigger();
        EXPECT_TRUE(until([&] { return !window->results().isRunning(); }));
    }
    designer::ResultTable& rows() { return *window->findChild<designer::ResultTable*>(); }
    std::string status() { return window->findChild<QLabel*>("runStatus")->text().toStdString(); }
    std::string message() { return window->findChild<QLabel*>("runMessage")->text().toStdString(); }
    std::string at(int row, int column) {
        return rows().rows().index(row, column).data().toString().toStdString();
    }
    /// A database of the test's own with a table t of two rows.
    QString small() {
        return folder.database("small.sqlite", {"CREATE TABLE t (a INTEGER, b TEXT)",
                                                "INSERT INTO t VALUES (1, 'x'), (2, 'y')"});
    }
    /// Opens it with the table drawn.
    void openSmall() { open({.file = small(), .tables = {"t"}}); }
    void save(const char* name) { commandWithFile("saveAs", folder.path(name)); }
    /// The window is closed and another one opens the file.
    void openAgain(const char* name) { open({.file = folder.path(name)}); }
    static std::string contentOf(const QString& database) {
        std::string content;
        {
            auto connection = QSqlDatabase::addDatabase("QSQLITE", "content");
            connection.setDatabaseName(database);
            EXPECT_TRUE(connection.open());
            QSqlQuery query("SELECT group_concat(a || b) FROM t", connection);
            if (query.next()) content = query.value(0).toString().toStdString();
        }
        QSqlDatabase::removeDatabase("content");
        return content;
    }
};

} // namespace

TEST_F(ASleepingDrawing, SaysThatRunTakesTheText) {
    open({.tables = {"customers"}});
    write(ranked);
    ASSERT_TRUE(isRefused());
    EXPECT_THAT(banner(), StartsWith("Line 1, column 14: "));
    EXPECT_THAT(banner(), testing::EndsWith(
                              "The drawing sleeps until this can be read; Run takes the text as it "
                              "is."));
    EXPECT_TRUE(window->isWindowModified());
}

TEST_F(ASleepingDrawing, HasItsTextRun) {
    open({.tables = {"products"}});
    write(ranked);
    ASSERT_TRUE(isRefused());
    run();
    EXPECT_GT(rows().rows().rowCount(), 3);
    EXPECT_EQ(rows().rows().headerData(1, Qt::Horizontal).toString(), "place");
    EXPECT_EQ(at(0, 1), "1");
    EXPECT_THAT(status(), HasSubstr("of the text that was typed, not of the drawing"));
    EXPECT_THAT(status(), testing::Not(HasSubstr("has changed")));
    EXPECT_THAT(shownTables(), UnorderedElementsAre("products"));

    write(ranked + " LIMIT 1");
    EXPECT_THAT(status(), HasSubstr("the text has changed since"));
    write(ranked);
    EXPECT_THAT(status(), testing::Not(HasSubstr("has changed")));
    view().setFocus();
    hands::key(view(), Qt::Key_Escape);
    calm();
    EXPECT_THAT(status(), HasSubstr("the text has changed since"));
    run();
    EXPECT_THAT(status(), testing::Not(HasSubstr("typed")));
}

TEST_F(ASleepingDrawing, AsksForTheParametersOfItsText) {
    openSmall();
    write("SELECT a, row_number() OVER () FROM t WHERE b = :which OR a = ?");
    ASSERT_TRUE(isRefused());
    const Answering answers({[&](QDialog& dialog) {
        const auto fields = dialog.findChildren<QLineEdit*>();
        ASSERT_EQ(fields.size(), 2);
        fields[0]->setText("x");
        fields[1]->setText("7");
        dialog.accept();
    }});
    run();
    EXPECT_EQ(rows().rows().rowCount(), 1);
    EXPECT_EQ(at(0, 0), "1");
}

TEST_F(ASleepingDrawing, IsAnsweredByTheEngineWhereItsTextIsWrong) {
    openSmall();
    write("SELECT rank() OVER () FROM nowhere");
    run();
    EXPECT_EQ(message(), "The database did not run the statement:\nno such table: nowhere");
}

TEST_F(ASleepingDrawing, WritesNothingWhateverIsTyped) {
    openSmall();
    for (const char* statement :
         {"DELETE FROM t", "INSERT INTO t VALUES (3, 'z') RETURNING a", "PRAGMA user_version = 7",
          "PRAGMA query_only = 0", "WITH x AS (SELECT 1) DELETE FROM t",
          "WITH x AS (SELECT 1) UPDATE t SET a = 0", "SELECT 1; DELETE FROM t",
          "REPLACE INTO t VALUES (1, 'z')", "DROP TABLE t", "CREATE TABLE u (a)",
          "VACUUM INTO 'copy.sqlite'", "ATTACH 'other.sqlite' AS other"}) {
        write(statement);
        ASSERT_TRUE(isRefused()) << statement;
        run();
        EXPECT_NE(message(), "") << statement;
    }
    window.reset();
    EXPECT_EQ(contentOf(folder.path("small.sqlite")), "1x,2y");
    EXPECT_FALSE(QFile::exists("copy.sqlite"));
    EXPECT_FALSE(QFile::exists("other.sqlite"));
}

TEST_F(ASleepingDrawing, IsCancelledLikeADrawing) {
    openSmall();
    write("WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM n) SELECT max(i) FROM n");
    ASSERT_TRUE(isRefused());
    window->results().runAction()->trigger();
    ASSERT_TRUE(window->results().isRunning());
    calm();
    window->results().cancelAction()->trigger();
    ASSERT_TRUE(until([&] { return !window->results().isRunning(); }));
    EXPECT_THAT(status(), StartsWith("Cancelled."));
}

TEST_F(ASleepingDrawing, EndsAtTheLimitOfRows) {
    openSmall();
    write("WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM n) SELECT i FROM n");
    window->results().setLimit(1000);
    run();
    EXPECT_EQ(rows().rows().rowCount(), 1000);
    EXPECT_THAT(status(), HasSubstr("there are more"));
}

TEST_F(ASleepingDrawing, IsSavedAndOpenedWithItsText) {
    openSmall();
    const auto before = query().record();
    write("SELECT rank() OVER () FROM t");
    ASSERT_TRUE(isRefused());
    save("mine.json");
    EXPECT_FALSE(window->isWindowModified());
    openAgain("mine.json");
    EXPECT_EQ(text(), "SELECT rank() OVER () FROM t");
    ASSERT_TRUE(isRefused()) << "it was read again";
    EXPECT_NE(banner(), "");
    EXPECT_EQ(query().record(), before);
    EXPECT_FALSE(window->isWindowModified());
    run();
    EXPECT_EQ(rows().rows().rowCount(), 2);

    window->findChild<QPushButton*>("backToDrawing")->click();
    calm();
    EXPECT_THAT(text(), HasSubstr("FROM t"));
    EXPECT_THAT(text(), testing::Not(HasSubstr("rank")));
    EXPECT_EQ(banner(), "");
    EXPECT_TRUE(window->isWindowModified()) << "the file still has it";
    command("undo");
    EXPECT_EQ(text(), "SELECT rank() OVER () FROM t");
    EXPECT_FALSE(window->isWindowModified());
    ASSERT_TRUE(isRefused());
    command("redo");
    command("save");
    openAgain("mine.json");
    EXPECT_THAT(text(), testing::Not(HasSubstr("rank")));
}

TEST_F(ASleepingDrawing, IsReadAgainOnceItsFileIsOpenAndDrawnIfItCanBe) {
    openSmall();
    write("SELECT c FROM t");
    ASSERT_TRUE(isRefused());
    save("mine.json");
    window.reset();
    QFile::remove(folder.path("small.sqlite"));
    folder.database("small.sqlite", {"CREATE TABLE t (a INTEGER, c TEXT)"});
    openAgain("mine.json");
    ASSERT_TRUE(until([&] { return !typing().sleeps(); }));
    EXPECT_EQ(query().ColumnDefinitions().Count(), 1);
    EXPECT_EQ(window->document().steps().count(), 1);
    EXPECT_TRUE(window->isWindowModified());
}

TEST_F(ASleepingDrawing, WaitsForADatabase) {
    openSmall();
    write("SELECT rank() OVER () FROM t");
    save("mine.json");
    window.reset();
    QFile::remove(folder.path("small.sqlite"));
    answering([&](QMessageBox& box) { press(box, "Close"); }, [&] { openAgain("mine.json"); });
    EXPECT_EQ(text(), "SELECT rank() OVER () FROM t");
    EXPECT_EQ(banner(), "This text is not drawn, and the drawing sleeps: open a database, and it "
                        "is read.");
    EXPECT_TRUE(view().isReadOnly());
    EXPECT_FALSE(window->isWindowModified());
    window->findChild<QPushButton*>("backToDrawing")->click();
    calm();
    EXPECT_EQ(banner(), "");
}

TEST_F(ASleepingDrawing, AsksBeforeItsTextIsLost) {
    openSmall();
    write("SELECT rank() OVER () FROM t");
    std::string asked;
    answering([&](QMessageBox& box) { asked = box.text().toStdString(), press(box, "Cancel"); },
              [&] { window->close(); });
    EXPECT_EQ(asked, "Save the changes to \"Untitled\"?");
    EXPECT_TRUE(window->isVisible());
    answering([&](QMessageBox& box) { press(box, "Cancel"); }, [&] { command("new"); });
    EXPECT_EQ(text(), "SELECT rank() OVER () FROM t");
}

TEST_F(ASleepingDrawing, IsNotAskedForWhenNothingIsLost) {
    openSmall();
    write("SELECT rank() OVER () FROM t");
    hands::key(view(), Qt::Key_Escape);
    calm();
    EXPECT_TRUE(window->close());
}

TEST_F(ASleepingDrawing, GivesItsTextUpInAStep) {
    openSmall();
    write("SELECT rank() OVER () FROM t");
    hands::key(view(), Qt::Key_Escape);
    calm();
    EXPECT_EQ(window->document().steps().undoText(), "Back to the drawing");
    hands::shortcut(view(), Qt::Key_Z, Qt::ControlModifier);
    calm();
    EXPECT_EQ(text(), "SELECT rank() OVER () FROM t");
    ASSERT_TRUE(isRefused());
}

TEST_F(ASleepingDrawing, LosesNoTextToOneThatIsPasted) {
    openSmall();
    write("SELECT rank() OVER () FROM t");
    ASSERT_TRUE(isRefused());
    QGuiApplication::clipboard()->setText("SELECT b FROM t");
    command("pasteSql");
    EXPECT_FALSE(typing().sleeps());
    EXPECT_EQ(query().ColumnDefinitions().Count(), 1);
    command("undo");
    EXPECT_EQ(query().ColumnDefinitions().Count(), 0);
    command("undo");
    EXPECT_EQ(text(), "SELECT rank() OVER () FROM t");
}

TEST_F(ASleepingDrawing, KeepsItsTextWhileTheDrawingIsChanged) {
    openSmall();
    write("SELECT rank() OVER () FROM t");
    add("t");
    EXPECT_EQ(query().Tables().Count(), 2);
    EXPECT_EQ(text(), "SELECT rank() OVER () FROM t");
    command("undo");
    EXPECT_EQ(query().Tables().Count(), 1);
    EXPECT_EQ(text(), "SELECT rank() OVER () FROM t");
    EXPECT_NE(banner(), "");
}

TEST_F(ASleepingDrawing, IsReadInTheDialectThatIsChosen) {
    openSmall();
    write("SELECT TOP 1 a FROM t");
    ASSERT_TRUE(isRefused());
    auto& dialects = *window->findChild<designer::StatementPanel*>()->findChild<QComboBox*>();
    dialects.setCurrentText("SQL Server");
    ASSERT_TRUE(until([&] { return !typing().sleeps(); }));
    EXPECT_EQ(query().options().first, 1);
}

TEST_F(ASleepingDrawing, IsOpenedInTheDialectOfItsText) {
    openSmall();
    auto& dialects = *window->findChild<designer::StatementPanel*>()->findChild<QComboBox*>();
    dialects.setCurrentText("PostgreSQL");
    calm();
    write("SELECT rank() OVER () FROM t");
    ASSERT_TRUE(isRefused());
    run();
    EXPECT_EQ(message(), "The text that was typed cannot be run:\nThe text is in PostgreSQL, and "
                         "the database speaks SQLite: choose that above the text.");
    save("mine.json");
    openAgain("mine.json");
    ASSERT_TRUE(isRefused());
    EXPECT_EQ(window->findChild<designer::StatementPanel*>()->dialect(),
              model::sql::Dialect::PostgreSQL);
    EXPECT_FALSE(window->isWindowModified());
}

TEST_F(ASleepingDrawing, KeepsATextOfAMillionSigns) {
    openSmall();
    const QString large = "SELECT rank() OVER () FROM t -- " + QString(500'000, u'x') + '\n' +
                          QString("-- a line\n").repeated(50'000);
    write(large);
    ASSERT_TRUE(isRefused());
    save("large.json");
    openAgain("large.json");
    EXPECT_EQ(text().size(), static_cast<std::size_t>(large.size()));
    EXPECT_EQ(view().text(), large);
    run();
    EXPECT_EQ(rows().rows().rowCount(), 2);
}

TEST_F(ASleepingDrawing, ShowsWhatNoTextMayHaveAndSavesIt) {
    openSmall();
    const QString bad =
        QStringLiteral("SELECT ") + QChar(0) + "a" + QChar(0xD800) + ", rank() OVER () FROM t";
    QGuiApplication::clipboard()->setText(bad);
    view().setFocus();
    view().selectAll();
    view().paste();
    typing().readNow();
    calm();
    EXPECT_EQ(view().text(), QStringLiteral("SELECT \ufffda\ufffd, rank() OVER () FROM t"));
    save("mine.json");
    EXPECT_FALSE(window->isWindowModified());
}

TEST_F(ASleepingDrawing, IsRecovered) {
    openSmall();
    const QString autosave = folder.path("autosave");
    window->keepSafe(autosave);
    write("SELECT rank() OVER () FROM t");
    ASSERT_TRUE(until([&] { return !QDir(autosave).entryList({"*.autosave"}).isEmpty(); }));
    // As if it had been killed.
    for (const QString& name : QDir(autosave).entryList({"*.autosave"}))
        ASSERT_TRUE(
            QFile::copy(QDir(autosave).filePath(name), QDir(autosave).filePath("0" + name)));
    window = std::make_unique<designer::DesignerWindow>();
    window->show();
    answering([&](QMessageBox& box) { press(box, "&Recover"); },
              [&] { window->keepSafe(autosave); });
    EXPECT_EQ(text(), "SELECT rank() OVER () FROM t");
    EXPECT_TRUE(window->isWindowModified());
    ASSERT_TRUE(isRefused());
}
