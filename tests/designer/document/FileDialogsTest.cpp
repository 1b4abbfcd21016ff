#include "Answers.h"
#include "Drawing.h"

#include "designer/document/FileDialogs.h"
#include "designer/document/QueryFile.h"
#include "designer/document/RecentFiles.h"

#include <QTemporaryDir>

using namespace zandor;

namespace {

class TheFileDialogs : public testing::Test {
protected:
    TheFileDialogs() { window.setWindowTitle(QStringLiteral("[*]Query")); }

    QString path(const char* name) const { return folder.filePath(QLatin1String(name)); }
    void modify() {
        drawing.join(u"customers", u"orders");
        drawing.document.settle();
    }
    /// Presses a button of the question for changes; returns what it asked.
    std::string asked(const char* button, const std::function<void()>& run) {
        std::string text;
        answering([&](QMessageBox& box) { text = textOf(box), press(box, button); }, run);
        return text;
    }

    QTemporaryDir folder;
    Drawing drawing;
    QWidget window;
    QSettings settings{folder.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat};
    designer::QueryFile file{drawing.document};
    designer::RecentFiles recent{settings, QStringLiteral("queries")};
    designer::FileDialogs dialogs{drawing.document, file, recent, window};
};

} // namespace

TEST_F(TheFileDialogs, MarkTheWindowAsLongAsTheQueryIsModified) {
    EXPECT_FALSE(window.isWindowModified());
    modify();
    EXPECT_TRUE(window.isWindowModified());
    drawing.document.undo();
    EXPECT_FALSE(window.isWindowModified());
}

TEST_F(TheFileDialogs, AskNothingWhenThereIsNothingToLose) {
    EXPECT_TRUE(dialogs.mayLose());
    EXPECT_TRUE(dialogs.startNew());
    EXPECT_EQ(drawing.query().Tables().Count(), 0);
}

TEST_F(TheFileDialogs, NameTheFileWhoseChangesWouldBeLost) {
    ASSERT_FALSE(file.saveAs(path("orders.json")));
    modify();
    bool may = true;
    EXPECT_EQ(asked("Cancel", [&] { may = dialogs.mayLose(); }),
              "Save the changes to \"orders.json\"?\nChanges that are not saved are lost.");
    EXPECT_FALSE(may);
    EXPECT_TRUE(drawing.document.isModified());
}

TEST_F(TheFileDialogs, GiveTheQueryUpWhenTheUserDiscardsIt) {
    modify();
    bool done = false;
    EXPECT_EQ(asked("Discard", [&] { done = dialogs.startNew(); })
                  .find("Save the changes to "
                        "\"Untitled\"?"),
              0u);
    EXPECT_TRUE(done);
    EXPECT_FALSE(window.isWindowModified());
}

TEST_F(TheFileDialogs, SaveBeforeTheQueryGoes) {
    ASSERT_FALSE(file.saveAs(path("orders.json")));
    modify();
    asked("Save", [&] { EXPECT_TRUE(dialogs.startNew()); });
    ASSERT_FALSE(file.open(path("orders.json")));
    EXPECT_EQ(drawing.query().Joins().Count(), 1);
}

TEST_F(TheFileDialogs, AskForAFileWhenThereIsNone) {
    modify();
    bool done = false;
    {
        const Answering answers({[&](QDialog& dialog) { press(dialog, "Save"); },
                                 [&](QDialog& dialog) {
                                     auto& files = dynamic_cast<QFileDialog&>(dialog);
                                     EXPECT_EQ(files.nameFilters().first(),
                                               "Zandor queries (*.json)");
                                     choose(dialog, path("orders"));
                                 }});
        done = dialogs.mayLose();
    }
    EXPECT_TRUE(done);
    EXPECT_EQ(file.path(), path("orders.json")) << "with the usual suffix";
    EXPECT_EQ(recent.list(), QStringList(path("orders.json")));
}

TEST_F(TheFileDialogs, KeepTheQueryWhenItsSavingIsCancelled) {
    modify();
    const Answering answers({[&](QDialog& dialog) { press(dialog, "Save"); },
                             [](QDialog& dialog) { hands::key(dialog, Qt::Key_Escape); }});
    EXPECT_FALSE(dialogs.startNew());
    EXPECT_EQ(drawing.query().Joins().Count(), 1);
}

TEST_F(TheFileDialogs, OpenTheFileThatIsChosen) {
    modify();
    ASSERT_FALSE(file.saveAs(path("orders.json")));
    file.startNew();
    bool told = false;
    QObject::connect(&dialogs, &designer::FileDialogs::opened, [&told] { told = true; });
    {
        const Answering answers({[&](QDialog& dialog) { choose(dialog, path("orders.json")); }});
        EXPECT_TRUE(dialogs.open());
    }
    EXPECT_TRUE(told);
    EXPECT_EQ(drawing.query().Joins().Count(), 1);
    EXPECT_EQ(recent.list(), QStringList(path("orders.json")));
}

TEST_F(TheFileDialogs, TellWhyAFileCannotBeOpenedOrSaved) {
    std::string text;
    const auto read = [&](QMessageBox& box) { text = textOf(box), press(box, "OK"); };
    answering(read, [&] { EXPECT_FALSE(dialogs.open(path("none.json"))); });
    EXPECT_EQ(text, "The file \"" + path("none.json").toStdString() +
                        "\" cannot be read (No such file or directory); check the path.\n");
    EXPECT_EQ(recent.list(), QStringList());
    ASSERT_FALSE(file.saveAs(path("orders.json")));
    modify();
    ASSERT_TRUE(folder.remove());
    answering(read, [&] { EXPECT_FALSE(dialogs.save()); });
    EXPECT_NE(text.find("cannot be saved"), std::string::npos) << text;
    EXPECT_TRUE(window.isWindowModified());
}
