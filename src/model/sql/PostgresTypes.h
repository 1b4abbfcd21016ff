#pragma once

#include <Zandor/sql/Dialect.h>

namespace zandor::model::sql {

/// What PostgreSQL can compare of the values of a column that is neither a text nor a number nor a
/// date nor true or false, by the type that it was declared with.
struct PostgresComparing {
    enum class Numbers {
        none,
        whole,   ///< and no fractions
        any,     ///< as numbers
        written, ///< as texts that read like them
    };

    bool equal = true;               ///< has operators for what is the same and what is not
    bool ordered = true;             ///< and those for what is less or greater
    Numbers numbers = Numbers::none; ///< that it can be compared with
};

/// A domain that has to be minded is declared as "name AS type", a list of domains as "name[] AS
/// type[]", whatever the domain is made from by way of other domains and lists. A type of somebody
/// else's has all operators, and takes no numbers. Where nothing was declared nobody knows, and
/// numbers are taken for numbers.
PostgresComparing postgresComparing(StringView declared);

} // namespace zandor::model::sql
