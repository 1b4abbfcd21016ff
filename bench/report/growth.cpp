#include "growth.h"

#include "Report.h"

namespace report {

namespace {

struct Kind {
    const char* name;
    const char* unit;
    double (*measure)(const Setting&);
};

constexpr Kind dragging{"drag step", "us", dragStep};
constexpr Kind geometry{"geometry of a drag step", "us", coreStep};
constexpr Kind scrolling{"list scroll", "us", listScroll};
constexpr Kind pressing{"press on an entry", "us", press};
constexpr Kind binding{"bind, shown and painted", "ms", bind};

/// The setting, and in its place of one number another.
void grow(Report& report, const std::vector<Kind>& kinds, const char* of, int Setting::*number,
          const std::vector<int>& sizes) {
    for (const Kind& kind : kinds) {
        Growth growth{QString::fromLatin1(kind.name),
                      QString::fromLatin1(of),
                      QString::fromLatin1(kind.unit),
                      {}};
        for (const int size : sizes) {
            Setting setting;
            setting.*number = size;
            growth.points.emplace_back(size, kind.measure(setting));
        }
        report.growths.push_back(growth);
    }
}

} // namespace

void measureGrowth(Report& report) {
    grow(report, {dragging, geometry, scrolling, pressing, binding}, "columns", &Setting::columns,
         {10, 30, 100, 300, 1000, 5000});
    grow(report, {dragging, geometry, scrolling}, "joins", &Setting::joins, {0, 8, 16, 32, 64});
    grow(report, {dragging, binding}, "tables", &Setting::tables, {1, 2, 4, 8, 16});
}

} // namespace report
