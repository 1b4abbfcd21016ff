#pragma once

#include "model/Change.h"

namespace model {

class Query;

/// Remembers a query, and tells what is different later. Columns of tables are not looked at: they
/// never change.
class Snapshot {
public:
    explicit Snapshot(Query& query) { update(query); }

    /// What came about since the last time; from now on the query is remembered as it is. Always of
    /// the same query.
    Change update(Query& query);

private:
    LastKeys mLastKeys;
    std::vector<TableState> mTables;
    std::vector<JoinState> mJoins;
    std::vector<DefinitionState> mDefinitions;
};

} // namespace model
