#pragma once

#include <Zandor/model/Functions.h>
#include <Zandor/sql/Expression.h>

namespace zandor::model::criteria {

/// What a function takes at a place.
enum class Argument : std::uint8_t {
    any,
    text, ///< anything is made one
    number,
    whole,  ///< a whole number
    digits, ///< a number of decimals, written out
    date,   ///< or a date and time
};

/// What it gives.
enum class Given : std::uint8_t { text, whole, number, sameNumber, date, timestamp, first };

/// How a function is called.
struct Signature {
    FunctionName words;
    sql::Function function;
    Given given;
    std::size_t fewest;              ///< arguments
    std::size_t most;                ///< the last kind stands for all that follow
    std::vector<Argument> arguments; ///< their kinds
};

/// Of the function with a name, letters without regard to case; nothing when there is none. `If` is
/// none of them, for its arguments are not all values.
ZANDOR_MODEL_EXPORT const Signature* signatureOf(StringView name);
/// Of a function; nothing for one that has no name of its own.
const Signature* signatureOf(sql::Function function);

/// Whether people who know SQL call a total so.
bool isTotalName(StringView name);

} // namespace zandor::model::criteria
