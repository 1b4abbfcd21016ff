#pragma once

#include <Zandor/sql/Dialect.h>

#include <string>
#include <vector>

namespace zandor::sql_reader {

using model::sql::Dialect;
using platform::String;
using platform::StringView;

/// A statement as the parser reads it, whatever dialect it was written in.
struct ParserText {
    std::string text; ///< UTF-8, a blank for each comment

    /// What its $1, $2, ... ask for.
    std::vector<String> parameters;

    /// Where a byte of it came from, in code units of the statement.
    std::size_t origin(std::size_t byte) const;

    /// Bytes that begin a token, and where these stood; in order.
    struct Origin {
        std::size_t byte;
        std::size_t unit;
    };
    std::vector<Origin> origins;

    /// A CAST of a constant is one, and no date or moment written out.
    bool keepsCasts = false;
    int truths = 0; ///< how often TRUE or FALSE stands there, other than behind AS or a point

    /// What stood at a byte of it.
    struct Comment {
        std::size_t byte;
        bool beside; ///< a token stands before it on its line
        String text; ///< without marks and margins
    };
    std::vector<Comment> comments; ///< in order

    /// Parentheses, in the order in which they begin.
    struct Parentheses {
        std::size_t begin;
        std::size_t end;
    };
    std::vector<Parentheses> parentheses;
};

/// The function that stands for SQL Server's TOP, first among what is selected.
inline constexpr StringView topFunction = u"\uE000top";

/// Rewrites what a dialect has of its own, token by token: quotes, parameters, TOP, LIMIT with a
/// comma, numbers of bytes. What it does not know stays as it is, for the parser to judge. Throws
/// Refused, with a place in code units, for a quote that has no end, and for a comment that is run.
ParserText lexed(StringView text, Dialect dialect);

} // namespace zandor::sql_reader
