#pragma once

#include <Zandor/reader/addTables.h>

#include <QString>

namespace zandor::designer {

/// One line that says which foreign keys were not drawn and why; empty when all of them were.
QString leftOutWords(const std::vector<reader::LeftOut>& leftOut);

} // namespace zandor::designer
