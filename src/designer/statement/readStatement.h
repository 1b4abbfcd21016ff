#pragma once

#include <Zandor/DatabaseReader.h>
#include <Zandor/Query.h>
#include <Zandor/sql/Dialect.h>

#include <QString>

namespace zandor::designer {

/// What the names in a statement are looked up in. What is given must outlive it.
struct StatementGround {
    reader::DatabaseReader& reader;
    const std::vector<reader::TableEntry>& tables; ///< the reader's
    model::sql::Dialect dialect;                   ///< the statement's
};

/// Why a statement is not drawn.
struct Undrawn {
    QString message;  ///< what it is and what to do, without the place
    int position = 0; ///< of what is meant, in UTF-16 code units of the text from 0
    int line = 0;     ///< the same place by lines, from 1; 0: it is about no place
    int column = 0;   ///< and code units in that line, from 1

    /// In the designer's language: "Line 2, column 8: ...", where there is a place.
    QString withPlace() const;
};

/// The query that draws a statement, or why there is none. Its tables have no places. Tables that
/// the reader does not know yet are read, which waits for a server; see tablesNamedIn. More than
/// the drawing takes is refused.
model::Result<platform::Ref<model::Query>, Undrawn> readStatement(const QString& text,
                                                                  const StatementGround& ground);

/// Those of a database's tables whose names stand in a text, whatever they mean there: what has to
/// be known before it is read, or offered while it is typed.
std::vector<reader::TableId> tablesNamedIn(const QString& text,
                                           const std::vector<reader::TableEntry>& tables);

} // namespace zandor::designer
