#pragma once

#include "model/criteria/Cursor.h"

#include <Zandor/model/References.h>
#include <Zandor/sql/Expression.h>

namespace zandor::model::criteria {

/// A column as it stands in the statement.
sql::ColumnRef columnRef(const Column& column, const Table& table);

struct NamedColumn {
    sql::ColumnRef column;
    ColumnPlace place;
};

/// The columns that a criterion or an expression may name.
class Resolver {
public:
    virtual ~Resolver() = default;
    /// Every column of that name in the query; in the table of that name where one is given.
    virtual std::vector<NamedColumn> columnsNamed(StringView table, StringView column) const = 0;
    virtual std::vector<NamedColumn> columnsNamed(StringView column) const = 0;
};

/// Reads names and says what they mean. Those at the place of a known reference mean what that
/// says, all others what the resolver finds.
class NameReader {
public:
    NameReader(Cursor& cursor, const Resolver& resolver, const References& known)
        : mCursor(cursor), mResolver(resolver), mKnown(known) {}

    /// table.column in any mix of bare and bracketed names; nothing where there is none. A bare
    /// pair that names no column of the query is left alone: it is the caller's to say what it is.
    /// As a text, where it may be one, it stays one, whatever tables come later.
    sql::Node takeQualified(bool mayBeText);
    /// The [name] ahead: a column when just one table has it, and a parameter when none has.
    sql::Node takeBracketed();
    /// The bare name ahead, a column that just one table has; nothing where none has.
    sql::Node takeBare();
    /// :name, or nothing where there is none. A text may begin with a colon; other values cannot.
    sql::Node takeParameter(bool mayBeText);

    /// What was found, in the order of the text.
    References references;
    /// What was known behind the place where reading stopped stays known.
    void keepKnown();

private:
    std::optional<sql::ColumnRef> lookUp(Reference reference, StringView table, StringView column);
    /// A name without a table; nothing where no column has it.
    std::optional<sql::ColumnRef> lookUpAlone(const Token& token);
    const Reference* knownAt(std::size_t begin) const;

    Cursor& mCursor;
    const Resolver& mResolver;
    const References& mKnown;
};

} // namespace zandor::model::criteria
