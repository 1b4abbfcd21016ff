#pragma once

#include <Zandor/DatabaseReader.h>

namespace zandor::reader {

/// Puts tables into the order of their names as people read them, where an engine's own order
/// depends on how it was set up.
void sortByName(std::vector<TableEntry>& entries);

} // namespace zandor::reader
