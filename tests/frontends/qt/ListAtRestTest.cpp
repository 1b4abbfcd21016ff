#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/KeyDesk.h"
#include "frontends/qt/darkPalette.h"

#include <QAccessible>
#include <QApplication>
#include <QStyleFactory>
#include <QWheelEvent>

using namespace zandor;
using platform::qt::TabuletWidget;

// A table whose list and button have not been made yet, because nobody has touched it.

namespace {

class PaintingOfAListAtRest : public Desk {
protected:
    PaintingOfAListAtRest() {
        show();
        bind();
        table(2).model().setComesOut(2, true);
        for (const char16_t* more : {u"STREET", u"HOUSE", u"COUNTRY"})
            table(2).model().append(more);
        table(2).resize(160, 100); // with a bar
        settle();
    }

    /// The first place where the tables look otherwise once their lists are there.
    std::string difference() {
        settle();
        // The current table has the focus, and with that its list.
        if (table(2).madeList() || table(3).madeList()) return "it is there already";
        std::string found;
        for (TabuletWidget* box : tables()) {
            const QImage before = box->grab().toImage();
            box->list();
            settle();
            const QImage after = box->grab().toImage();
            for (int y = 0; y < before.height(); ++y)
                for (int x = 0; x < before.width(); ++x)
                    if (found.empty() && before.pixel(x, y) != after.pixel(x, y))
                        found = std::to_string(box->slot()) + ": " + std::to_string(x) + ',' +
                                std::to_string(y);
        }
        return found;
    }

    std::vector<TabuletWidget*> tables() {
        return child<platform::qt::Canvas>("fraTable").tables();
    }
};

TEST_F(PaintingOfAListAtRest, IsThatOfAList) {
    EXPECT_EQ(difference(), "");
    EXPECT_TRUE(table(2).list().verticalScrollBar()->isVisible());
    EXPECT_FALSE(table(3).list().verticalScrollBar()->isVisible());
}

TEST_F(PaintingOfAListAtRest, HasTheColoursOfThePalette) {
    QPalette dark = darkPalette();
    dark.setColor(QPalette::Button, QColor(60, 60, 60));
    widget->setPalette(dark);
    EXPECT_EQ(difference(), "");
}

TEST_F(PaintingOfAListAtRest, HasTheSizeOfTheFont) {
    QFont font = widget->font();
    font.setPointSizeF(font.pointSizeF() * 1.4);
    widget->setFont(font);
    EXPECT_EQ(difference(), "");
}

TEST_F(PaintingOfAListAtRest, IsGreyWhereTheControlIsDisabled) {
    widget->setEnabled(false);
    EXPECT_EQ(difference(), "");
    widget->setEnabled(true);
}

TEST_F(PaintingOfAListAtRest, HasNoCrossWhereNothingCanBeClosed) {
    widget->setReadOnly(true);
    EXPECT_EQ(difference(), "");
}

TEST_F(PaintingOfAListAtRest, IsThatOfTheStyle) {
    for (const QString& name : QStyleFactory::keys()) {
        QApplication::setStyle(name);
        bind();
        EXPECT_EQ(difference(), "") << qPrintable(name);
    }
    QApplication::setStyle(QStringLiteral("fusion"));
}

TEST_F(PaintingOfAListAtRest, FitsIntoSmallBoxes) {
    for (const QSize size : {QSize(40, 100), QSize(30, 200), QSize(300, 95)}) {
        bind();
        table(2).resize(size);
        EXPECT_EQ(difference(), "") << size.width() << ' ' << size.height();
    }
}

TEST_F(PaintingOfAListAtRest, IsLeftToTheListWhereABarDoesNotFit) {
    for (const QSize size : {table(2).smallest(), QSize(300, 38), QSize(12, 12)}) {
        bind();
        EXPECT_EQ(table(2).madeList(), nullptr);
        table(2).resize(size);
        EXPECT_NE(table(2).madeList(), nullptr);
    }
}

TEST_F(PaintingOfAListAtRest, ReadsNamesInTheirOwnDirection) {
    QApplication::setLayoutDirection(Qt::RightToLeft);
    model = library.newModel();
    float left = 600;
    for (const char16_t* name : {u"\u05D0\u05D1", u"\u05D2\u05D1 1", u"\u05D3"}) {
        model->table(name, {u"*", u"\u05D3\u05D4 12", u"ID"})->place(left, 600, 2400, 1500);
        left += 3000;
    }
    widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(model));
    EXPECT_EQ(difference(), "");
    QApplication::setLayoutDirection(Qt::LeftToRight);
}

