#include "model/sql/Templates.h"

#include <array>

namespace zandor::model::sql {

namespace {

/// In the order of Dialect.
using Forms = std::array<StringView, 5>;

constexpr Forms everywhere(StringView form) { return {form, form, form, form, form}; }

Forms formsOf(Function function, std::size_t arguments) {
    switch (function) {
    case Function::round:
        if (arguments == 1)
            return {u"CAST(ROUND({1}) AS INTEGER)", u"CAST(ROUND(CAST({1} AS numeric)) AS bigint)",
                    u"CAST(ROUND(CAST({1} AS DECIMAL(65, 20))) AS SIGNED)",
                    u"CAST(ROUND({1}, 0) AS bigint)", u""};
        return {u"ROUND({1}, {2:digits})", u"ROUND(CAST({1} AS numeric), {2:digits})",
                u"ROUND(CAST({1} AS DECIMAL(65, 20)), {2:digits})", u"ROUND({1}, {2:digits})", u""};
    case Function::abs: return everywhere(u"ABS({1})");
    case Function::length:
        return {u"LENGTH({1})", u"LENGTH({1})", u"CHAR_LENGTH({1})",
                // LEN takes no notice of blanks at the end.
                u"(LEN({1:tight} + N'.') - 1)", u"CHAR_LENGTH({1})"};
    case Function::upper: return everywhere(u"UPPER({1})");
    case Function::lower: return everywhere(u"LOWER({1})");
    case Function::trim: return everywhere(u"TRIM({1})");
    case Function::left:
        return {u"SUBSTR({1}, 1, {2:0})", u"LEFT({1}, {2:0})", u"LEFT({1}, {2:0})",
                u"LEFT({1}, {2:0})", u"SUBSTRING({1} FROM 1 FOR {2:0})"};
    case Function::right:
        return {u"SUBSTR({1}, MAX(LENGTH({1}) - {2:0}, 0) + 1)", u"RIGHT({1}, {2:0})",
                u"RIGHT({1}, {2:0})", u"RIGHT({1}, {2:0})",
                u"SUBSTRING({1} FROM CHAR_LENGTH({1}) - {2:0} + 1)"};
    case Function::mid:
        if (arguments == 2)
            return {u"SUBSTR({1}, {2:1})", u"SUBSTRING({1} FROM {2:1})", u"SUBSTRING({1}, {2:1})",
                    u"SUBSTRING({1}, {2:1}, 2147483647)", u"SUBSTRING({1} FROM {2:1})"};
        return {u"SUBSTR({1}, {2:1}, {3:0})", u"SUBSTRING({1} FROM {2:1} FOR {3:0})",
                u"SUBSTRING({1}, {2:1}, {3:0})", u"SUBSTRING({1}, {2:1}, {3:0})",
                u"SUBSTRING({1} FROM {2:1} FOR {3:0})"};
    case Function::coalesce: return everywhere(u"COALESCE({*})");
    case Function::year:
        return {u"CAST(strftime('%Y', {1}) AS INTEGER)",
                u"CAST(EXTRACT(YEAR FROM {1:moment}) AS integer)", u"YEAR({1})", u"YEAR({1})",
                u"EXTRACT(YEAR FROM {1})"};
    case Function::month:
        return {u"CAST(strftime('%m', {1}) AS INTEGER)",
                u"CAST(EXTRACT(MONTH FROM {1:moment}) AS integer)", u"MONTH({1})", u"MONTH({1})",
                u"EXTRACT(MONTH FROM {1})"};
    case Function::day:
        return {u"CAST(strftime('%d', {1}) AS INTEGER)",
                u"CAST(EXTRACT(DAY FROM {1:moment}) AS integer)", u"DAY({1})", u"DAY({1})",
                u"EXTRACT(DAY FROM {1})"};
    case Function::dateDiff:
        return {u"CAST(julianday(date({2})) - julianday(date({1})) AS INTEGER)",
                u"(CAST({2} AS date) - CAST({1} AS date))", u"DATEDIFF({2}, {1})",
                u"DATEDIFF(day, {1}, {2})", u""};
    case Function::today:
        return {u"date('now', 'localtime')", u"CURRENT_DATE", u"CURRENT_DATE",
                u"CAST(SYSDATETIME() AS date)", u"CURRENT_DATE"};
    case Function::now:
        return {u"datetime('now', 'localtime')", u"LOCALTIMESTAMP(0)", u"LOCALTIMESTAMP",
                u"CAST(SYSDATETIME() AS datetime2(0))", u"LOCALTIMESTAMP(0)"};
    case Function::text:
        return {u"CAST({1} AS TEXT)", u"CAST({1} AS text)", u"CONCAT({1})",
                u"CAST({1} AS nvarchar(4000))", u"CAST({1} AS VARCHAR(4000))"};
    case Function::number:
        return {u"CAST({1} AS NUMERIC)", u"CAST({1} AS numeric)", u"({1:tight} + 0e0)",
                u"CAST({1} AS float)", u"CAST({1} AS DECIMAL(38, 10))"};
    case Function::date:
        return {u"date({1})", u"CAST({1} AS date)", u"DATE({1})", u"CAST({1} AS date)",
                u"CAST({1} AS DATE)"};
    case Function::moment:
        return {u"datetime({1})", u"CAST({1} AS timestamp)", u"CAST({1} AS DATETIME)",
                u"CAST({1} AS datetime2)", u"CAST({1} AS TIMESTAMP)"};
    case Function::addDays:
        return {u"date({1}, CAST({2} AS TEXT) || ' days')", u"({1:tight} + CAST({2} AS integer))",
                u"DATE_ADD({1}, INTERVAL {2:tight} DAY)", u"DATEADD(day, {2}, {1})",
                u"({1:tight} + {2:tight} * INTERVAL '1' DAY)"};
    case Function::addDaysLater:
        return {u"datetime({1}, CAST({2} AS TEXT) || ' days')",
                u"({1:tight} + CAST({2} AS integer) * INTERVAL '1 day')",
                u"DATE_ADD({1}, INTERVAL {2:tight} DAY)", u"DATEADD(day, {2}, {1})",
                u"({1:tight} + {2:tight} * INTERVAL '1' DAY)"};
    }
    return {};
}

} // namespace

StringView templateOf(Function function, std::size_t arguments, Dialect dialect) {
    return formsOf(function, arguments)[static_cast<std::size_t>(dialect)];
}

StringView nameOf(Function function) {
    switch (function) {
    case Function::round: return u"Round";
    case Function::dateDiff: return u"DateDiff";
    default: return {};
    }
}

} // namespace zandor::model::sql
