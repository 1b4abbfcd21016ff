#pragma once

#include "model/sql_reader/Tree.h"

#include <Zandor/sql/Dialect.h>
#include <Zandor/sql/Expression.h>

#include <map>
#include <optional>
#include <vector>

namespace zandor::sql_reader {

using model::sql::Dialect;
using platform::String;
using platform::StringView;

/// One way of a dialect to say something that expressions have a word for.
struct Form {
    nlohmann::json pattern; ///< as the parser reads it, with the places of arguments in it
    String expression;      ///< the same as an expression, with {1}, {2} for the arguments
    std::optional<model::sql::Function> function; ///< which it must come to; nothing: whatever
    Dialect dialect;

    /// What stands at the places of the arguments, by their numbers; nothing where a node does not
    /// have this form.
    std::optional<std::map<int, Tree>> match(const Tree& node) const;
};

/// How the printer makes a moment of a date, for which expressions have no word.
const Form& momentOf(Dialect dialect);

/// What the printer writes in a dialect, and what else people write there that means the same.
const std::vector<Form>& formsOf(Dialect dialect);

} // namespace zandor::sql_reader
