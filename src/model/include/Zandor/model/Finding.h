#pragma once

#include <Zandor/model/Messages.h>

#include <vector>

namespace zandor::model {

/// Something about a query that a person should know, and where it is.
struct Finding {
    /// What there is to say; the message says it in words.
    enum class Kind {
        noTables,
        definitionWithoutColumn,
        sortOnAllColumns,
        duplicateOutputName,
        cartesianProduct,
        incomparableJoin,
        ambiguousOuterJoin,
        badCriterion,
        patternWithoutLike,
        nameNotCarried,
        notInDialect,
        badExpression,
        badTotal,
        criterionNotPlaced,
        sortNotOutput,
        firstUnsorted,
        otherColumnsGiven,
    };

    Kind kind;       ///< what there is to say
    Message message; ///< in words, which are made where they are shown
    // Keys of what is concerned, empty where there is none.
    platform::String table{};      ///< key
    platform::String join{};       ///< key
    platform::String definition{}; ///< key
    std::int16_t row = 0;          ///< grid row of a criterion; 0 where it is about none
    std::size_t position = 0; ///< in the criterion's or expression's text, UTF-16 code units from 0

    /// The message in English: one line.
    platform::String text() const { return message.text(); }

    /// Whether the statement would not say what the user drew, or could not be written.
    bool isError() const {
        return kind == Kind::noTables || kind == Kind::badCriterion ||
               kind == Kind::nameNotCarried || kind == Kind::notInDialect ||
               kind == Kind::definitionWithoutColumn || kind == Kind::badExpression ||
               kind == Kind::badTotal || kind == Kind::criterionNotPlaced ||
               kind == Kind::sortNotOutput || kind == Kind::otherColumnsGiven;
    }
};

using Findings = std::vector<Finding>; ///< in the order in which they were found

} // namespace zandor::model
