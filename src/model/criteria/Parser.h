#pragma once

#include "model/criteria/NameReader.h"

/// The language of criteria as people type them into a cell: a value, or a comparison, or several
/// of them with And, Or and Not; and that of expressions, which stand in for a column.
namespace zandor::model::criteria {

/// What a criterion speaks about.
struct ZANDOR_MODEL_EXPORT Subject {
    Subject() = default;
    Subject(const sql::ColumnRef& column); ///< a column as it is
    /// What comes out of a definition, by its total.
    Subject(sql::Node node, String name);

    sql::Node node;                        ///< nothing: a criterion means nothing here
    ColumnType type = ColumnType::Unknown; ///< of its values
    String name;                           ///< as the grid has it
};

struct Reading {
    sql::Node condition; ///< nothing for a blank text and on an error
    std::optional<Error> error;
    std::optional<Error> warning; ///< it can be read, and may mean something else than it looks
    References references;        ///< on an error those before it, and the known ones behind it
};

/// Reads the condition that a text sets to a subject. Whatever is typed becomes a tree of values,
/// columns and parameters or an error: never SQL text. Names at the place of a `known` reference
/// mean what that says, all others what the resolver finds.
ZANDOR_MODEL_EXPORT Reading read(StringView text, const Subject& subject, const Resolver& resolver,
             const References& known = {});

struct ExpressionReading {
    sql::Node value; ///< nothing on an error
    std::optional<Error> error;
    References references; ///< as those of a Reading
};

/// Reads an expression by the same rules.
ZANDOR_MODEL_EXPORT ExpressionReading
readExpression(StringView text, const Resolver& resolver,
                                 const References& known = {});

} // namespace zandor::model::criteria
