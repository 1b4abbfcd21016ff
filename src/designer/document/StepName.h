#pragma once

#include <Zandor/model/Change.h>

#include <QString>

namespace zandor::designer {

/// What a change did, for the menu: "Delete table orders", "Add 3 columns". One line, empty when it
/// did nothing that a person could see.
QString stepName(const model::Change& change);

} // namespace zandor::designer
