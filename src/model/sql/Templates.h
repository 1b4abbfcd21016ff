#pragma once

#include <Zandor/sql/Dialect.h>
#include <Zandor/sql/Expression.h>

namespace zandor::model::sql {

/// How a dialect says a function of so many arguments; empty where it cannot. Arguments stand in
/// braces by their number from 1: {1} as it is, {1:0} and {1:1} a whole number that is no less
/// than that, {1:digits} a number written out, {1:moment} cast to a moment where nobody knows its
/// type, {1:tight} beside an operator, {*} all of them with commas between.
ZANDOR_MODEL_EXPORT StringView templateOf(Function function, std::size_t arguments, Dialect dialect);

/// As the language calls it, for messages.
StringView nameOf(Function function);

} // namespace zandor::model::sql
