#include "designer/DesignerWindow.h"
#include "designer/help/HelpWindow.h"
#include "support/QtHands.h"

#include <gmock/gmock.h>

#include <QAction>
#include <QLineEdit>
#include <QMenu>
#include <QMenuBar>
#include <QScrollBar>
#include <QSettings>
#include <QTabWidget>
#include <QTextBrowser>
#include <QTextTable>

using namespace zandor;

using designer::HelpWindow;
using testing::HasSubstr;

namespace {

class TheHelp : public testing::Test {
protected:
    ~TheHelp() override { QSettings().clear(); }

    QTextBrowser& page(HelpWindow& help) {
        return *qobject_cast<QTextBrowser*>(help.findChild<QTabWidget*>()->currentWidget());
    }
};

} // namespace

TEST_F(TheHelp, IsOpenedByTheMenuAndStaysBesideTheDrawing) {
    designer::DesignerWindow window;
    window.show();
    window.findChild<QAction*>("helpCriteria")->trigger();
    auto* const help = window.findChild<HelpWindow*>();
    ASSERT_TRUE(help);
    EXPECT_TRUE(help->isVisible());
    EXPECT_EQ(page(*help).verticalScrollBar()->value(), 0);
    EXPECT_FALSE(help->isModal());
    EXPECT_THAT(page(*help).toPlainText().toStdString(),
                HasSubstr("A criterion is what a user types"));
    window.findChild<QAction*>("helpKeys")->trigger();
    EXPECT_EQ(window.findChildren<HelpWindow*>().size(), 1);
    EXPECT_THAT(page(*help).toPlainText().toStdString(),
                HasSubstr("Everything that the mouse does"));
    EXPECT_EQ(window.findChild<QAction*>("helpCriteria")->shortcut(),
              QKeySequence(QKeySequence::HelpContents));
}

TEST_F(TheHelp, ShowsTablesAsTables) {
    HelpWindow help;
    help.showPage(HelpWindow::Page::criteria);
    int tables = 0;
    for (QTextFrame* frame : page(help).document()->rootFrame()->childFrames())
        if (const auto* table = qobject_cast<QTextTable*>(frame)) {
            ++tables;
            EXPECT_EQ(table->columns(), 2);
            EXPECT_EQ(table->format().border(), 1);
        }
    EXPECT_EQ(tables, 5);
    // Marks of Markdown are not left over.
    EXPECT_EQ(page(help).toPlainText().count("`"), 0);
    EXPECT_EQ(page(help).toPlainText().count("|"), 0);
}

TEST_F(TheHelp, FindsWordsRoundAndRound) {
    HelpWindow help;
    help.showPage(HelpWindow::Page::criteria);
    auto& find = *help.findChild<QLineEdit*>("helpFind");
    find.setText("New York");
    hands::key(find, Qt::Key_Return, "\r");
    EXPECT_EQ(page(help).textCursor().selectedText(), "New York");
    const int first = page(help).textCursor().position();
    hands::key(find, Qt::Key_Return, "\r");
    EXPECT_EQ(page(help).textCursor().position(), first); // there is but one
}

TEST_F(TheHelp, NamesEveryKeyOfTheWindow) {
    designer::DesignerWindow window;
    HelpWindow help;
    help.showPage(HelpWindow::Page::keys);
    const QString text = page(help).toPlainText();
    int keys = 0;
    for (const QAction* title : window.menuBar()->actions())
        for (const QAction* action : title->menu()->actions())
            for (const QKeySequence& shortcut : action->shortcuts()) {
                ++keys;
                EXPECT_TRUE(text.contains(shortcut.toString(QKeySequence::PortableText)))
                    << action->text().toStdString() << " " << shortcut.toString().toStdString();
            }
    EXPECT_GT(keys, 10);
}
