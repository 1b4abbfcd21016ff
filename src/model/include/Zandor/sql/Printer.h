#pragma once

#include <Zandor/model/export.h>
#include <Zandor/sql/Dialect.h>

namespace zandor::model::sql {

/// Where values leave.
enum class ValueForm {
    bound,   ///< beside the statement, for running it
    literal, ///< within it, for showing it
    script,  ///< within it, with a closing `;` and parameters as the engine's own shell takes them
};

/// What takes the place of one placeholder.
using Binding = std::variant<Value, Parameter>;

/// A statement in a dialect.
struct Printed {
    String text;                   ///< one clause a line
    std::vector<Binding> bindings; ///< in the order of the placeholders; parameters in every form
};

/// Why a dialect cannot say a statement.
struct Refusal {
    /// What it is that cannot be said: a name, a kind of join, so large a statement, or an
    /// expression.
    enum class Reason { name, join, size, expression };

    Reason reason;   ///< what cannot be said
    Message message; ///< the same in words
    String join{};   ///< key of the query's join that is refused
};

/// The statement in a dialect, one clause a line. The same statement gives the same text.
ZANDOR_MODEL_EXPORT std::variant<Printed, Refusal> print(const Statement& statement,
                                                         Dialect dialect, ValueForm form);

} // namespace zandor::model::sql
