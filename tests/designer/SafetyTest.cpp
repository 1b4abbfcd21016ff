#include "OpenWindow.h"

#include "designer/Banner.h"
#include "designer/EndingSignals.h"
#include "designer/database/ConnectionBanner.h"
#include "designer/document/AutosaveSlot.h"

#include <Zandor/QueryDocument.h>

#include <QDir>
#include <QLineEdit>
#include <QPushButton>
#include <QSessionManager>

#include <sqlite3.h>

#include <cstdio>

using namespace zandor;

using designer::Banner;
using platform::qt::GridWidget;
using testing::ElementsAre;
using testing::HasSubstr;

namespace {

/// The window when something goes wrong around it.
class ASafeWindow : public OpenWindow {
protected:
    Banner& banner(const QString& name) { return *window->findChild<Banner*>(name); }
    Banner& connectionBanner() { return *window->findChild<designer::ConnectionBanner*>(); }
    void press(Banner& on, const QString& name) {
        auto* const button = on.findChild<QPushButton*>(name);
        ASSERT_TRUE(button && button->isVisible()) << name.toStdString();
        hands::click(*button, QRectF(button->rect()).center());
        calm();
    }
    QString autosaves() const { return folder.path(QStringLiteral("autosave")); }
    void comeBack() {
        QEvent activated(QEvent::WindowActivate);
        QCoreApplication::sendEvent(window.get(), &activated);
        calm();
    }
};

} // namespace

TEST_F(ASafeWindow, SaysThatChangesCannotBeKeptSafeUntilTheyCan) {
    open();
    const QString inTheWay = folder.file(QStringLiteral("autosave"), "");
    window->keepSafe(autosaves());
    EXPECT_FALSE(banner("unsafe").isVisible());
    add("payments");
    ASSERT_TRUE(until([&] { return banner("unsafe").isVisible(); }));
    EXPECT_THAT(banner("unsafe").text().toStdString(), HasSubstr("(Not a directory)"));
    banner("unsafe").hide(); // by its cross
    ASSERT_TRUE(until([&] { return banner("unsafe").isVisible(); })) << "each time anew";
    ASSERT_TRUE(QFile::remove(inTheWay));
    EXPECT_TRUE(until([&] { return !banner("unsafe").isVisible(); }));
    window->document().setModified(false);
}

TEST_F(ASafeWindow, SaysNoMoreOfItOnceTheQueryIsSaved) {
    open();
    folder.file(QStringLiteral("autosave"), "");
    window->keepSafe(autosaves());
    add("payments");
    ASSERT_TRUE(until([&] { return banner("unsafe").isVisible(); }));
    {
        const Answering answers(
            {[&](QDialog& dialog) { choose(dialog, folder.path(QStringLiteral("mine.json"))); }});
        press(banner("unsafe"), "saveUnsafe");
    }
    EXPECT_FALSE(banner("unsafe").isVisible());
    EXPECT_TRUE(QFile::exists(folder.path(QStringLiteral("mine.json"))));
}

TEST_F(ASafeWindow, KeepsTheQueryWhenTheSessionEnds) {
    open();
    window->keepSafe(autosaves());
    add("payments");
    alignas(QSessionManager) char manager[sizeof(QSessionManager)] = {}; // nobody asks it anything
    emit qGuiApp->commitDataRequest(reinterpret_cast<QSessionManager&>(manager));
    EXPECT_EQ(QDir(autosaves()).entryList({"*.autosave"}).size(), 1);
    window->document().setModified(false);
}

TEST_F(ASafeWindow, KeepsTheQueryWhenItIsAskedToEnd) {
    open();
    window->keepSafe(autosaves());
    add("payments");
    emit window->findChild<designer::EndingSignals*>()->ending();
    EXPECT_EQ(QDir(autosaves()).entryList({"*.autosave"}).size(), 1);
    window->document().setModified(false);
}

TEST_F(ASafeWindow, OffersToTryALockedDatabaseAgain) {
    const QString path =
        folder.database("locked.db", {"CREATE TABLE only (id INTEGER PRIMARY KEY)"});
    sqlite3* other = nullptr;
    ASSERT_EQ(sqlite3_open(path.toUtf8().constData(), &other), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(other, "BEGIN EXCLUSIVE", nullptr, nullptr, nullptr), SQLITE_OK);

    window = std::make_unique<designer::DesignerWindow>();
    const auto error = window->openAtFirst({.file = path}, sampleDatabase());
    ASSERT_TRUE(error);
    window->offerAgain(*error, {.file = path}, sampleDatabase());
    window->show();
    calm();
    ASSERT_TRUE(banner("notOpened").isVisible());
    EXPECT_THAT(banner("notOpened").text().toStdString(), HasSubstr("locked.db"));
    EXPECT_THAT(banner("notOpened").text().toStdString(), HasSubstr("try again in a moment"));
    press(banner("notOpened"), "tryAgain");
    EXPECT_TRUE(banner("notOpened").isVisible()) << "it is still locked";

    sqlite3_close(other);
    press(banner("notOpened"), "tryAgain");
    EXPECT_FALSE(banner("notOpened").isVisible());
    EXPECT_EQ(window->database().name(), "locked.db");
    EXPECT_EQ(list().model()->rowCount(), 1);
}

