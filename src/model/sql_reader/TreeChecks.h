#pragma once

#include "model/sql_reader/Tree.h"

/// What can be seen of a value's tree without knowing its columns.
namespace zandor::sql_reader {

using platform::String;
using platform::StringView;

/// Whether a type has one of these names, and nothing in parentheses.
bool isNamed(const Tree& type, std::initializer_list<StringView> names);
bool isCastTo(const Tree& tree, std::initializer_list<StringView> types);

String operatorOf(const Tree& tree);
bool isOperation(const Tree& tree, StringView symbol);

/// A constant of a kind of the parser's: "ival", "sval".
bool isConstant(const Tree& tree, const char* kind);
/// The factor by which the printer makes a fraction of a number in MySQL.
bool isScale(const Tree& tree);
bool isNotZero(const Tree& tree);
/// Whether the engine calculates with fractions here, whatever the columns hold.
bool isReal(const Tree& tree);

} // namespace zandor::sql_reader
