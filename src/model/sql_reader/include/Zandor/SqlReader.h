#pragma once

#include <Zandor/Query.h>
#include <Zandor/model/Result.h>
#include <Zandor/sql/Dialect.h>
#include <Zandor/sql_reader/Messages.h>
#include <Zandor/sql_reader/export.h>

#include <cstddef>
#include <functional>
#include <optional>

/// Statements as people have them, read into drawings.
namespace zandor::sql_reader {

using model::Message;
using platform::Ref;
using platform::String;
using platform::StringView;

/// What a database has, as far as a statement names it.
struct Schema {
    /// The table or view of a name as the engine compares names; an empty schema is the default
    /// one. Nothing where there is none. What it throws goes on to the caller.
    std::function<std::optional<model::TableDescription>(StringView schema, StringView name)> table;
    /// All names, of which the nearest is proposed for one that is not there. May be empty.
    std::vector<String> names;
};

/// Why a statement cannot be drawn, and where.
struct ZANDOR_SQLREADER_EXPORT Refusal {
    Message message;          ///< what it is, and what to do
    std::size_t position = 0; ///< of what is meant, in UTF-16 code units of the text from 0
    std::int32_t line = 1;    ///< the same place by lines, from 1
    std::int32_t column = 1;  ///< and code units in that line, from 1

    /// In English, one line: "Line 2, column 8: ...".
    String text() const;
    /// The same as a message, to be said in any language.
    Message withPlace() const;
};

/// What a text is read as.
using Drawn = model::Result<Ref<model::Query>, Refusal>;

/// The longest text that is read, in UTF-16 code units. A drawing may come to a longer one.
inline constexpr std::size_t longestText = 100'000;

/// The query that draws a SELECT statement of a dialect. Its tables have no places. Building it
/// again gives a statement that says the same: where it would not, the statement is refused. Nothing
/// is changed by a refusal.
ZANDOR_SQLREADER_EXPORT Drawn read(StringView text, model::sql::Dialect dialect,
                                    const Schema& schema);

} // namespace zandor::sql_reader
