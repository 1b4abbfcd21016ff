#include "frontends/qt/Desk.h"

#include "frontends/qt/CanvasWindow.h"

#include <QPaintEvent>

using namespace zandor;

using platform::qt::CanvasWindow;
using platform::qt::TabuletWidget;

// What is painted, and how much of it.

namespace {

/// Counts what some widgets paint: how often, and how many logical pixels.
class Painted : public QObject {
public:
    explicit Painted(const std::vector<QWidget*>& widgets) {
        for (QWidget* widget : widgets) widget->installEventFilter(this);
    }

    int events = 0;
    int pixels = 0;

    bool eventFilter(QObject*, QEvent* event) override {
        if (event->type() != QEvent::Paint) return false;
        ++events;
        for (const QRect& part : static_cast<QPaintEvent*>(event)->region())
            pixels += part.width() * part.height();
        return false;
    }
};

class Painting : public Desk {
protected:
    void open() {
        show();
        bind();
        settle();
    }

    platform::qt::Canvas& canvas() { return child<platform::qt::Canvas>("fraTable"); }
};

} // namespace

TEST_F(Painting, OfAScrolledCanvasIsThatOfWhatComesIntoView) {
    open();
    const QRect window = canvas().parentWidget()->geometry();
    for (const char* name : {"hsbTable", "vsbTable"}) {
        auto& bar = child<QScrollBar>(name);
        ASSERT_GT(bar.maximum(), 600);
        Painted painted({&canvas()});
        bar.setValue(600); // 40 logical pixels
        settle();
        EXPECT_GT(painted.pixels, 0) << name;
        EXPECT_LE(painted.pixels, 40 * std::max(window.width(), window.height())) << name;
    }
}

TEST_F(Painting, OfTheCanvasEndsWhereItsBarsBegin) {
    open();
    auto& across = child<QScrollBar>("hsbTable");
    auto& down = child<QScrollBar>("vsbTable");
    const auto* const window = dynamic_cast<CanvasWindow*>(canvas().parentWidget());
    ASSERT_TRUE(window);
    EXPECT_EQ(window->geometry(), QRect(0, 0, down.x(), across.y()));
    widget->resize(700, 500);
    settle();
    EXPECT_EQ(window->geometry(), QRect(0, 0, down.x(), across.y()));
    down.hide();
    EXPECT_EQ(window->geometry(), QRect(0, 0, 700, across.y())) << "nothing is left bare";
    down.show();
    EXPECT_EQ(window->geometry(), QRect(0, 0, down.x(), across.y()));
}
