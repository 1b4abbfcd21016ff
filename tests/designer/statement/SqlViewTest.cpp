#include "designer/statement/SqlView.h"

#include <gtest/gtest.h>

#include <QApplication>
#include <QElapsedTimer>
#include <QScrollBar>

#include <random>

using namespace zandor;

using designer::SqlView;

TEST(TheSqlView, KeepsTheSelectionWhereTheTextStaysTheSame) {
    SqlView view;
    view.setStatement("SELECT a\nFROM orders\nWHERE a = 1");
    QTextCursor cursor = view.textCursor();
    cursor.setPosition(14);
    cursor.setPosition(20, QTextCursor::KeepAnchor);
    view.setTextCursor(cursor);
    ASSERT_EQ(view.textCursor().selectedText(), "orders");
    view.setStatement("SELECT a, b\nFROM orders\nWHERE a = 1");
    EXPECT_EQ(view.toPlainText(), "SELECT a, b\nFROM orders\nWHERE a = 1");
    EXPECT_EQ(view.textCursor().selectedText(), "orders");
}

TEST(TheSqlView, KeepsItsPlaceWhileTheTextChanges) {
    SqlView view;
    view.resize(300, 120);
    view.show();
    QStringList lines;
    for (int n = 0; n < 100; ++n) lines << QStringLiteral("line %1").arg(n);
    view.setStatement(lines.join('\n'));
    QCoreApplication::processEvents();
    view.verticalScrollBar()->setValue(40);
    lines.insert(1, "one more");
    view.setStatement(lines.join('\n'));
    QCoreApplication::processEvents();
    EXPECT_EQ(view.verticalScrollBar()->value(), 40);
    lines = lines.mid(10, 60);
    view.setStatement(lines.join('\n'));
    QCoreApplication::processEvents();
    EXPECT_EQ(view.verticalScrollBar()->value(), 40);
}

TEST(TheSqlView, ShowsWhateverTextFollowsWhatever) {
    SqlView view;
    const QString parts[] = {"a",
                             "b",
                             "\n",
                             "'",
                             QString::fromUtf8("\xF0\x9F\x98\x80"),
                             QString::fromUtf8("\xF0\x9F\x98\x81"),
                             QString::fromUtf8("\xC3\xA9"),
                             " ",
                             "\r\n"};
    std::mt19937 random(1);
    for (int round = 0; round < 2000; ++round) {
        QString text;
        for (auto n = random() % 8; n > 0; --n) text += parts[random() % std::size(parts)];
        view.setStatement(text);
        EXPECT_EQ(view.statement(), text);
        EXPECT_EQ(view.toPlainText(), QString(text).replace("\r\n", "\n"));
    }
}

TEST(TheSqlView, CannotBeTypedIntoUnlessItIsAllowed) {
    SqlView view;
    EXPECT_TRUE(view.isReadOnly());
}

TEST(TheSqlView, ShowsAStatementInPlaceOfWhateverWasTyped) {
    SqlView view;
    int typed = 0;
    QObject::connect(&view, &SqlView::typing, [&] { ++typed; });
    view.setReadOnly(false);
    view.setStatement("SELECT a FROM t");
    EXPECT_EQ(typed, 0);
    view.type("SELECT b");
    EXPECT_EQ(typed, 1);
    EXPECT_EQ(view.text(), "SELECT b");
    EXPECT_TRUE(view.document()->isUndoAvailable());
    view.setStatement("SELECT a FROM t");
    EXPECT_EQ(view.text(), "SELECT a FROM t");
    EXPECT_EQ(typed, 1);
    EXPECT_FALSE(view.document()->isUndoAvailable()) << "that belonged to the other text";
}

TEST(TheSqlView, PutsAWaveUnderTheWordAtAPlace) {
    SqlView view;
    view.setStatement("SELECT one, two");
    view.mark(7);
    EXPECT_EQ(view.marked().selectedText(), "one");
    view.mark(10);
    EXPECT_EQ(view.marked().selectedText(), ",");
    view.mark(99);
    EXPECT_EQ(view.marked().selectedText(), "o") << "something is missing behind it";
    view.mark(-1);
    EXPECT_FALSE(view.isMarked());
}

TEST(TheSqlView, TakesALineOfAMillionSignsInSeconds) {
    designer::SqlView view;
    view.setReadOnly(false);
    view.resize(600, 200);
    view.show();
    QElapsedTimer clock;
    clock.start();
    for (const QString& line : {QStringLiteral("name, ").repeated(170'000),
                                u'\'' + QString(1'000'000, u'7') + u'\''}) {
        view.type(line);
        view.insertPlainText("x");
        QCoreApplication::processEvents();
    }
    view.setStatement("SELECT 1");
    EXPECT_LT(clock.elapsed(), 20'000) << "milliseconds";
    EXPECT_EQ(view.wordWrapMode(), QTextOption::WrapAtWordBoundaryOrAnywhere);
}

TEST(TheSqlView, MarksANameWithWhatItIsOf) {
    designer::SqlView view;
    view.setStatement("SELECT o.nam, 1. FROM orders o");
    view.mark(7);
    EXPECT_EQ(view.marked().selectedText(), "o.nam");
    view.mark(14);
    EXPECT_EQ(view.marked().selectedText(), "1");
}
