#include "OpenWindow.h"

#include "designer/database/ConnectionDialog.h"

#include <Zandor/QueryDocument.h>

#include <QFile>

using namespace zandor;

using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;
using testing::UnorderedElementsAre;

namespace {

class TheWindowsFiles : public OpenWindow {
protected:
    /// What is asked before changes are lost, and answered with a button.
    std::string asked(const char* button, const std::function<void()>& run) {
        std::string text;
        answering([&](QMessageBox& box) { text = box.text().toStdString(), press(box, button); },
                  run);
        return text;
    }
    QString savedQuery(const QString& name, const QString& database, const QStringList& tables) {
        files::QueryDocument document{openedSample(tables).query};
        document.database = database.toStdU16String();
        EXPECT_FALSE(files::saveQuery(folder.path(name).toStdString(), document));
        return folder.path(name);
    }
};

} // namespace

TEST_F(TheWindowsFiles, AreNamedAsTheyAreWhateverTheirNamesMeanToAWindow) {
    open();
    add("orders");
    const QString path = folder.path("a[*]b\nc.json");
    commandWithFile("save", path);
    EXPECT_TRUE(QFile::exists(path));
    EXPECT_FALSE(window->isWindowModified());
    // To the window, two of its marks are one of the name's.
    EXPECT_THAT(title(), StartsWith("a[*][*]b\u21b5c.json[*] "));
    commandWithFile("open", path);
    EXPECT_THAT(shownTables(), testing::Contains("orders"));
}

TEST_F(TheWindowsFiles, AreMadeSavedAndOpenedAgainByTheMenu) {
    open();
    command("new");
    EXPECT_THAT(shownTables(), ElementsAre());
    EXPECT_EQ(title(), "Untitled[*] \u2014 trading.sqlite \u2014 Zandor Designer");
    add("orders");
    EXPECT_TRUE(window->isWindowModified());
    commandWithFile("save", folder.path("mine.json"));
    EXPECT_EQ(title(), "mine.json[*] \u2014 trading.sqlite \u2014 Zandor Designer");
    EXPECT_FALSE(window->isWindowModified());

    add("customers");
    EXPECT_TRUE(window->isWindowModified());
    {
        const Answering answers({[&](QDialog& dialog) {
            // The dialog selects the old name when it has read the folder.
            auto* const names = dialog.findChild<QListView*>("listView");
            EXPECT_TRUE(until([&] { return names->selectionModel()->hasSelection(); }));
            names->clearSelection();
            choose(dialog, folder.path("other")); // the suffix comes of itself
        }});
        command("saveAs");
    }
    EXPECT_THAT(title(), StartsWith("other.json[*]"));
    EXPECT_FALSE(window->isWindowModified());

    commandWithFile("open", folder.path("mine.json"));
    EXPECT_THAT(title(), StartsWith("mine.json[*]"));
    EXPECT_THAT(shownTables(), ElementsAre("orders"));
    // Nobody is asked where a query that has a file is to be saved.
    add("payments");
    command("save");
    EXPECT_FALSE(window->isWindowModified());

    QMenu* const recent = menu("fileMenu").findChild<QMenu*>();
    click(*recent, [](const QAction& entry) { return entry.text().endsWith("other.json"); });
    EXPECT_THAT(title(), StartsWith("other.json[*]"));
    EXPECT_THAT(shownTables(), UnorderedElementsAre("orders", "customers"));
    EXPECT_FALSE(window->isWindowModified());
}

TEST_F(TheWindowsFiles, ThatAreBrokenAreToldInOneLineAndNothingIsLost) {
    open();
    add("payments");
    const auto before = query().record();
    const QString broken = folder.file("broken.json", "{\"format\": \"zandor-que");
    std::string text;
    {
        const Answering answers({[](QDialog& dialog) { press(dialog, "Discard"); },
                                 [&](QDialog& dialog) { choose(dialog, broken); },
                                 [&](QDialog& dialog) {
                                     text = dynamic_cast<QMessageBox&>(dialog).text().toStdString();
                                     dialog.accept();
                                 }});
        command("open");
    }
    EXPECT_THAT(text, HasSubstr("broken.json"));
    EXPECT_EQ(std::count(text.begin(), text.end(), '\n'), 0) << text;
    EXPECT_EQ(query().record(), before);
    EXPECT_TRUE(window->isWindowModified());
    EXPECT_THAT(title(), StartsWith("Untitled[*]"));
    window->document().setModified(false);
}

