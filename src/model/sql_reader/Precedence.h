#pragma once

#include "model/sql_reader/Lexer.h"
#include "model/sql_reader/Tree.h"

namespace zandor::sql_reader {

/// Throws Refused for an operator whose operands SQLite would take apart: it gives || and IS other
/// ranks than the parser, and has LIKE, IN and BETWEEN among the comparisons.
void checkPrecedence(const Tree& tree, const ParserText& text);

} // namespace zandor::sql_reader
