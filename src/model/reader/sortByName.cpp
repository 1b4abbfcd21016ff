#include "model/reader/sortByName.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <tuple>

namespace zandor::reader {

void sortByName(std::vector<TableEntry>& entries) {
    std::sort(entries.begin(), entries.end(), [](const TableEntry& left, const TableEntry& right) {
        return std::tuple(model::foldedName(left.id.name), left.id.name, left.id.schema) <
               std::tuple(model::foldedName(right.id.name), right.id.name, right.id.schema);
    });
}

} // namespace zandor::reader
