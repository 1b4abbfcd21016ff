#pragma once

#include "model/criteria/Tokens.h"

#include <Zandor/model/References.h>
#include <Zandor/sql/Expression.h>

#include <optional>

/// The language of criteria as people type them into a cell: a value, or a comparison, or several
/// of them with And, Or and Not.
namespace zandor::model::criteria {

/// A column as it stands in the statement.
sql::ColumnRef columnRef(const Column& column, const Table& table);

struct NamedColumn {
    sql::ColumnRef column;
    ColumnPlace place;
};

/// The columns that a criterion may name.
class Resolver {
public:
    virtual ~Resolver() = default;
    /// Every column of that name in the query; in the table of that name where one is given.
    virtual std::vector<NamedColumn> columnsNamed(StringView table, StringView column) const = 0;
    virtual std::vector<NamedColumn> columnsNamed(StringView column) const = 0;
};

struct Reading {
    sql::Node condition; ///< nothing for a blank text and on an error
    std::optional<Error> error;
    std::optional<Error> warning; ///< it can be read, and may mean something else than it looks
    References references;        ///< on an error those before it, and the known ones behind it
};

/// Reads the condition that a text sets to a column. Whatever is typed becomes a tree of values,
/// columns and parameters or an error: never SQL text. Names at the place of a `known` reference
/// mean what that says, all others what the resolver finds.
Reading read(StringView text, const sql::ColumnRef& subject, const Resolver& resolver,
             const References& known = {});

} // namespace zandor::model::criteria
