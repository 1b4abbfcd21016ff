#include "Answers.h"
#include "Drawing.h"

#include "designer/document/FileDialogs.h"
#include "designer/document/QueryFile.h"
#include "designer/document/RecentFiles.h"

#include <QListView>
#include <QTemporaryDir>

#include <fcntl.h>
#include <sys/stat.h>

using namespace zandor;

namespace {

using designer::QueryFile;

/// A file that is open here, and in a second designer.
class AFileOfTwo : public testing::Test {
protected:
    AFileOfTwo() {
        EXPECT_FALSE(mine.saveAs(path));
        EXPECT_FALSE(theirs.open(path));
    }

    static void add(designer::Document& document, const char16_t* table) {
        document.change({},
                        [&](model::Query& query) { query.addTable(Drawing::described(table)); });
    }
    void theySave() {
        add(their.document, u"theirs");
        ASSERT_FALSE(theirs.save());
    }
    bool onDisk(const char16_t* table) {
        Drawing now;
        QueryFile file(now.document);
        EXPECT_FALSE(file.open(path));
        return static_cast<bool>(now.table(table));
    }
    QByteArray content() const {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }
    /// Lets something run that asks whose state is to stay, and presses a button; the question.
    std::string asked(const char* button, const std::function<void()>& run) {
        std::string text;
        answering([&](QMessageBox& box) { text = textOf(box), press(box, button); }, run);
        return text;
    }

    QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("orders.json"));
    Drawing drawing;
    Drawing their;
    QWidget window;
    QSettings settings{folder.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat};
    QueryFile mine{drawing.document};
    QueryFile theirs{their.document};
    designer::RecentFiles recent{settings, QStringLiteral("queries")};
    designer::FileDialogs dialogs{drawing.document, mine, recent, window};
};

const char* const others = "Another program has changed \"orders.json\" since you opened it.\n";

} // namespace

TEST_F(AFileOfTwo, IsNotOverwrittenInSilence) {
    theySave();
    add(drawing.document, u"mine");
    const QByteArray before = content();
    bool saved = true;
    EXPECT_EQ(asked("Cancel", [&] { saved = dialogs.save(); }),
              others + std::string("To save your query overwrites these changes."));
    EXPECT_FALSE(saved);
    EXPECT_EQ(content(), before);
    EXPECT_TRUE(drawing.table(u"mine"));
    EXPECT_TRUE(drawing.document.isModified());
}

TEST_F(AFileOfTwo, BecomesMineWhenIOverwriteIt) {
    theySave();
    add(drawing.document, u"mine");
    asked("&Overwrite them", [&] { EXPECT_TRUE(dialogs.save()); });
    EXPECT_TRUE(onDisk(u"mine"));
    EXPECT_FALSE(onDisk(u"theirs"));
    add(drawing.document, u"more");
    const Answering noQuestion({});
    EXPECT_TRUE(dialogs.save()) << "nobody else has been there since";
}

TEST_F(AFileOfTwo, IsLoadedWhenTheirsIsWanted) {
    theySave();
    add(drawing.document, u"mine");
    asked("&Load the file", [&] { EXPECT_FALSE(dialogs.save()); });
    EXPECT_TRUE(drawing.table(u"theirs"));
    EXPECT_FALSE(drawing.table(u"mine"));
    EXPECT_FALSE(drawing.document.isModified());
    EXPECT_TRUE(onDisk(u"theirs"));
}

TEST_F(AFileOfTwo, StaysTheirsWhenMineIsSavedElsewhere) {
    theySave();
    add(drawing.document, u"mine");
    {
        const Answering answers({[](QDialog& dialog) { press(dialog, "Save &as\u2026"); },
                                 [&](QDialog& dialog) {
                                     // The old name is selected when the folder has been read.
                                     auto* const names = dialog.findChild<QListView*>("listView");
                                     while (!names->selectionModel()->hasSelection())
                                         QCoreApplication::processEvents();
                                     names->clearSelection();
                                     choose(dialog, folder.filePath(QStringLiteral("mine.json")));
                                 }});
        EXPECT_TRUE(dialogs.save());
    }
    EXPECT_EQ(mine.name(), "mine.json");
    EXPECT_TRUE(onDisk(u"theirs"));
}

