#include "frontends/qt/Around.h"
#include "frontends/qt/Desk.h"

#include <QApplication>
#include <QDialog>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QMenu>

using namespace zandor;

namespace {

/// A host that is written from right to left.
class ARightToLeftHost : public Desk, public testing::WithParamInterface<Case> {
protected:
    ~ARightToLeftHost() override {
        widget.reset();
        QApplication::setLayoutDirection(Qt::LeftToRight);
    }

    void turn() {
        switch (GetParam().where) {
        case Where::application: QApplication::setLayoutDirection(Qt::RightToLeft); break;
        case Where::window: host.setLayoutDirection(Qt::RightToLeft); break;
        case Where::widget: widget->setLayoutDirection(Qt::RightToLeft); break;
        }
    }

    /// The query in the host's window, which looks from left to right unless it is turned.
    void lay(bool turned) {
        open(&host);
        if (turned && GetParam().when == When::before) turn();
        host.resize(widget->size());
        host.show();
        bind();
        if (turned && GetParam().when == When::after) turn();
        settle();
    }

    /// Without what depends on who has the keyboard.
    QImage image() {
        if (QWidget* focused = host.focusWidget()) focused->clearFocus();
        settle();
        return widget->grab().toImage();
    }

    QWidget host;
};

} // namespace

TEST_P(ARightToLeftHost, ShowsCanvasAndGridAsEverywhere) {
    lay(false);
    const QImage fromTheLeft = image();
    lay(true);
    ASSERT_EQ(widget->layoutDirection(), Qt::RightToLeft);
    EXPECT_EQ(image(), fromTheLeft);
}

TEST_P(ARightToLeftHost, ScrollsTheWayItsBarsSay) {
    lay(true);
    auto& bar = child<QScrollBar>("hsbTable");
    const int before = table(1).mapTo(widget.get(), QPoint()).x();
    hands::click(bar, {bar.width() - 5.0, bar.height() / 2.0}); // the arrow on the right
    EXPECT_GT(bar.value(), 0);
    EXPECT_EQ(table(1).mapTo(widget.get(), QPoint()).x(), before - bar.value() / 15);
    auto& across = *grid().view().horizontalScrollBar();
    across.setValue(2);
    EXPECT_LE(grid().cellRect(0, 2).right(), grid().cellRect(0, 0).right());
}

TEST_P(ARightToLeftHost, HasItsEditorsAtTheirCells) {
    lay(true);
    for (const auto& [row, name] :
         {std::pair{2, "fraSortOrder"}, std::pair{3, "fraVisibility"}, std::pair{4, "fraValue"}}) {
        press(row, 3);
        const auto& editor = child<QWidget>(name);
        ASSERT_TRUE(editor.isVisible()) << name;
        const QRect cell = grid().cellRect(row, 3).translated(grid().pos());
        EXPECT_TRUE(editor.geometry().contains(cell.center())) << name;
    }
}

TEST_P(ARightToLeftHost, ReadsTheDialogAndTheMenuFromRightToLeft) {
    lay(true);
    Qt::LayoutDirection dialog{}, menu{};
    QTimer::singleShot(0, [&] {
        if (auto* open = qobject_cast<QDialog*>(QApplication::activeModalWidget())) {
            dialog = open->findChild<QLineEdit*>()->layoutDirection();
            open->reject();
        }
    });
    auto& canvas = child<platform::qt::Canvas>("fraTable");
    canvas.focusOn(canvas.lines().front(), Qt::TabFocusReason);
    canvas.openCurrentLine();
    QTimer::singleShot(0, [&] {
        if (auto* open = qobject_cast<QMenu*>(QApplication::activePopupWidget())) {
            menu = open->layoutDirection();
            open->close();
        }
    });
    hands::mouse(canvas, QEvent::MouseButtonRelease, {500, 100}, Qt::RightButton);
    EXPECT_EQ(dialog, Qt::RightToLeft);
    EXPECT_EQ(menu, Qt::RightToLeft);
}

INSTANTIATE_TEST_SUITE_P(TurnedOn, ARightToLeftHost, testing::ValuesIn(everywhere));
