#include "Contest.h"
#include "Drawing.h"
#include "Report.h"
#include "Scene.h"
#include "growth.h"

#include <malloc.h>

namespace report {

namespace {

/// Made and painted; taking it down is not counted.
template <class Made, class... Arguments>
double making(Arguments&&... arguments) {
    std::unique_ptr<Made> made;
    return ownSeconds([&] { made = std::make_unique<Made>(arguments...); });
}

double bindMedian(const Setting& setting, int rounds) {
    const auto query = setting.query();
    std::vector<double> times;
    for (int n = 0; n < rounds; ++n) times.push_back(making<Drawing>(query));
    return median(times);
}

} // namespace

double bind(const Setting& setting) { return bindMedian(setting, 5) * 1e3; }

void measureBinding(Report& report) {
    const Setting setting;
    const auto query = setting.query();
    std::vector<double> ours, theirs;
    for (int n = 0; n < 15; ++n) {
        ours.push_back(making<Drawing>(query));
        theirs.push_back(making<Scene>(setting, false));
    }
    report.figures.push_back({.name = QStringLiteral("bind 16 x 100 / the scene's building"),
                              .unit = QStringLiteral("ms"),
                              .ours = median(ours) * 1e3,
                              .theirs = median(theirs) * 1e3,
                              .goal = 2});
    report.figures.push_back({.name = QStringLiteral("bind a column, 5,000 columns / 500"),
                              .unit = QStringLiteral("us"),
                              .ours = bindMedian({.columns = 5000}, 3) / 5000 / 16 * 1e6,
                              .theirs = bindMedian({.columns = 500}, 5) / 500 / 16 * 1e6,
                              .goal = 1.25});

    // Of a second one, when what Qt keeps for all widgets is there.
    const Drawing first(query);
    const auto taken = [] {
        const auto info = mallinfo2();
        return static_cast<double>(info.uordblks) / 1024;
    };
    zandor::model::Library library;
    QWidget window;
    window.resize(Setting::window);
    window.show();
    Painted painted(window);
    painted.wait();
    const double before = taken();
    const auto widget = std::make_unique<ZandorWidget>(library, &window);
    widget->setDebugSwitch(0);
    widget->resize(Setting::window);
    widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(query));
    widget->show();
    painted.wait();
    report.figures.push_back({.name = QStringLiteral("heap of a bound control without its model"),
                              .unit = QStringLiteral("KiB"),
                              .ours = taken() - before,
                              .goal = 400});
}

} // namespace report