// Whoever keeps the time and the size, as some programs do, is found out by the content.
TEST_F(AFileOfTwo, IsKnownByItsContentWhenTimeAndSizeAreTheSame) {
    struct stat before = {};
    ASSERT_EQ(::stat(path.toLocal8Bit().constData(), &before), 0);
    QByteArray text = content();
    ASSERT_TRUE(text.contains("customers"));
    QFile file(path);
    ASSERT_TRUE(file.open(QIODevice::ReadWrite));
    file.write(text.replace("customers", "costumers"));
    file.close();
    const timespec times[] = {before.st_atim, before.st_mtim};
    ASSERT_EQ(::utimensat(AT_FDCWD, path.toLocal8Bit().constData(), times, 0), 0);
    add(drawing.document, u"mine");
    EXPECT_NE(asked("Cancel", [&] { EXPECT_FALSE(dialogs.save()); }), "");
    EXPECT_NE(asked("&Keep mine", [&] { dialogs.lookAtFile(); }), "");
}

TEST_F(AFileOfTwo, IsAskedAboutWhenTheUserComesBackToTheWindow) {
    theySave();
    EXPECT_EQ(asked("&Load the file", [&] { dialogs.lookAtFile(); }),
              others + std::string("You have not changed it since."));
    EXPECT_TRUE(drawing.table(u"theirs"));
    const Answering noQuestion({});
    dialogs.lookAtFile();
}

TEST_F(AFileOfTwo, IsAskedAboutOnceAndAgainBeforeItIsWritten) {
    add(drawing.document, u"mine");
    theySave();
    EXPECT_EQ(asked("&Decide later", [&] { dialogs.lookAtFile(); }),
              others + std::string("To load it gives up your own changes."));
    {
        const Answering noQuestion({});
        dialogs.lookAtFile();
    }
    EXPECT_NE(asked("Cancel", [&] { EXPECT_FALSE(dialogs.save()); }), "");
}

TEST_F(AFileOfTwo, IsMineOnceIHaveSaidSo) {
    theySave();
    asked("&Keep mine", [&] { dialogs.lookAtFile(); });
    EXPECT_TRUE(drawing.document.isModified()) << "for the file says something else";
    const Answering noQuestion({});
    EXPECT_TRUE(dialogs.save());
    EXPECT_FALSE(onDisk(u"theirs"));
}

TEST_F(AFileOfTwo, IsNoQuestionWhenItsContentIsTheSame) {
    ASSERT_FALSE(theirs.save()); // another file of the same content
    add(drawing.document, u"mine");
    const Answering noQuestion({});
    dialogs.lookAtFile();
    EXPECT_TRUE(dialogs.save());
}

TEST_F(AFileOfTwo, ThatIsDeletedLeavesAQueryToBeSaved) {
    ASSERT_TRUE(QFile::remove(path));
    QString told;
    QObject::connect(&dialogs, &designer::FileDialogs::gone,
                     [&](const QString& message) { told += message; });
    const Answering noQuestion({});
    dialogs.lookAtFile();
    dialogs.lookAtFile();
    EXPECT_EQ(told, "The file \"orders.json\" is no longer there; save the query to have one.");
    EXPECT_TRUE(drawing.document.isModified());
    EXPECT_TRUE(dialogs.save());
    EXPECT_TRUE(QFile::exists(path));
}

TEST_F(AFileOfTwo, IsKnownAfterARecoveryByWhatItWasThen) {
    const QByteArray origin = mine.origin();
    EXPECT_FALSE(origin.isEmpty());
    theySave();
    mine.recover(path, mine.content(), origin);
    EXPECT_NE(asked("Cancel", [&] { EXPECT_FALSE(dialogs.save()); }), "");
}
