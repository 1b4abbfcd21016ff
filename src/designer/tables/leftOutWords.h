#pragma once

#include "model/reader/addTables.h"

#include <QString>

namespace designer {

/// One line that says which foreign keys were not drawn and why; empty when all of them were.
QString leftOutWords(const std::vector<reader::LeftOut>& leftOut);

} // namespace designer
