#pragma once

#include <Zandor/model/Messages.h>
#include <Zandor/model/export.h>
#include <Zandor/sql/Expression.h>

#include <optional>

/// Values as people type them.
namespace zandor::model::criteria {

/// What a value of a type is called in a message: "a number", "a date (2024-12-31)".
Message nameOf(ColumnType type);
/// That a value of a type is missing.
Message missingOf(ColumnType type);
/// What is said of something typed that is no value of a type, ending with a way to write one.
Message refusalOf(ColumnType type);
ZANDOR_MODEL_EXPORT bool isNumber(ColumnType type);

/// The value that a text is for a column of a type, canonical, or nothing when it is none.
/// Numbers: sign, digits, point, exponent. Dates: year-month-day, checked against the calendar.
/// Times: hour:minute, seconds if need be, with up to nine digits behind a point, which stay as
/// they are typed. Timestamps: a date, with a time behind it (blank or T between) or midnight.
/// Booleans: true, false, yes, no, 1, 0. Bytes: hexadecimal digits, two each, as x'0AFF', 0x0AFF or
/// \x0AFF. A column of an unknown type takes numbers as numbers and all else as text.
ZANDOR_MODEL_EXPORT std::optional<sql::Value> literal(StringView text, ColumnType type);

/// The date, time or timestamp that a text between # signs is, for a column of a type; nothing for
/// a column that holds something else.
ZANDOR_MODEL_EXPORT std::optional<sql::Value> momentLiteral(StringView text, ColumnType type);

/// Whether the engines can compare columns of these types with one meaning.
ZANDOR_MODEL_EXPORT bool comparable(ColumnType left, ColumnType right);

/// A pattern as typed, with * and % for any run, ? and _ for any one character, and a bracketed
/// [*] for the character itself, in the form that sql::Like keeps.
ZANDOR_MODEL_EXPORT String likePattern(StringView typed);

} // namespace zandor::model::criteria
