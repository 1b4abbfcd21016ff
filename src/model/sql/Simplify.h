#pragma once

#include <Zandor/sql/Expression.h>

namespace zandor::model::sql {

/// A condition that holds for the same rows, with fewer words: no Not but before what has no
/// opposite, nothing said twice, and one list for several values of one column. Nothing stays
/// nothing.
ZANDOR_MODEL_EXPORT Node simplified(const Node& condition);

} // namespace zandor::model::sql
