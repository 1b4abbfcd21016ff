#include "frontends/qt/KeyDesk.h"

#include <algorithm>

// The way of the Tab key and of F6 through the control.

namespace {

class TabKey : public KeyDesk {
protected:
    QStringList walk(bool forth) {
        QStringList way;
        for (int i = 0; i < 20; ++i) {
            forth ? tab() : backtab();
            way += focus();
            if (focus() == "before" || focus() == "after") break;
        }
        return way;
    }
};

const QStringList stops = {"lstTable(1)", "lstTable(2)", "lstTable(3)", "linJoin(1)",
                           "linJoin(2)",  "sprColumn",   "cmdHome"};

} // namespace

TEST_F(TabKey, WalksTablesThenLinesThenTheGridAndOutToTheHost) {
    EXPECT_EQ(walk(true), stops + QStringList("after"));
}

TEST_F(TabKey, WalksTheSameWayBackWithShift) {
    after.setFocus();
    QStringList expected = stops;
    std::reverse(expected.begin(), expected.end());
    EXPECT_EQ(walk(false), expected + QStringList("before"));
}

TEST_F(TabKey, FollowsTheHostsOrderAroundTheControl) {
    QWidget::setTabOrder(&after, widget.get());
    QWidget::setTabOrder(widget.get(), &before);
    after.setFocus();
    EXPECT_EQ(walk(true), stops + QStringList("before"));
    backtab();
    EXPECT_EQ(focus(), "cmdHome");
}

TEST_F(TabKey, BeginsAnewWhereTheControlIsAloneInItsWindow) {
    before.hide();
    after.hide();
    widget->setFocus(Qt::TabFocusReason);
    EXPECT_EQ(focus(), "lstTable(1)");
    backtab();
    EXPECT_EQ(focus(), "cmdHome");
    tab();
    EXPECT_EQ(focus(), "lstTable(1)");
}

TEST_F(TabKey, WalksTheTablesBySlotWhicheverIsOnTop) {
    table(1).raise();
    before.setFocus();
    tab();
    EXPECT_EQ(focus(), "lstTable(1)");
    tab();
    EXPECT_EQ(focus(), "lstTable(2)");
}

TEST_F(TabKey, BringsTheTableToTheFrontAndIntoView) {
    table(3).move(20, 800);
    table(2).move(20, 20);
    table(1).raise();
    before.setFocus();
    repeat(Qt::Key_Tab, 2);
    EXPECT_EQ(widget->childAt(table(2).mapTo(widget.get(), table(2).rect().center())),
              table(2).list().viewport());
    tab();
    EXPECT_EQ(focus(), "lstTable(3)");
    EXPECT_TRUE(widget->toolkit().view().seen().contains(table(3).geometry()));
}

TEST_F(TabKey, PassesATableByThatNobodySees) {
    table(2).hide();
    before.setFocus();
    repeat(Qt::Key_Tab, 2);
    EXPECT_EQ(focus(), "lstTable(3)");
}

TEST_F(TabKey, BringsALineIntoView) {
    host.resize(500, 700);
    settle();
    tabTo("linJoin(1)");
    const auto isSeen = [this] {
        const QRect place = canvas().currentLine()->extent().boundingRect();
        return widget->toolkit().view().seen().contains(place);
    };
    EXPECT_TRUE(isSeen());
    auto& across = child<QScrollBar>("hsbTable");
    across.setValue(across.maximum());
    ASSERT_FALSE(isSeen());
    tab();
    EXPECT_EQ(focus(), "linJoin(2)");
    EXPECT_TRUE(isSeen());
}

TEST_F(TabKey, PassesByWhatIsSwitchedOff) {
    child<QWidget>("cmdHome").setEnabled(false);
    tabTo("sprColumn");
    tab();
    EXPECT_EQ(focus(), "after");
}

TEST_F(TabKey, LeavesToNoFieldOfTheHostThatTakesNoTab) {
    after.setFocusPolicy(Qt::ClickFocus);
    tabTo("cmdHome");
    tab();
    EXPECT_EQ(focus(), "before");
}

