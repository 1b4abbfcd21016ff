#pragma once

#include <Zandor/DatabaseReader.h>

namespace zandor::reader {

/// Puts tables into the order of their names as people read them, A beside a, other characters by
/// their code points; equal names by that of their schemas. An engine's own order may depend on how
/// it was set up.
void sortByName(std::vector<TableEntry>& entries);

} // namespace zandor::reader