class AListAtRest : public KeyDesk {
protected:
    AListAtRest() {
        settle();
        EXPECT_EQ(table(2).madeList(), nullptr);
        for (const char16_t* more : {u"STREET", u"HOUSE", u"COUNTRY"}) customers->addColumn(more);
        widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        settle();
        before.setFocus();
        table(2).resize(160, 100); // with a bar
    }

    /// In the table itself, where an entry is seen; no screen lies between.
    QPointF entry(int index, int row) {
        TabuletWidget& box = table(index);
        return QPointF(60, box.firstEntry() + box.rowHeight() * (row + 0.5));
    }
};

} // namespace

TEST_F(AListAtRest, TakesThePressThatItIsMadeBy) {
    TabuletWidget& box = table(2);
    hands::mouse(box, QEvent::MouseButtonPress, entry(2, 1), Qt::LeftButton, Qt::LeftButton);
    ASSERT_NE(box.madeList(), nullptr);
    EXPECT_TRUE(box.list().hasFocus());
    hands::mouse(box, QEvent::MouseButtonRelease, entry(2, 1), Qt::LeftButton);
    EXPECT_EQ(selected(2), QStringList("CUSTOMER_ID"));
    EXPECT_EQ(box.pos(), QPoint(340, 30)) << "it was no press on the box";
}

TEST_F(AListAtRest, TakesADragThatBeginsWithTheFirstPress) {
    QStringList carried;
    widget->toolkit().drags().setCarrier([&](QDrag&) { carried += selected(2); });
    TabuletWidget& box = table(2);
    hands::mouse(box, QEvent::MouseButtonPress, entry(2, 1), Qt::LeftButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseMove, entry(2, 1) + QPointF(9, 9), Qt::NoButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseButtonRelease, entry(2, 1) + QPointF(9, 9), Qt::LeftButton);
    EXPECT_EQ(carried, QStringList("CUSTOMER_ID"));
    // The box has the mouse for itself again.
    const QPointF title = QRectF(box.titleBar()).center();
    hands::mouse(box, QEvent::MouseButtonPress, title, Qt::LeftButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseMove, title + QPointF(30, 0), Qt::NoButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseButtonRelease, title, Qt::LeftButton);
    EXPECT_EQ(box.pos(), QPoint(370, 30));
}

TEST_F(AListAtRest, TakesTheWheelThatItIsMadeBy) {
    TabuletWidget& box = table(2);
    const QPointF at = entry(2, 1);
    QWheelEvent event(at, box.mapToGlobal(at), {}, {0, -120}, Qt::NoButton, {}, Qt::NoScrollPhase,
                      false);
    QCoreApplication::sendEvent(&box, &event);
    ASSERT_NE(box.madeList(), nullptr);
    EXPECT_GT(box.list().verticalScrollBar()->value(), 0);
    EXPECT_EQ(child<QScrollBar>("vsbTable").value(), 0);
}

TEST_F(AListAtRest, IsThereAsSoonAsTheMouseIs) {
    hands::mouse(table(2), QEvent::MouseMove, {60, 10}, Qt::NoButton);
    EXPECT_NE(table(2).madeList(), nullptr);
    EXPECT_EQ(table(3).madeList(), nullptr);
}