TEST_F(ASafeWindow, OffersToTryABrokenQueryFileAgain) {
    const QString path = folder.file(QStringLiteral("query.json"), "{");
    window = std::make_unique<designer::DesignerWindow>();
    const auto error = window->openAtFirst({.file = path}, sampleDatabase());
    ASSERT_TRUE(error);
    window->offerAgain(*error, {.file = path}, sampleDatabase());
    window->show();
    calm();
    EXPECT_THAT(banner("notOpened").text().toStdString(), HasSubstr("query.json"));
    files::QueryDocument document{openedSample({"orders"}).query};
    document.database = sampleDatabase().toStdU16String();
    ASSERT_FALSE(files::saveQuery(path.toStdString(), document));
    press(banner("notOpened"), "tryAgain");
    EXPECT_FALSE(banner("notOpened").isVisible());
    EXPECT_THAT(shownTables(), ElementsAre("orders"));
}

TEST_F(ASafeWindow, AsksAboutAFileThatAnotherProgramHasChangedWhenOneComesBack) {
    open();
    commandWithFile("save", folder.path("mine.json"));
    ASSERT_FALSE(
        files::saveQuery(folder.path("mine.json").toStdString(), {openedSample({"orders"}).query}));
    answering([](QMessageBox& box) { ::press(box, "&Load the file"); }, [&] { comeBack(); });
    EXPECT_THAT(shownTables(), ElementsAre("orders"));
    EXPECT_FALSE(window->isWindowModified());
}

TEST_F(ASafeWindow, NoticesThatItsDatabaseWasReplaced) {
    const QString path = folder.database("a.db", {"CREATE TABLE here (id INTEGER PRIMARY KEY)"});
    const QString other = folder.database("b.db", {"CREATE TABLE there (id INTEGER PRIMARY KEY)"});
    open({.file = path});
    comeBack();
    EXPECT_FALSE(connectionBanner().isVisible());
    ASSERT_EQ(::rename(other.toLocal8Bit().constData(), path.toLocal8Bit().constData()), 0);
    comeBack();
    ASSERT_TRUE(connectionBanner().isVisible());
    EXPECT_EQ(connectionBanner().text(),
              "a.db has been replaced by another file since it was opened.");
    press(connectionBanner(), "reconnect");
    EXPECT_FALSE(connectionBanner().isVisible());
    EXPECT_TRUE(row("there").isValid());
}

TEST_F(ASafeWindow, MarksTheTablesThatAreGoneFromTheDatabase) {
    const QStringList tables = {"CREATE TABLE stays (id INTEGER PRIMARY KEY)",
                                "CREATE TABLE goes (id INTEGER PRIMARY KEY)"};
    const QString path = folder.database("a.db", tables);
    open({.file = path, .tables = {"stays", "goes"}});
    EXPECT_EQ(shownTable("goes")->note(), "");
    folder.database("a.db", {"DROP TABLE goes"});
    comeBack();
    EXPECT_EQ(connectionBanner().text(),
              "The tables of a.db have been changed by another program.");
    press(connectionBanner(), "reconnect");
    EXPECT_EQ(shownTable("stays")->note(), "");
    EXPECT_EQ(shownTable("goes")->note(), "There is no table \"goes\" in a.db.");
    EXPECT_EQ(shownTable("goes")->accessibleDescription(), shownTable("goes")->note());
    // However the drawing is shown anew.
    window->drawing().setOptions(window->drawing().options());
    calm();
    EXPECT_NE(shownTable("goes")->note(), "");
    if (const QByteArray picture = qgetenv("ZANDOR_PICTURES"); !picture.isEmpty())
        window->grab().save(QString::fromLocal8Bit(picture) + "/missing.png");
    folder.database("a.db", {tables[1]});
    comeBack();
    press(connectionBanner(), "reconnect");
    EXPECT_EQ(shownTable("goes")->note(), "");
}

TEST_F(ASafeWindow, KeepsWhatIsBeingTypedSafeToo) {
    open();
    window->keepSafe(autosaves());
    const auto before = query().record();
    auto& grid = part<GridWidget>("sprColumn");
    const QPoint cell = grid.cellRect(4, 1).center();
    QWidget& clicked = *grid.childAt(cell);
    hands::click(clicked, clicked.mapFrom(&grid, cell));
    calm();
    auto& editor = part<QLineEdit>("txtValue");
    ASSERT_TRUE(editor.isVisible());
    for (const char16_t c : u"= 77")
        if (c) hands::key(editor, Qt::Key_unknown, QString(QChar(c)));
    ASSERT_EQ(editor.text(), "= 77");
    EXPECT_FALSE(window->document().isModified());
    const auto kept = [&]() -> std::u16string {
        const QStringList files = QDir(autosaves()).entryList({"*.autosave"});
        if (files.size() != 1) return {};
        QFile file(QDir(autosaves()).filePath(files.front()));
        if (!file.open(QIODevice::ReadOnly)) return {};
        const auto saved = designer::Autosaved::read(file.readAll());
        if (!saved) return {};
        const auto definition = saved->content.query->ColumnDefinitions().Item(1);
        return definition->HasCriterium(u"4") ? definition->Criteria().Item(u"4")->Criterium()
                                              : std::u16string();
    };
    EXPECT_TRUE(until([&] { return kept() == u"= 77"; }));
    EXPECT_TRUE(editor.isVisible()) << "nobody is interrupted";
    EXPECT_EQ(query().record(), before);
    hands::key(editor, Qt::Key_Escape);
    EXPECT_TRUE(until([&] { return QDir(autosaves()).entryList({"*.autosave"}).isEmpty(); }))
        << "it was given up";
}
