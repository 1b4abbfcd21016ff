#include "../OpenWindow.h"
#include "model/reader/OneServer.h"

#include "designer/statement/StatementPanel.h"
#include "designer/tables/TablesPanel.h"

#include <QDirIterator>
#include <QLabel>

using namespace zandor;

namespace {

const QString secret = QStringLiteral("open%Sesame@7");

QStringList shown; // by the window, at any time

class APasswordInTheWindow : public OpenWindow {
protected:
    static void SetUpTestSuite() {
        runOnServer({"CREATE ROLE walter LOGIN PASSWORD '" + secret + "'",
                     "CREATE TABLE doors (id integer PRIMARY KEY, name text)"});
        runOnServer({"GRANT SELECT ON doors TO walter"});
        oneServer.server().requirePassword("walter");
    }

    static QString address() { return serverAddress("walter"); }
    static QString withPassword() {
        return address().replace("walter@", "walter:open%25Sesame%407@");
    }

    void look() {
        shown << window->windowTitle();
        for (const auto* label : window->findChildren<QLabel*>())
            shown << label->text() << label->toolTip();
        for (const auto* field : window->findChildren<QLineEdit*>()) shown << field->displayText();
        for (QMenu* menu : window->findChildren<QMenu*>()) {
            emit menu->aboutToShow(); // recent ones are filled in then
            for (const QAction* action : menu->actions())
                shown << action->text() << action->toolTip();
        }
    }
};

QStringList filesWithSecret(const QString& folder) {
    QStringList found;
    int read = 0;
    QDirIterator files(folder, QDir::Files | QDir::Hidden, QDirIterator::Subdirectories);
    while (files.hasNext()) {
        QFile file(files.next());
        if (!file.open(QIODevice::ReadOnly)) continue;
        ++read;
        if (file.readAll().contains("Sesame")) found << file.fileName();
    }
    EXPECT_GE(read, 2) << "files were looked into"; // the query and the settings at least
    return found;
}

} // namespace

TEST_F(APasswordInTheWindow, IsWrittenAndShownNowhere) {
    const QTemporaryDir home;
    const QString configuration = qEnvironmentVariable("XDG_CONFIG_HOME");
    qputenv("HOME", home.path().toLocal8Bit());
    qputenv("XDG_CONFIG_HOME", home.filePath("config").toLocal8Bit());
    QSettings::setPath(QSettings::NativeFormat, QSettings::UserScope, home.filePath("config"));

    open({.file = withPassword(), .tables = {"doors"}});
    window->keepSafe(home.filePath("autosave"));
    EXPECT_EQ(window->database().address(), address());
    look();
    commandWithFile("save", home.filePath("mine.json"));
    add("doors");
    EXPECT_EQ(shownTables().size(), 2U);
    look();
    ASSERT_TRUE(until([&] {
        return !QDir(home.filePath("autosave")).entryList({"*.autosave"}, QDir::Files).isEmpty();
    }));
    EXPECT_EQ(filesWithSecret(home.path()), QStringList());

    command("save");
    EXPECT_FALSE(window->isWindowModified());
    EXPECT_TRUE(window->close());
    window.reset();
    QSettings().sync();
    EXPECT_EQ(filesWithSecret(home.path()), QStringList());
    QFile query(home.filePath("mine.json"));
    ASSERT_TRUE(query.open(QIODevice::ReadOnly));
    EXPECT_TRUE(
        query.readAll().contains("walter@")); // so that it is the address that was looked at
    // What was open last is opened again from the list, and asks.
    {
        window = std::make_unique<designer::DesignerWindow>();
        window->show();
        look();
        EXPECT_EQ(shown.filter("walter@").isEmpty(), false);
        window.reset();
    }
    EXPECT_EQ(shown.filter("Sesame"), QStringList());
    qputenv("XDG_CONFIG_HOME", configuration.toLocal8Bit());
    QSettings().clear();
    QSettings::setPath(QSettings::NativeFormat, QSettings::UserScope, configuration);
}
