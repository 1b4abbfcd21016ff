#include "designer/DrawingArea.h"
#include "designer/document/Document.h"
#include "frontends/qt/TabuletWidget.h"
#include "support/QtHands.h"

#include <gtest/gtest.h>

#include <QApplication>
#include <QMessageBox>
#include <QTimer>

using namespace zandor;

namespace {

constexpr int twipsPerPixel = 15;

/// The drawing of one table that stands where the test says.
class TheDesignersCanvas : public testing::Test {
protected:
    void show(float left, float top, QSize size) {
        const auto query = platform::makeRef<model::Query>();
        const auto table = query->addTable({{}, u"orders", {{u"id"}}});
        table->Left(left);
        table->Top(top);
        table->Width(2000);
        table->Height(2000);
        document.setQuery(query);
        area.resize(size);
        area.show();
        QCoreApplication::processEvents();
    }

    ZandorWidget& control() { return area.control(); }

    designer::Document document;
    designer::DrawingArea area{document};
};

} // namespace

TEST_F(TheDesignersCanvas, IsAsLargeAsWhatCanBeSeenOfIt) {
    show(300, 300, {1300, 900});
    EXPECT_EQ(control().MXHorzFrameSize(), 1300 * twipsPerPixel);
    EXPECT_EQ(control().MXVertFrameSize(), 900 * twipsPerPixel);
    EXPECT_EQ(control().HorizMaxScrollPos(), 0);
    EXPECT_EQ(control().VertMaxScrollPos(), 0);
}

TEST_F(TheDesignersCanvas, ReachesATableBeyondTheRightEdge) {
    show(25000, 300, {1200, 800});
    EXPECT_EQ(control().MXHorzFrameSize(), 25000 + 2000 + 300);
    EXPECT_EQ(control().HorizMaxScrollPos(), 27300 - 1200 * twipsPerPixel);
}

TEST_F(TheDesignersCanvas, CanBeScrolledToATableBehindTheGrid) {
    show(300, 7000, {1200, 800});
    const int upperHalf = 800 * twipsPerPixel / 2;
    ASSERT_GT(7000 + 2000, upperHalf);
    EXPECT_GE(control().VertMaxScrollPos(), 7000 + 2000 - upperHalf);
}

TEST_F(TheDesignersCanvas, CanBeScrolledToATableThatIsPulledBehindTheGrid) {
    show(300, 300, {1200, 800});
    ASSERT_EQ(control().VertMaxScrollPos(), 0);
    auto& box = *dynamic_cast<platform::qt::TabuletWidget*>(
        control().findChild<QWidget*>(QStringLiteral("lstTable(1)")));
    const QPointF title = QRectF(box.titleBar()).center();
    const QPointF below = title + QPointF(0, 1000);
    hands::mouse(box, QEvent::MouseButtonPress, title, Qt::LeftButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseMove, below, Qt::NoButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseButtonRelease, title, Qt::LeftButton);
    for (int n = 0; n < 3; ++n) QCoreApplication::processEvents();
    const auto table = document.query()->tableNamed(u"orders");
    const int upperPane = static_cast<int>(800 * twipsPerPixel * control().upperPaneShare());
    ASSERT_GT(table->Top() + table->Height(), upperPane);
    EXPECT_GE(control().VertMaxScrollPos(), table->Top() + table->Height() - upperPane);
}

TEST_F(TheDesignersCanvas, EndsWhereTheControlsNumbersEnd) {
    show(40000, 50000, {1200, 800});
    EXPECT_EQ(control().MXHorzFrameSize(), 32767);
    EXPECT_EQ(control().MXVertFrameSize(), 32767);
}

TEST_F(TheDesignersCanvas, StaysWhereItIsScrolledToWhenTheDrawingIsShownAnew) {
    show(25000, 15000, {1200, 800});
    control().setHorizontalScrollbarPos(3000);
    control().setVerticalScrollbarPos(2000);
    emit document.outdated();
    EXPECT_EQ(control().HorizontalScrollbarPos(), 3000);
    EXPECT_EQ(control().VerticalScrollbarPos(), 2000);
    EXPECT_EQ(area.canvasPlace({10, 20}), QPoint(3000 + 150, 2000 + 300));
}

TEST_F(TheDesignersCanvas, ShowsNoFarewellOfAControlWhoseDrawingIsShownAnew) {
    class Boxes final : public QObject {
    public:
        Boxes() { qApp->installEventFilter(this); }
        bool eventFilter(QObject* watched, QEvent* event) override {
            auto* box = qobject_cast<QMessageBox*>(watched);
            if (!box || event->type() != QEvent::Show) return false;
            texts += box->text();
            QTimer::singleShot(0, box, &QMessageBox::accept);
            return false;
        }
        QStringList texts;
    } boxes;
    show(300, 300, {1200, 800});
    area.setOptions({{"DebugSwitch", 1}});
    EXPECT_TRUE(boxes.texts.contains("SetZandor"));
    emit document.outdated();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_FALSE(boxes.texts.contains("UserControl_Terminate"));
    area.setOptions({});
}
