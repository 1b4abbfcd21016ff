#pragma once

#include "model/sql_reader/Lexer.h"

namespace zandor::sql_reader {

/// A pattern of a dialect as sql::Like keeps it. `escape` makes the next sign an ordinary one; zero:
/// none does. Throws Refused for what a drawing has no pattern for.
String likePattern(StringView pattern, char16_t escape, Dialect dialect, std::size_t place);

/// Whether it matters for a pattern if capitals are told from small letters.
bool hasCase(StringView pattern);

} // namespace zandor::sql_reader
