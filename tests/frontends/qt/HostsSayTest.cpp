#include "frontends/qt/KeyDesk.h"

#include <Zandor/Questions.h>

using namespace zandor;

namespace {

class AHostsSay : public KeyDesk {
protected:
    void dragTitle(QPoint way) {
        QWidget& box = table(1);
        const QPointF at(20, 8);
        hands::mouse(box, QEvent::MouseButtonPress, at, Qt::LeftButton, Qt::LeftButton);
        hands::mouse(box, QEvent::MouseMove, at + way, Qt::NoButton, Qt::LeftButton);
        hands::mouse(box, QEvent::MouseButtonRelease, at + way, Qt::LeftButton, {});
        settle();
    }
};

TEST_F(AHostsSay, InAReadOnlyDrawingTablesHaveNoCrossAndStay) {
    widget->setReadOnly(true);
    EXPECT_TRUE(widget->isReadOnly());
    const QRect before = table(1).geometry();
    EXPECT_FALSE(table(1).closeButton().isVisible());
    dragTitle({60, 30});
    tabTo("lstTable(1)");
    press(Qt::Key_Right, Qt::AltModifier);
    press(Qt::Key_Right, Qt::AltModifier | Qt::ShiftModifier);
    press(Qt::Key_Delete);
    EXPECT_EQ(table(1).geometry(), before);
    // The mouse over an edge promises nothing.
    hands::mouse(table(1), QEvent::MouseMove, {1, 60}, Qt::NoButton, {});
    EXPECT_EQ(table(1).cursor().shape(), Qt::ArrowCursor);

    widget->setReadOnly(false);
    EXPECT_TRUE(table(1).closeButton().isVisible());
    dragTitle({60, 30});
    EXPECT_EQ(table(1).pos(), before.topLeft() + QPoint(60, 30));
    hands::mouse(table(1), QEvent::MouseMove, {1, 60}, Qt::NoButton, {});
    EXPECT_EQ(table(1).cursor().shape(), Qt::SizeHorCursor);
}

TEST_F(AHostsSay, AReadOnlyTableGivesItsNameThePlaceOfTheCross) {
    const QRect cross = table(3).closeButton().geometry();
    widget->setReadOnly(true);
    const QImage place = table(3).grab(cross).toImage();
    QImage plain = place;
    plain.fill(place.pixelColor(0, 0));
    EXPECT_NE(place, plain) << "where the cross was, the long name goes on";
}

TEST_F(AHostsSay, AReadOnlyDrawingIsPressedIntoTheKeyboardsFocus) {
    widget->setReadOnly(true);
    before.setFocus();
    hands::click(table(2), {20, 8});
    settle();
    EXPECT_EQ(focus(), "lstTable(2)");
}

TEST_F(AHostsSay, PlacesGoWithTheScrollingAndBack) {
    for (const int scrolled : {0, 300, 1500}) {
        widget->setVisibleFrameLeft(scrolled);
        widget->setVisibleFrameTop(scrolled / 2);
        settle();
        const QPoint corner = table(1).mapTo(widget.get(), QPoint());
        EXPECT_EQ(widget->fromCanvas({600, 600}), corner) << scrolled;
        EXPECT_EQ(widget->toCanvas(corner), QPointF(600, 600)) << scrolled;
        EXPECT_EQ(widget->fromCanvas(widget->toCanvas(QPoint(17, 211))), QPoint(17, 211));
        EXPECT_EQ(widget->fromCanvas(widget->toCanvas(QPoint(-500, 9000))), QPoint(-500, 9000));
    }
}

/// Joins nothing to CUSTOMERS, and counts rows.
class Answers final : public TalvikDBxZandor::Questions {
public:
    bool MayCloseTable(const platform::Ref<TalvikZandorLib::ZDTable>& table) override {
        return table->Name() != u"CUSTOMERS";
    }
    std::vector<TalvikDBxZandor::HostEntry>
    MenuEntries(const TalvikDBxZandor::MenuPlace& place) override {
        if (!place.Table) return {};
        return {{u"&Count rows", [this, name = place.Table->Name()] { counted = name; }}};
    }
    platform::String counted;
};

TEST_F(AHostsSay, IsHeardByKeys) {
    const auto answers = std::make_shared<Answers>();
    widget->setQuestions(answers);
    Menus menus;
    tabTo("lstTable(2)");
    press(Qt::Key_Delete);
    EXPECT_EQ(model->tableCount(), 3);
    menus.choice = "mnuHost1";
    menuKey();
    EXPECT_EQ(answers->counted, u"CUSTOMERS");
    // Over a line there is none of the host's.
    menus.choice.clear();
    tabTo("linJoin(1)");
    menuKey();
    EXPECT_EQ(menus.opened, 2);
    EXPECT_TRUE(menus.enabled.contains("mnuJoinDelete"));
    EXPECT_FALSE(menus.enabled.contains("mnuHost1"));
    widget->setQuestions(nullptr);
    tabTo("lstTable(2)");
    press(Qt::Key_Delete);
    EXPECT_EQ(model->tableCount(), 2);
}

} // namespace
