#include "designer/database/readTables.h"

#include "designer/statement/ModelWords.h"

namespace zandor::designer {

using reader::TableId;

Wanted unknownOf(Database& database, const Wanted& wanted) {
    Wanted unknown;
    for (const TableId& id : wanted.columns)
        if (!database.reader().knowsTable(id)) unknown.columns.push_back(id);
    for (const TableId& id : wanted.foreignKeys)
        if (!database.reader().knowsForeignKeys(id)) unknown.foreignKeys.push_back(id);
    return unknown;
}

TablesRead readTables(const Connector& connect, const Wanted& wanted) {
    std::vector<KnownTable> known;
    const auto connection = connect();
    if (!connection) return {connection.failure(), true};
    const auto reader = reader::makeReader(connection->database());
    const auto failed = [&](const reader::Error& error) {
        return TablesRead{error, !reader::answers(*connection)};
    };
    for (const TableId& id : wanted.columns) {
        auto description = reader->table(id);
        if (!description) return failed(description.failure());
        known.push_back({id, std::move(*description), {}});
    }
    for (const TableId& id : wanted.foreignKeys) {
        auto keys = reader->foreignKeys(id);
        if (!keys) return failed(keys.failure());
        known.push_back({id, {}, std::move(*keys)});
    }
    return {std::move(known)};
}

std::optional<reader::Error> takeTables(Database& database, const TablesRead& read) {
    if (read.tables) {
        database.reader().remember(*read.tables);
        database.sayFound();
        return {};
    }
    if (read.lost) database.sayLost(inWords(read.tables.failure()));
    return read.tables.failure();
}

} // namespace zandor::designer
