#pragma once

#include "designer/database/Database.h"

class QWidget;

namespace zandor::designer {

/// Tables whose columns, and tables whose foreign keys are to be known.
struct Wanted {
    std::vector<reader::TableId> columns;
    std::vector<reader::TableId> foreignKeys;

    bool empty() const { return columns.empty() && foreignKeys.empty(); }
};

/// What was read, or why not, and whether the connection broke down over it.
struct TablesRead {
    reader::Result<std::vector<KnownTable>> tables;
    bool lost = false;
};

/// What the database's reader does not know yet of it.
Wanted unknownOf(Database& database, const Wanted& wanted);

/// Reads over a connection of its own; for any thread.
TablesRead readTables(const Connector& connect, const Wanted& wanted);

/// Hands what was read to the database's reader; the error, when there is one. Tells of a loss.
std::optional<reader::Error> takeTables(Database& database, const TablesRead& read);

} // namespace zandor::designer
