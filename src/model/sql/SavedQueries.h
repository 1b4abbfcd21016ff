#pragma once

#include <Zandor/sql/Builder.h>

#include <deque>

namespace zandor::model::sql {

/// Column by column, so that no item stands for all of a table. `query` is the one that the
/// statement was made from. An item without a name gets one, and one that has another's gets its
/// own.
void writeColumnsOut(Statement& statement, Query& query);
/// What the items of such a statement are called.
std::vector<String> namesOf(const Statement& statement);

/// What the tables of a query are read from, those of the saved queries in it as well. Queries that
/// are equal give one statement.
class SavedQueries {
public:
    /// Adds what there is to say about a saved query.
    SourceNode sourceOf(const Table& table, Findings& findings);

private:
    struct Known {
        SavedQueryRef query;
        Built built{};
        std::shared_ptr<const Statement> statement{};
    };

    const Known& known(const SavedQueryRef& query);

    std::deque<Known> mKnown; ///< keeps its places while it grows
};

/// As Builder.h's, in the company of others.
Built build(Query& query, SavedQueries& saved);

} // namespace zandor::model::sql
