#pragma once

#include <Zandor/model/Comment.h>
#include <Zandor/sql/Expression.h>

#include <optional>

namespace zandor::model::sql {

/// All columns of one table of the statement.
struct AllColumns {
    String table; ///< the name under which it stands in the statement
};

/// One column of the rows, or all of a table.
struct SelectItem {
    std::variant<AllColumns, Node> what; ///< what comes out
    String name;                         ///< under which the column comes out; empty: its own
};

/// A table of the database in the statement.
struct TableRef {
    String schema; ///< empty: the default one
    String name;   ///< in the database
    String alias;  ///< the name that columns refer to; may be the table's own
};

struct Statement;

/// A query that is read from like a table. Each of its columns has a name that is its own, and all
/// of a table stands for no columns there. What is one statement is one query: where it stands
/// twice it is written once.
struct SubSelect {
    std::shared_ptr<const Statement> statement; ///< never nothing; without an order but for a limit
    String alias;                               ///< the name that columns refer to
};

/// Which rows stay without a partner: none, those of the left side, of the right one, of both.
enum class JoinKind { inner, leftOuter, rightOuter, fullOuter };

struct Source;
using SourceNode = std::shared_ptr<const Source>; ///< Shared, and never changed

/// Two sources and what joins them.
struct JoinSource {
    JoinKind kind;    ///< which rows stay
    SourceNode left;  ///< the left side
    SourceNode right; ///< the right side
    Node on;          ///< never nothing
    String key;       ///< of the query's join that decided the kind
};

/// A table, sources that are joined, or a query.
struct Source {
    std::variant<TableRef, JoinSource, SubSelect> node; ///< which of the three
};

/// The name that columns refer to; of joined sources that of the first.
ZANDOR_MODEL_EXPORT const String& aliasOf(const Source& source);

/// A column that sorts.
struct OrderItem {
    Node value;              ///< what it sorts by
    bool descending = false; ///< the greatest first
};

/// A comment within a statement.
struct Remark {
    /// What it stands by: a clause, an item by its number from 0, a source by its alias, or a
    /// condition.
    std::variant<CommentPlace, std::size_t, String, Node> by;
    bool beside = false; ///< behind it on its line; else before it on lines of its own
    String text;         ///< without marks; lines end with U+000A
};

/// A SELECT statement.
struct Statement {
    bool distinct = false;         ///< rows that are equal come out once
    std::vector<SelectItem> items; ///< never empty
    std::vector<SourceNode> from;  ///< more than one: every row of one with every row of the other
    Node where;                    ///< nothing: all rows
    std::vector<Node> group;       ///< rows that are equal in these are put together
    Node having;                   ///< a condition on what was put together; nothing: all of it
    std::vector<OrderItem> order;  ///< the first sorts first
    std::optional<std::int64_t> limit; ///< of rows; nothing: all
    std::int64_t offset = 0;           ///< rows left out before the first
    std::vector<Remark> remarks;       ///< shown, and not run
};

} // namespace zandor::model::sql
