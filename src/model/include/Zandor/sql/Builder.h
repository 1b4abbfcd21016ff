#pragma once

#include <Zandor/model/export.h>

#include <Zandor/sql/Printer.h>

#include <Zandor/Query.h>
#include <Zandor/model/Finding.h>

#include <optional>

namespace zandor::model::sql {

/// What became of a query.
struct Built {
    std::optional<Statement> statement; ///< nothing when the query has no tables
    Findings findings;                  ///< what was left out, and what else there is to say
};

/// The statement that a query draws. A criterion or definition that cannot be used is left out and
/// named among the findings.
ZANDOR_MODEL_EXPORT Built build(Query& query);

/// What comes out of a query, in its order, as another query reads from it: each column has a name,
/// and one of its own. Empty when nothing comes out.
ZANDOR_MODEL_EXPORT std::vector<ColumnDescription> outputColumns(Query& query);

/// What a host shows: the findings of the query and, for a dialect, of its names and joins.
ZANDOR_MODEL_EXPORT Findings validate(Query& query, Dialect dialect);

/// A statement as text.
struct ZANDOR_MODEL_EXPORT Text {
    String text;                   ///< empty when there is none
    std::vector<Binding> bindings; ///< what takes the places of its placeholders, in their order
    Findings findings;             ///< those of the query and of the dialect

    /// Whether the statement can be run: it is there and says what was drawn.
    bool runnable() const;
};

/// The query as a statement of a dialect, of no more rows than `limit`.
ZANDOR_MODEL_EXPORT Text statementText(Query& query, Dialect dialect, ValueForm form,
                                       std::optional<std::int64_t> limit = {});

} // namespace zandor::model::sql