TEST_F(TheWindowsFiles, AreShownWhenTheirDatabaseIsGone) {
    const QString file = savedQuery("lonely.json", folder.path("gone.db"), {"orders", "customers"});
    open();
    std::string text;
    {
        const Answering answers({[&](QDialog& dialog) { choose(dialog, file); },
                                 [&](QDialog& dialog) {
                                     text = dynamic_cast<QMessageBox&>(dialog).text().toStdString();
                                     press(dialog, "Close");
                                 }});
        command("open");
    }
    EXPECT_THAT(text, StartsWith("The query is open, but not its database. There is no file"));
    // Nor is the one before, which the query does not ask.
    EXPECT_FALSE(window->database().isOpen());
    EXPECT_EQ(title(), "lonely.json[*] \u2014 Zandor Designer");
    EXPECT_THAT(text, EndsWith("check the path."));
    EXPECT_THAT(shownTables(), UnorderedElementsAre("orders", "customers"));
    EXPECT_THAT(title(), StartsWith("lonely.json[*]"));
    EXPECT_FALSE(window->isWindowModified());
}

TEST_F(TheWindowsFiles, FollowTheirDatabaseToWhereItIsNow) {
    const QString file = savedQuery("moved.json", folder.path("gone.db"), {"orders"});
    const QString now = folder.path("now.db");
    ASSERT_TRUE(QFile::copy(sampleDatabase(), now));
    open();
    {
        const Answering answers({[&](QDialog& dialog) { choose(dialog, file); },
                                 [](QDialog& dialog) { press(dialog, "&Choose database\u2026"); },
                                 [&](QDialog& dialog) {
                                     auto& form = dynamic_cast<designer::ConnectionDialog&>(dialog);
                                     EXPECT_EQ(form.address(), folder.path("gone.db"));
                                     form.setAddress(now);
                                     press(dialog, "Open");
                                 }});
        command("open");
    }
    EXPECT_EQ(title(), "moved.json[*] \u2014 now.db \u2014 Zandor Designer");
    EXPECT_THAT(shownTables(), ElementsAre("orders"));
    command("save");
    const auto saved = files::loadQuery(file.toStdString());
    ASSERT_TRUE(saved);
    EXPECT_EQ(saved->database, now.toStdU16String());
}

TEST_F(TheWindowsFiles, BringTheirDatabaseAlong) {
    const QString other =
        folder.database("other.db", {"CREATE TABLE only (id INTEGER PRIMARY KEY)"});
    const QString file = savedQuery("query.json", sampleDatabase(), {"orders"});
    open({.file = other, .tables = {"only"}});
    EXPECT_THAT(shownTables(), ElementsAre("only"));
    commandWithFile("open", file);
    EXPECT_EQ(window->database().name(), "trading.sqlite");
    EXPECT_EQ(list().model()->rowCount(), 16);
    EXPECT_EQ(title(), "query.json[*] \u2014 trading.sqlite \u2014 Zandor Designer");
}

TEST_F(TheWindowsFiles, AreAskedAboutBeforeAnotherDatabaseBeginsAQuery) {
    const QString other =
        folder.database("other.db", {"CREATE TABLE only (id INTEGER PRIMARY KEY)"});
    open();
    add("payments");
    const auto before = query().record();
    {
        const Answering answers({[&](QDialog& dialog) { choose(dialog, other); },
                                 [](QDialog& dialog) { press(dialog, "Cancel"); }});
        command("openDatabaseFile");
    }
    EXPECT_EQ(query().record(), before);
    EXPECT_EQ(window->database().name(), "trading.sqlite");
    EXPECT_TRUE(window->isWindowModified());
    {
        const Answering answers({[&](QDialog& dialog) { choose(dialog, other); },
                                 [](QDialog& dialog) { press(dialog, "Discard"); }});
        command("openDatabaseFile");
    }
    EXPECT_THAT(shownTables(), ElementsAre());
    EXPECT_EQ(title(), "Untitled[*] \u2014 other.db \u2014 Zandor Designer");
    EXPECT_FALSE(window->isWindowModified());
    EXPECT_EQ(asked("Discard",
                    [&] {
                        add("only");
                        click(*menu("databaseMenu").findChild<QMenu*>(), [](const QAction& entry) {
                            return entry.text().endsWith("trading.sqlite");
                        });
                    }),
              "Save the changes to \"Untitled\"?");
    EXPECT_EQ(window->database().name(), "trading.sqlite");
}

TEST_F(TheWindowsFiles, StayWhenANewQueryIsNotWanted) {
    open();
    add("payments");
    EXPECT_EQ(asked("Cancel", [&] { command("new"); }), "Save the changes to \"Untitled\"?");
    EXPECT_TRUE(shownTable("payments"));
    EXPECT_TRUE(window->isWindowModified());
    window->document().setModified(false);
}
