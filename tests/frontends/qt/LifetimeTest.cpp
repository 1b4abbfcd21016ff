#include "frontends/qt/Desk.h"

#include "frontends/qt/MessageBox.h"

#include <QApplication>

using namespace zandor;

namespace {

/// Closes every message box as soon as it opens and keeps what it said.
class Boxes : public QObject {
public:
    Boxes() { qApp->installEventFilter(this); }

    bool eventFilter(QObject* watched, QEvent* event) override {
        auto* box = event->type() == QEvent::Show ? qobject_cast<QMessageBox*>(watched) : nullptr;
        if (!box) return false;
        texts += box->text();
        titles += box->windowTitle();
        orphans += box->parentWidget() == nullptr;
        modal = modal && box->isModal();
        formats += box->textFormat();
        onTop += (box->windowFlags() & Qt::WindowStaysOnTopHint) != 0;
        icons += box->icon() != QMessageBox::NoIcon;
        QTimer::singleShot(0, box, &QMessageBox::accept);
        return false;
    }

    QStringList texts, titles;
    QList<Qt::TextFormat> formats;
    QList<bool> orphans, onTop, icons;
    bool modal = true;
};

class Lifetime : public Desk {
protected:
    const QStringList farewell = {"UserControl_Terminate", "Terminate"};
    Boxes boxes;
};

} // namespace

TEST_F(Lifetime, EndsWithABoxThatHasNoParent) {
    show();
    widget->setDebugSwitch(1);
    widget.reset();
    EXPECT_EQ(boxes.texts, farewell);
    EXPECT_EQ(boxes.orphans, QList<bool>({true, true}));
    EXPECT_TRUE(boxes.modal);
}

TEST_F(Lifetime, EndsWithTheSameBoxesWhenItsWindowIsDestroyed) {
    auto window = std::make_unique<QWidget>();
    window->resize(900, 600);
    open(window.get());
    window->show();
    bind();
    widget->setDebugSwitch(1);
    boxes.texts.clear();
    widget.release(); // the window's now
    window.reset();
    ASSERT_GE(boxes.texts.size(), 2);
    EXPECT_EQ(boxes.texts.mid(0, 2), farewell);
    EXPECT_FALSE(boxes.orphans.contains(false));
}

TEST_F(Lifetime, EndsQuietlyWithoutDebugging) {
    show();
    bind();
    widget.reset();
    EXPECT_EQ(boxes.texts, QStringList());
}

TEST_F(Lifetime, EndsQuietlyAfterItsWindowWasClosed) {
    show();
    bind();
    widget->close(); // from now on there is no focus to be had
    widget.reset();
    EXPECT_EQ(boxes.texts, QStringList());
}

TEST_F(Lifetime, OfATableEndsInTheMiddleOfTheClickOnItsCloseButton) {
    show();
    bind();
    int deleted = 0;
    QObject::connect(widget.get(), &ZandorWidget::TableDeleted, [&deleted] { ++deleted; });
    QWidget& close = table(2).closeButton();
    hands::click(close, QRectF(close.rect()).center());
    settle();
    EXPECT_EQ(deleted, 1);
    EXPECT_EQ(widget->DeletedTable(), "CUSTOMERS");
    EXPECT_FALSE(widget->findChild<QWidget*>("lstTable(2)"));
    EXPECT_TRUE(boxes.texts.isEmpty());
}

TEST_F(Lifetime, OfABoxShowsItsTextAsItIs) {
    show();
    platform::qt::showMessageBox(widget.get(), u"<b>Module:</b>\tx\r\nline", 48, u"Title");
    platform::qt::showMessageBox(widget.get(), u"trace", 4096, u"Zandor");
    EXPECT_EQ(boxes.texts, QStringList({"<b>Module:</b>\tx\nline", "trace"}));
    EXPECT_EQ(boxes.titles, QStringList({"Title", "Zandor"}));
    EXPECT_EQ(boxes.formats, QList<Qt::TextFormat>({Qt::PlainText, Qt::PlainText}));
    EXPECT_EQ(boxes.icons, QList<bool>({true, false}));
    EXPECT_EQ(boxes.onTop, QList<bool>({false, true}));
    EXPECT_EQ(boxes.orphans, QList<bool>({false, false}));
}

TEST_F(Lifetime, OfATraceBoxGivesTheTableNoSecondFocus) {
    show();
    bind();
    widget->activateWindow();
    settle();
    table(1).list().setFocus();
    settle();
    widget->setDebugSwitch(1);
    boxes.texts.clear();
    table(2).list().setFocus(Qt::MouseFocusReason);
    // Every box took the window's activity away and its end gave it back.
    for (int i = 0; i < 10; ++i) {
        widget->activateWindow();
        settle();
    }
    EXPECT_EQ(boxes.texts, QStringList({"SetCurrentTable", "Looking for Table: CUSTOMERS",
                                        "Table found.", "Table refreshed.", "SetSelectedTable"}));
    widget->setDebugSwitch(0);
}

TEST_F(Lifetime, OfAnOutOfRangeNumberIsItsReport) {
    widget->setMXHorzFrameSize(40000);
    ASSERT_EQ(boxes.texts.size(), 1);
    EXPECT_TRUE(boxes.texts[0].contains("P_LET MXHorzFrameSize"));
    EXPECT_TRUE(boxes.texts[0].contains("Overflow"));
    EXPECT_EQ(widget->MXHorzFrameSize(), 16000);
}