TEST_F(AListAtRest, LetsTheCrossBePressed) {
    TabuletWidget& box = table(2);
    const int side = box.titleBar().height();
    const QPointF cross(box.width() - side / 2.0, side / 2.0);
    const QPointer<QWidget> alive = &box;
    hands::mouse(box, QEvent::MouseButtonPress, cross, Qt::LeftButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseButtonRelease, cross, Qt::LeftButton);
    settle();
    EXPECT_FALSE(alive);
}

TEST_F(AListAtRest, LeavesToItsTableWhatTheCrossDoesNotTake) {
    TabuletWidget& box = table(2);
    const int side = box.titleBar().height();
    const QPointF cross(box.width() - side / 2.0, side / 2.0);
    hands::mouse(box, QEvent::MouseButtonPress, cross, Qt::RightButton, Qt::RightButton);
    hands::mouse(box, QEvent::MouseMove, cross + QPointF(30, 0), Qt::NoButton, Qt::RightButton);
    hands::mouse(box, QEvent::MouseButtonRelease, cross, Qt::RightButton);
    settle();
    EXPECT_EQ(box.pos(), QPoint(340, 30));
    hands::click(box, QRectF(box.titleBar()).center());
    EXPECT_TRUE(box.isCurrent());
}

TEST_F(AListAtRest, TakesTheFocusThatItsTableIsGiven) {
    table(2).setFocus(Qt::OtherFocusReason);
    EXPECT_TRUE(table(2).list().hasFocus());
    EXPECT_EQ(table(3).madeList(), nullptr);
}

TEST_F(AListAtRest, IsThereForAScreenReader) {
    auto* const box = QAccessible::queryAccessibleInterface(&table(2));
    ASSERT_EQ(box->childCount(), 2);
    EXPECT_EQ(box->child(0)->role(), QAccessible::List);
    EXPECT_EQ(box->child(0)->childCount(), 7);
    EXPECT_EQ(box->child(0)->text(QAccessible::Name), "CUSTOMERS");
    EXPECT_EQ(box->child(1)->role(), QAccessible::Button);
    EXPECT_EQ(box->child(1)->text(QAccessible::Name), "Remove the table");
}

TEST_F(AListAtRest, SaysByItsCrossWhatTheHostCallsIt) {
    auto words = widget->words();
    words.RemoveTable = u"Weg damit";
    widget->setWords(words);
    EXPECT_EQ(table(2).madeList(), nullptr);
    EXPECT_EQ(table(2).closeButton().toolTip(), "Weg damit");
    EXPECT_EQ(table(2).closeButton().accessibleName(), "Weg damit");
}

TEST_F(AListAtRest, HasItsJoinsAtItsEntries) {
    const QPointF end = canvas().lines().front()->at(1) / 15;
    table(2).list();
    settle();
    EXPECT_EQ(canvas().lines().front()->at(1) / 15, end);
    EXPECT_NEAR(end.y(), table(2).mapTo(&canvas(), entry(2, 1).toPoint()).y(), 1);
}

TEST_F(AListAtRest, TakesItsJoinsAlongWhenTheFontGrows) {
    QFont font = widget->font();
    font.setPointSizeF(font.pointSizeF() + 4);
    widget->setFont(font);
    settle();
    EXPECT_EQ(table(2).madeList(), nullptr);
    const QPointF end = canvas().lines().front()->at(1) / 15;
    EXPECT_NEAR(end.y(), table(2).mapTo(&canvas(), entry(2, 1).toPoint()).y(), 1);
    table(2).list();
    settle();
    EXPECT_EQ(canvas().lines().front()->at(1) / 15, end);
}

TEST_F(AListAtRest, IsThereWhereTheHostDressesLists) {
    host.setStyleSheet(QStringLiteral("QListView { color: red }"));
    settle();
    EXPECT_NE(table(2).madeList(), nullptr);
    host.setStyleSheet({});
    bind();
    EXPECT_EQ(table(2).madeList(), nullptr);
    QFont large = QApplication::font();
    large.setPointSizeF(20);
    QApplication::setFont(large, "QListView");
    bind();
    EXPECT_NE(table(2).madeList(), nullptr);
    QApplication::setFont(QFont(), "QListView");
}
