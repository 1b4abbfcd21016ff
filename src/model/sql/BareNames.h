#pragma once

#include <Zandor/sql/Dialect.h>

namespace zandor::model::sql {

/// Whether a dialect reads a name as itself without quotes: by its characters, by how it folds
/// capitals, and because it is no word of its own.
bool isBare(StringView name, Dialect dialect);

/// Whether a character is a letter in the names of every engine that takes more than those from A
/// to Z. Of the scripts that are not known here none is.
bool isLetter(char16_t c);

} // namespace zandor::model::sql
