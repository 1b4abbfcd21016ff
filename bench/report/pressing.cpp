#include "Contest.h"
#include "Drawing.h"
#include "Hand.h"
#include "Report.h"
#include "growth.h"

#include "frontends/qt/Canvas.h"
#include "frontends/qt/TabuletWidget.h"

namespace report {

namespace {

/// Presses two entries in turn, each until it is painted.
class Presses {
public:
    explicit Presses(const Setting& setting) : mDrawing(setting) {}

    void press() {
        auto& list = mDrawing.table(0).list();
        const int row = ++mPresses % 2 + 1;
        const Hand hand(*list.viewport(),
                        QPointF(40, list.firstEntry() + list.rowHeight() * (row + 0.5)));
        mDrawing.painted().wait();
    }

private:
    Drawing mDrawing;
    int mPresses = 0;
};

} // namespace

double press(const Setting& setting) {
    Presses presses(setting);
    return contest(60, {[&] { presses.press(); }}).front() * 1e6;
}

void measurePressing(Report& report) {
    Presses few(Setting{}), many(Setting{.columns = 5000});
    const auto times = contest(100, {[&] { many.press(); }, [&] { few.press(); }});
    report.figures.push_back({.name = QStringLiteral("press on an entry, 5,000 columns / 100"),
                              .unit = QStringLiteral("us"),
                              .ours = times[0] * 1e6,
                              .theirs = times[1] * 1e6,
                              .goal = 1.5});
}

} // namespace report
