#pragma once

#include <Zandor/model/Comment.h>

#include <vector>

namespace zandor::model {

/// What is said of a query as a whole.
struct QueryOptions {
    /// The most rows that can be asked for.
    static constexpr std::int32_t greatestFirst = 1'000'000'000;

    bool distinct = false;             ///< rows that are equal come out once
    std::int32_t first = 0;            ///< no more rows than these, 0 to greatestFirst; 0: all
    platform::String description = {}; ///< for people
    std::vector<Comment> comments = {}; ///< of its statement, in the order in which they stand there

    /// Whether all comments stand by something.
    bool hasPlacedComments() const {
        for (const Comment& comment : comments)
            if (comment.place < CommentPlace::start || comment.place > CommentPlace::end)
                return false;
        return true;
    }

    friend bool operator==(const QueryOptions&, const QueryOptions&) = default;
};

} // namespace zandor::model
