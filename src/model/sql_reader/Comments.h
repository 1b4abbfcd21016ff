#pragma once

#include "model/sql_reader/Lexer.h"

#include <Zandor/sql/Statement.h>

#include <map>

namespace zandor::sql_reader {

/// What comments of a select can stand by, by the byte at which it begins.
using Commented = std::map<std::size_t, decltype(model::sql::Remark::by)>;

/// The comments of the select around a byte, by what they stand by: those on a line behind it, those
/// on lines of their own before it.
std::vector<model::sql::Remark> commentsAround(std::size_t byte, const ParserText& text,
                                               const Commented& commented);

} // namespace zandor::sql_reader
