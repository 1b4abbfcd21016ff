#pragma once

#include <QString>

namespace TalvikDBxZandor {
class Zandor;
}

namespace zandor::platform::qt {

struct LineEnds;

/// A join as it is spoken: "Join ORDERS.CUSTOMER_ID = CUSTOMERS.ID, Left Outer". Sides, operator
/// and type are the model's; while the model does not know the join, the sides are those that the
/// line runs between, the western one first.
QString joinName(TalvikDBxZandor::Zandor& control, const LineEnds& ends);

} // namespace zandor::platform::qt
