#include "designer/properties/totals.h"

#include <QCoreApplication>

namespace zandor::designer {

using model::Total;

namespace {

class Words {
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
    case Total::None: return Words::tr("&No total");
    case Total::Group: return Words::tr("&Group by it");
    case Total::Count: return Words::tr("&Count");
    case Total::CountDifferent: return Words::tr("Count &different values");
    case Total::Sum: return Words::tr("&Sum");
    case Total::Average: return Words::tr("&Average");
    case Total::Smallest: return Words::tr("S&mallest");
    case Total::Largest: return Words::tr("&Largest");
    case Total::Condition: return Words::tr("C&riteria only");
    }
    return {};
}

} // namespace zandor::designer
