#pragma once

#include <Zandor/Query.h>
#include <Zandor/model/Finding.h>
#include <Zandor/sql/Statement.h>

namespace zandor::model::sql {

/// The tables of a query joined as drawn: one tree for each set of tables that joins reach.
struct JoinTrees {
    std::vector<SourceNode> trees;
    /// Of joins between columns of one table, where no ON of its own group could take them.
    std::vector<Node> conditions;
};

/// Inner joins bind first: the tables that they connect form a group, within which every join's
/// condition stands in an ON as soon as both its tables are joined. Outer joins then connect the
/// groups, beginning with one that no outer join leaves empty; of several that could follow, first
/// one that the joined rows are kept for and whose own sources are all joined, in drawing order.
/// Of several outer joins between a group and what is joined already, the one drawn first decides
/// on the kind, and all their conditions stand in the one ON. The side of an outer join is the side
/// it was drawn with, in whatever order the tables were added. A join between two columns of one
/// table chooses among its rows before outer joins fill it. Adds findings for outer joins that
/// leave open which rows are kept, and for tables that no join reaches. `leaves` are what the
/// tables are read from, in the order of the query.
JoinTrees joinTrees(Query& query, std::vector<SourceNode> leaves, Findings& findings);

} // namespace zandor::model::sql
