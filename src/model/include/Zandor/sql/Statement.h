#pragma once

#include <Zandor/sql/Expression.h>

#include <optional>

namespace zandor::model::sql {

/// All columns of one table of the statement.
struct AllColumns {
    String table;
};

struct SelectItem {
    std::variant<AllColumns, ColumnRef> what;
    String name; ///< under which the column comes out; empty: its own
};

struct TableRef {
    String schema; ///< empty: the default one
    String name;
    String alias; ///< the name that columns refer to; may be the table's own
};

enum class JoinKind { inner, leftOuter, rightOuter, fullOuter };

struct Source;
using SourceNode = std::shared_ptr<const Source>;

struct JoinSource {
    JoinKind kind;
    SourceNode left;
    SourceNode right;
    Node on;    ///< never nothing
    String key; ///< of the query's join that decided the kind
};

struct Source {
    std::variant<TableRef, JoinSource> node;
};

struct OrderItem {
    ColumnRef column;
    bool descending = false;
};

/// A SELECT statement.
struct Statement {
    std::vector<SelectItem> items;
    std::vector<SourceNode> from; ///< more than one: every row of one with every row of the other
    Node where;                   ///< nothing: all rows
    std::vector<OrderItem> order;
    std::optional<std::int64_t> limit;
    std::int64_t offset = 0;
};

} // namespace zandor::model::sql
