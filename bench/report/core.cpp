#include "Arithmetic.h"
#include "Contest.h"
#include "Report.h"

#include "support/Backstage.h"

#include <Zandor/Library.h>
#include <Zandor/headless/Toolkit.h>

#include <random>

// The control's own share of a drag and of a click, on the toolkit in memory.

namespace report {

using namespace zandor;
using Back = TalvikDBxZandor::ZandorBackstage;

namespace {

struct Deaf final : TalvikDBxZandor::ZandorEvents {
    void Raise(TalvikDBxZandor::Event, const TalvikDBxZandor::EventArguments&) override {}
};

/// The setting under a control on the toolkit in memory.
struct Core {
    explicit Core(const Setting& setting) {
        control.DebugSwitch(0);
        control.P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(setting.query()));
    }

    model::Library library;
    platform::headless::Toolkit toolkit;
    Deaf events;
    TalvikDBxZandor::Zandor control{toolkit, library, events};
};

constexpr int repeats = 200; ///< of what takes less than a microsecond

} // namespace

double coreStep(const Setting& setting) {
    Core core(setting);
    auto& table = *Back::lstTable(core.control)(1);
    float left = 300;
    const auto times = contest(60, {[&] {
                                   for (int n = 0; n < repeats; ++n) {
                                       table.Left(left = left < 3000 ? left + 15 : 300);
                                       Back::lstTable_Moving(core.control, std::int16_t{1});
                                   }
                               }});
    return times.front() / repeats * 1e6;
}

void measureCore(Report& report) {
    const Setting setting;
    Core core(setting);
    Arithmetic arithmetic(setting);
    auto& table = *Back::lstTable(core.control)(1);
    float ourLeft = 300, theirLeft = 300;
    const auto geometry =
        contest(200, {[&] {
                          for (int n = 0; n < repeats; ++n) {
                              table.Left(ourLeft = ourLeft < 3000 ? ourLeft + 15 : 300);
                              Back::lstTable_Moving(core.control, std::int16_t{1});
                          }
                      },
                      [&] {
                          for (int n = 0; n < repeats; ++n) {
                              theirLeft = theirLeft < 3000 ? theirLeft + 15 : 300;
                              arithmetic.move(0, theirLeft, 300);
                          }
                      }});
    report.figures.push_back({.name = QStringLiteral("geometry of a drag step / arithmetic"),
                              .unit = QStringLiteral("us"),
                              .ours = geometry[0] / repeats * 1e6,
                              .theirs = geometry[1] / repeats * 1e6,
                              .goal = 8});

    // The same lines for both, and points of which every other is near one of them.
    auto& lines = Back::linJoin(core.control);
    auto& theirs = arithmetic.lines();
    for (std::size_t n = 0; n < theirs.size(); ++n) {
        const auto& line = *lines(static_cast<std::int32_t>(n) + 1);
        theirs[n] = {line.X1(), line.Y1(), line.X2(), line.Y2()};
    }
    std::mt19937 dice(5);
    const auto upTo = [&](float end) {
        return std::uniform_real_distribution<float>(0, end)(dice);
    };
    std::vector<QPointF> points;
    while (points.size() < repeats) {
        points.emplace_back(upTo(18000), upTo(12000));
        const auto& line = theirs[dice() % theirs.size()];
        const float share = upTo(1);
        points.emplace_back(line.x1 + share * (line.x2 - line.x1),
                            line.y1 + share * (line.y2 - line.y1) + upTo(40));
    }
    using Record = platform::Ref<TalvikDBxZandor::clsJoinLine>;
    const auto ourHit = [&](const QPointF& at) {
        Record hit;
        Back::JoinHitTest(core.control, hit, static_cast<float>(at.x()),
                          static_cast<float>(at.y()));
        return hit ? hit->JoinLineIndex() - 1 : -1;
    };
    const auto theirHit = [&](const QPointF& at) {
        return arithmetic.lineAt(static_cast<float>(at.x()), static_cast<float>(at.y()));
    };
    int different = 0;
    for (const QPointF& at : points) different += ourHit(at) != theirHit(at);
    if (different > 0) qFatal("%d of %zu points are on other lines", different, points.size());
    int sum = 0;
    const auto hits = contest(400, {[&] {
                                        for (const QPointF& at : points) sum += ourHit(at);
                                    },
                                    [&] {
                                        for (const QPointF& at : points) sum -= theirHit(at);
                                    }});
    if (sum != 0) qFatal("the hits are not the same");
    const auto each = [&](std::size_t n) {
        return hits[n] / static_cast<double>(points.size()) * 1e9;
    };
    report.figures.push_back({.name = QStringLiteral("hit test over 64 lines / arithmetic"),
                              .unit = QStringLiteral("ns"),
                              .ours = each(0),
                              .theirs = each(1),
                              .goal = 0.5});
}

} // namespace report
