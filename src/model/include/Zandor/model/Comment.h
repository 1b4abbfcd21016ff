#pragma once

#include <Zandor/platform/String.h>

#include <cstdint>

namespace zandor::model {

/// What a comment of a statement stands by: its first word, a table, an output column or one of its
/// criteria, what rows are put together or sorted by, or nothing more.
enum class CommentPlace { start, table, column, criterion, groups, order, end };

/// A comment that the statement of a query has. It shows where what it stands by shows.
struct Comment {
    CommentPlace place = CommentPlace::start; ///< what it stands by
    platform::String key = {};                ///< of the table or output column; else empty
    std::int16_t row = 0;                     ///< of the criterion, 4 to 32767; else 0
    bool beside = false;         ///< behind it on its line; else before it on lines of its own
    platform::String text = {};  ///< without marks; lines end with U+000A

    friend bool operator==(const Comment&, const Comment&) = default;
};

} // namespace zandor::model
