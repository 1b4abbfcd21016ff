#include "Contest.h"
#include "Drawing.h"
#include "Hand.h"
#include "Report.h"
#include "Scene.h"
#include "growth.h"

#include "frontends/qt/Canvas.h"
#include "frontends/qt/TabuletWidget.h"

#include <QScrollBar>

// A notch of the wheel until it is painted.

namespace report {

namespace {

constexpr int rounds = 100;

/// Turns to and fro.
class Wheel {
public:
    Wheel(QWidget& widget, Painted& painted) : mWidget(widget), mPainted(painted) {}
    void turn() {
        mUp = !mUp;
        turnWheel(mWidget, mUp);
        mPainted.wait();
    }

private:
    QWidget& mWidget;
    Painted& mPainted;
    bool mUp = true;
};

} // namespace

double listScroll(const Setting& setting) {
    Drawing drawing(setting);
    auto* const bar = drawing.table(0).list().verticalScrollBar();
    bar->setValue(std::min(3, bar->maximum()));
    if (bar->maximum() == 0) return 0; // all of it is in view
    Wheel wheel(*drawing.table(0).list().viewport(), drawing.painted());
    return contest(rounds, {[&] { wheel.turn(); }}).front() * 1e6;
}

void measureScrolling(Report& report) {
    const Setting setting;
    {
        Drawing drawing(setting);
        Scene plain(setting, false), cached(setting, true);
        Wheel ours(drawing.widget(), drawing.painted());
        Wheel ofPlain(*plain.view().viewport(), plain.painted());
        Wheel ofCached(*cached.view().viewport(), cached.painted());
        const auto times = contest(
            rounds, {[&] { ours.turn(); }, [&] { ofPlain.turn(); }, [&] { ofCached.turn(); }});
        report.figures.push_back({.name = QStringLiteral("canvas scroll / better of the scene's"),
                                  .unit = QStringLiteral("us"),
                                  .ours = times[0] * 1e6,
                                  .theirs = std::min(times[1], times[2]) * 1e6,
                                  .goal = 1});
    }
    const double hundred = listScroll(setting);
    report.figures.push_back({.name = QStringLiteral("list scroll with joins, 100 columns"),
                              .unit = QStringLiteral("ms"),
                              .ours = hundred / 1e3,
                              .goal = 0.5});
    report.figures.push_back({.name = QStringLiteral("list scroll, 5,000 columns / 100"),
                              .unit = QStringLiteral("us"),
                              .ours = listScroll({.columns = 5000}),
                              .theirs = hundred,
                              .goal = 1.25});
}

} // namespace report