TEST_F(TabKey, F6LeadsToTheCurrentTableFromAGridThatWasClicked) {
    tabTo("lstTable(2)");
    grid().view().setFocus(Qt::MouseFocusReason);
    press(Qt::Key_F6);
    EXPECT_EQ(focus(), "lstTable(2)");
}

TEST_F(TabKey, MakesTheTableTheCurrentOne) {
    before.setFocus();
    repeat(Qt::Key_Tab, 2);
    EXPECT_FALSE(table(1).isCurrent());
    EXPECT_NE(customers->selected, 0);
    EXPECT_EQ(orders->selected, 0);
    EXPECT_TRUE(table(2).isCurrent());
}

TEST_F(TabKey, StopsAtTheCanvasWhereItHasNoLines) {
    tabTo("linJoin(1)");
    repeat(Qt::Key_Delete, 2);
    ASSERT_EQ(model->joinCount(), 0);
    EXPECT_EQ(focus(), "fraTable");
    backtab();
    EXPECT_EQ(focus(), "lstTable(3)");
    tab();
    EXPECT_EQ(focus(), "fraTable");
    tab();
    EXPECT_EQ(focus(), "sprColumn");
}

TEST_F(TabKey, PassesTheGridByWhereTheHostShowsJoinsOnly) {
    widget->setOnlyJoin(true);
    settle();
    tabTo("linJoin(2)");
    tab();
    EXPECT_EQ(focus(), "cmdHome");
}

TEST_F(TabKey, IsNotCaughtByATableWhoseNameAnotherHas) {
    auto twin = library.newModel();
    twin->table(u"A", {u"X"})->place(300, 300, 1800, 1500);
    twin->table(u"A", {u"X"}, u"second")->place(3000, 300, 1800, 1500);
    twin->table(u"B", {u"X"})->place(6000, 300, 1800, 1500);
    widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(twin));
    settle();
    before.setFocus();
    repeat(Qt::Key_Tab, 3);
    EXPECT_EQ(focus(), "lstTable(3)");
}

TEST_F(TabKey, StaysInAnOpenEditor) {
    tabTo("sprColumn");
    grid().view().setCurrentIndex(grid().view().model()->index(0, 0));
    press(Qt::Key_F2);
    EXPECT_EQ(focus(), "txtValue");
    tab();
    EXPECT_EQ(focus(), "cmdSetTextValue");
    tab();
    EXPECT_EQ(focus(), "txtValue");
    backtab();
    EXPECT_EQ(focus(), "cmdSetTextValue");
    press(Qt::Key_Escape);
    EXPECT_FALSE(child<QWidget>("fraValue").isVisible());
    EXPECT_EQ(focus(), "sprColumn");
}

TEST_F(TabKey, F6ChangesBetweenCanvasAndGrid) {
    tabTo("lstTable(2)");
    press(Qt::Key_F6);
    EXPECT_EQ(focus(), "sprColumn");
    press(Qt::Key_F6);
    EXPECT_EQ(focus(), "lstTable(2)");
    tabTo("linJoin(2)");
    press(Qt::Key_F6);
    EXPECT_EQ(focus(), "sprColumn");
    press(Qt::Key_F6);
    EXPECT_EQ(focus(), "linJoin(2)");
}

TEST_F(TabKey, F6IsTheHostsWhereThereIsNoGrid) {
    widget->setOnlyJoin(true);
    settle();
    tabTo("lstTable(2)");
    struct : QObject {
        bool eventFilter(QObject*, QEvent* event) override {
            keys += event->type() == QEvent::KeyPress;
            return false;
        }
        int keys = 0;
    } filter;
    host.installEventFilter(&filter);
    press(Qt::Key_F6);
    EXPECT_EQ(focus(), "lstTable(2)");
    EXPECT_EQ(filter.keys, 1);
}
