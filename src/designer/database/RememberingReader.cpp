#include "designer/database/RememberingReader.h"

#include <algorithm>

namespace zandor::designer {

using reader::ForeignKey;
using reader::Result;
using reader::TableId;

RememberingReader::RememberingReader(std::unique_ptr<DatabaseReader> reader)
    : mReader(std::move(reader)) {}

Result<std::vector<reader::TableEntry>> RememberingReader::tables() { return mReader->tables(); }

Result<model::TableDescription> RememberingReader::table(const TableId& id) {
    if (knowsTable(id)) return *known(id)->description;
    auto description = mReader->table(id);
    if (description) entry(id).description = *description;
    return description;
}

Result<std::vector<ForeignKey>> RememberingReader::foreignKeys(const TableId& child) {
    if (knowsForeignKeys(child)) return *known(child)->foreignKeys;
    auto keys = mReader->foreignKeys(child);
    if (keys) entry(child).foreignKeys = *keys;
    return keys;
}

bool RememberingReader::knowsTable(const TableId& id) const {
    const KnownTable* table = known(id);
    return table && table->description;
}

bool RememberingReader::knowsForeignKeys(const TableId& child) const {
    const KnownTable* table = known(child);
    return table && table->foreignKeys;
}

void RememberingReader::remember(const std::vector<KnownTable>& tables) {
    for (const KnownTable& table : tables) {
        KnownTable& own = entry(table.id);
        if (table.description) own.description = table.description;
        if (table.foreignKeys) own.foreignKeys = table.foreignKeys;
    }
}

const KnownTable* RememberingReader::known(const TableId& id) const {
    const auto found = std::ranges::find(mKnown, id, &KnownTable::id);
    return found == mKnown.end() ? nullptr : &*found;
}

KnownTable& RememberingReader::entry(const TableId& id) {
    const auto found = std::ranges::find(mKnown, id, &KnownTable::id);
    return found == mKnown.end() ? mKnown.emplace_back(KnownTable{id, {}, {}}) : *found;
}

} // namespace zandor::designer
