#include "designer/properties/totals.h"

#include <QCoreApplication>

namespace zandor::designer {

using model::Total;

namespace {

class TotalWords {
    Q_DECLARE_TR_FUNCTIONS(zandor::designer::Total)
};

} // namespace

std::span<const Total> allTotals() {
    static constexpr Total all[] = {
        Total::None,     Total::Sum,     Total::Average, Total::Count,    Total::CountDifferent,
        Total::Smallest, Total::Largest, Total::Group,   Total::Condition};
    return all;
}

QString nameOf(Total total) {
    switch (total) {
    case Total::None: return TotalWords::tr("&No total");
    case Total::Group: return TotalWords::tr("&Group by it");
    case Total::Count: return TotalWords::tr("&Count");
    case Total::CountDifferent: return TotalWords::tr("Count &different values");
    case Total::Sum: return TotalWords::tr("&Sum");
    case Total::Average: return TotalWords::tr("&Average");
    case Total::Smallest: return TotalWords::tr("S&mallest");
    case Total::Largest: return TotalWords::tr("&Largest");
    case Total::Condition: return TotalWords::tr("C&riteria only");
    }
    return {};
}

} // namespace zandor::designer
