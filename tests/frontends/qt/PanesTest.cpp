#include "frontends/qt/Desk.h"
#include "frontends/qt/PaneHandle.h"

#include <Zandor/qt/Text.h>

#include <QMenu>

using namespace zandor;

using platform::qt::PaneHandle;

namespace {

class ThePanes : public Desk {
protected:
    void lay() {
        widget->setComforts(comforts::Flags::all());
        QObject::connect(widget.get(), &ZandorWidget::upperPaneShareChanged, widget.get(),
                         [this](double share) { told.push_back(share); });
        show();
        bind();
    }
    PaneHandle& handle() { return grid().handle(); }
    void drag(int down) {
        const QPointF at(100, 3);
        hands::mouse(handle(), QEvent::MouseButtonPress, at, Qt::LeftButton, Qt::LeftButton);
        hands::mouse(handle(), QEvent::MouseMove, at + QPointF(0, down), Qt::NoButton,
                     Qt::LeftButton);
        hands::mouse(handle(), QEvent::MouseButtonRelease, at, Qt::LeftButton);
        settle();
    }

    std::vector<double> told;
};

} // namespace

TEST_F(ThePanes, AreHalvesWithoutAHandleUntilAHostWantsOne) {
    show();
    bind();
    EXPECT_FALSE(handle().isVisible());
    EXPECT_EQ(widget->upperPaneShare(), 0.5);
    EXPECT_EQ(grid().geometry(), QRect(0, 300, 900, 300));
    EXPECT_EQ(grid().view().geometry(), QRect(0, 0, 900, 300));
}

TEST_F(ThePanes, ShareTheHeightAsTheHostSays) {
    lay();
    widget->setUpperPaneShare(0.6);
    EXPECT_EQ(grid().geometry(), QRect(0, 360, 900, 240));
    EXPECT_EQ(child<QScrollBar>("hsbTable").geometry().bottom(), 359);
    EXPECT_EQ(widget->VertMaxScrollPos(), 16000 - 360 * 15);
    widget->resize(900, 800);
    EXPECT_EQ(grid().geometry(), QRect(0, 480, 900, 320));
    widget->setUpperPaneShare(7);
    EXPECT_LE(widget->upperPaneShare(), 0.95);
}

TEST_F(ThePanes, AreDividedAnewByADragOfTheHandle) {
    lay();
    drag(50);
    EXPECT_EQ(grid().y(), 350);
    ASSERT_EQ(told.size(), 1U);
    EXPECT_NEAR(told.back(), 350.0 / 600, 1E-6);
    drag(-100);
    EXPECT_EQ(grid().y(), 250);
}

TEST_F(ThePanes, BothStayLargeEnoughToBeWorkedIn) {
    lay();
    drag(-1000);
    EXPECT_EQ(grid().y(), 120);
    drag(1000);
    EXPECT_GE(grid().height(), 5 * grid().rowHeight());
    EXPECT_LT(grid().height(), 7 * grid().rowHeight());
}

TEST_F(ThePanes, AreDividedByKeysToo) {
    lay();
    grid().view().setFocus(Qt::OtherFocusReason);
    hands::key(grid().view(), Qt::Key_Backtab, {}, Qt::ShiftModifier);
    ASSERT_EQ(widget->focusWidget(), &handle()) << "one step before the grid";
    hands::key(handle(), Qt::Key_Down);
    EXPECT_EQ(grid().y(), 316);
    hands::key(handle(), Qt::Key_Up);
    hands::key(handle(), Qt::Key_Up);
    EXPECT_EQ(grid().y(), 284);
    EXPECT_EQ(told.size(), 3U);
    hands::key(handle(), Qt::Key_Tab);
    EXPECT_EQ(widget->focusWidget(), &grid().view());
}

TEST_F(ThePanes, LeaveEditorsAtTheirCellsAndCellsUnderTheMouse) {
    lay();
    for (const double share : {0.3, 0.5, 0.7}) {
        widget->setUpperPaneShare(share);
        settle();
        press(2, 1);
        const auto& editor = child<QWidget>("fraSortOrder");
        ASSERT_TRUE(editor.isVisible()) << share;
        const QRect cell = grid().cellRect(2, 1).translated(grid().pos());
        EXPECT_TRUE(editor.geometry().contains(cell.center())) << share;
        EXPECT_EQ(grid().currentRow(), 2);
    }
}

TEST_F(ThePanes, LetATableGoAsFarDownAsTheCanvasIsSeen) {
    lay();
    for (const double share : {0.3, 0.5, 0.7}) {
        widget->setUpperPaneShare(share);
        settle();
        auto& box = table(1);
        hands::mouse(box, QEvent::MouseButtonPress, {60, 12}, Qt::LeftButton, Qt::LeftButton);
        hands::mouse(box, QEvent::MouseMove, {60, 900}, Qt::NoButton, Qt::LeftButton);
        hands::mouse(box, QEvent::MouseButtonRelease, {60, 12}, Qt::LeftButton);
        settle();
        EXPECT_EQ(box.y(), grid().y() - 40) << share;
        widget->setVerticalScrollbarPos(0);
    }
}

namespace {

class ATitle : public Desk {
protected:
    /// The visible entries of the menu that a right click opens; chooses one.
    QStringList entriesOf(platform::qt::TabuletWidget& box, const QString& choose = {}) {
        QStringList entries;
        QTimer::singleShot(0, [&] {
            auto* menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
            if (!menu) return;
            all.clear();
            for (QAction* action : menu->actions()) {
                all += action->objectName();
                if (action->isVisible() && action->isEnabled() && !action->isSeparator())
                    entries += action->objectName();
                if (action->objectName() == choose) menu->setActiveAction(action);
            }
            if (choose.isEmpty())
                menu->close();
            else
                hands::key(*menu, Qt::Key_Return);
        });
        const QPointF at = QRectF(box.titleBar()).center();
        hands::mouse(box, QEvent::MouseButtonPress, at, Qt::RightButton, Qt::RightButton);
        hands::mouse(box, QEvent::MouseButtonRelease, at, Qt::RightButton);
        settle();
        return entries;
    }

    QStringList all; ///< the entries of the last menu, also those that are not shown
};

} // namespace

TEST_F(ATitle, HasNoMenuWithoutTheComfort) {
    show();
    bind();
    EXPECT_EQ(entriesOf(table(2)), QStringList());
}

TEST_F(ATitle, OpensTheMenuOfItsListForItsTable) {
    widget->setComforts(comforts::Flags::all());
    show();
    bind();
    EXPECT_EQ(entriesOf(table(2)), QStringList({"mnuTableDefinitionCopy",
                                                "mnuTableDefinitionDelete", "mnuTableRename"}));
    EXPECT_EQ(all.mid(all.indexOf("mnuTableDefinitionDelete"), 3),
              QStringList({"mnuTableDefinitionDelete", "mnuTableRename", "mnuTableDefinitionSep"}));
    EXPECT_TRUE(table(2).isCurrent());
    entriesOf(table(3), "mnuTableDefinitionDelete");
    EXPECT_EQ(widget->DeletedTable(), "ORDER_LINES_OF_ALL_THE_YEARS_TOGETHER");
}

TEST_F(ATitle, AsksTheHostForAnotherName) {
    widget->setComforts(comforts::Flags::all());
    QStringList asked;
    QObject::connect(widget.get(), &ZandorWidget::renameRequested, widget.get(),
                     [&](const QString& key) { asked += key; });
    show();
    bind();
    entriesOf(table(2), "mnuTableRename");
    EXPECT_EQ(asked, QStringList(platform::qt::toQt(customers->Key())));
}
