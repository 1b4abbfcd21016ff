#include "Contest.h"
#include "Drawing.h"
#include "Hand.h"
#include "KeptPictures.h"
#include "Report.h"
#include "Scene.h"

#include "frontends/qt/Canvas.h"
#include "frontends/qt/TabuletWidget.h"

// A step of the mouse with a table under it, by real events and until it is painted.

namespace report {

namespace {

constexpr QPointF title(60, 12); ///< a place in a table's title
constexpr int rounds = 150;

/// A table of a scene that is being dragged.
class SceneDrag {
public:
    explicit SceneDrag(Scene& scene)
        : mScene(scene), mAt(scene.view().mapFromScene(scene.table(0).pos() + title)),
          mHand(*scene.view().viewport(), mAt) {}

    void step() {
        mHand.moveTo(mAt + wayOf(++mStep));
        mScene.painted().wait();
    }

private:
    Scene& mScene;
    const QPointF mAt;
    Hand mHand;
    int mStep = 0;
};

/// One of the control. Asked for all, every widget of it paints at each step.
class DrawingDrag {
public:
    explicit DrawingDrag(Drawing& drawing) : mDrawing(drawing), mHand(drawing.table(0), title) {}

    void step(bool all = false) {
        mHand.moveTo(title + wayOf(++mStep));
        if (all)
            for (QWidget* each : mDrawing.widget().findChildren<QWidget*>()) each->update();
        mDrawing.painted().wait();
    }

private:
    Drawing& mDrawing;
    Hand mHand;
    int mStep = 0;
};

} // namespace

double dragStep(const Setting& setting) {
    Drawing drawing(setting);
    DrawingDrag drag(drawing);
    return contest(40, {[&] { drag.step(); }}).front() * 1e6;
}

void measureDragging(Report& report) {
    const Setting setting;
    Drawing drawing(setting);
    KeptPictures kept(drawing);
    Scene plain(setting, false), cached(setting, true), whole(setting, true);
    whole.view().setViewportUpdateMode(QGraphicsView::FullViewportUpdate);
    DrawingDrag ours(drawing);
    SceneDrag ofPlain(plain), ofCached(cached), ofWhole(whole);
    int step = 0;
    const auto times =
        contest(rounds, {[&] { ours.step(); }, [&] { ofPlain.step(); }, [&] { ofCached.step(); },
                         [&] { ours.step(true); }, [&] { ofWhole.step(); },
                         [&] { kept.paint(wayOf(++step).toPoint()); }});
    const auto us = [&](std::size_t n) { return times[n] * 1e6; };
    report.figures.push_back({.name = QStringLiteral("drag step / better of the scene's"),
                              .unit = QStringLiteral("us"),
                              .ours = us(0),
                              .theirs = std::min(us(1), us(2)),
                              .goal = 0.5,
                              .note = QStringLiteral("plain scene %1 us, with caches %2 us")
                                          .arg(us(1), 0, 'f', 0)
                                          .arg(us(2), 0, 'f', 0)});
    report.figures.push_back(
        {.name = QStringLiteral("drag step, all painted / scene, cached, all painted"),
         .unit = QStringLiteral("us"),
         .ours = us(3),
         .theirs = us(4),
         .goal = 1});
    report.figures.push_back(
        {.name = QStringLiteral("drag step, all painted / bare painter from kept pictures"),
         .unit = QStringLiteral("us"),
         .ours = us(3),
         .theirs = us(5),
         .goal = 3});
}

} // namespace report
