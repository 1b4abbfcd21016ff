#include <Zandor/sql/Dialect.h>

#include "model/sql/BareNames.h"

#include <algorithm>

namespace zandor::model::sql {

namespace {

bool isHighSurrogate(char16_t c) { return c >= 0xD800 && c < 0xDC00; }
bool isLowSurrogate(char16_t c) { return c >= 0xDC00 && c < 0xE000; }

/// Whether a name has half a surrogate pair in it.
bool isTorn(StringView name) {
    for (std::size_t i = 0; i < name.size(); ++i) {
        if (isLowSurrogate(name[i])) return true;
        if (!isHighSurrogate(name[i])) continue;
        if (++i == name.size() || !isLowSurrogate(name[i])) return true;
    }
    return false;
}

/// A name for a message: its beginning where it is long.
String shortened(StringView name) {
    constexpr std::size_t enough = 40;
    if (name.size() <= enough) return String(name);
    return String(name.substr(0, enough - isHighSurrogate(name[enough - 1]))) + u"…";
}

String doubled(StringView text, char16_t twice) {
    String out;
    out.reserve(text.size());
    for (const char16_t c : text) {
        if (c == twice) out += c;
        out += c;
    }
    return out;
}

String quotedText(StringView text, Dialect dialect) {
    String inner = doubled(text, u'\'');
    // MySQL reads a backslash in a literal as the start of an escape.
    if (dialect == Dialect::MySQL) inner = doubled(inner, u'\\');
    const StringView prefix = dialect == Dialect::SqlServer ? u"N'" : u"'";
    return String(prefix) + inner + u"'";
}

/// A date, time or timestamp: a keyword before the text, a cast of it, or, where the engine keeps
/// them as texts, the text alone.
String moment(StringView text, StringView keyword, StringView serverType, Dialect dialect) {
    String quoted = u"'" + doubled(text, u'\'') + u"'";
    if (dialect == Dialect::SQLite) return quoted;
    if (dialect == Dialect::SqlServer)
        return u"CAST(" + quoted + u" AS " + String(serverType) + u")";
    return String(keyword) + u" " + quoted;
}

/// From hexadecimal digits.
String bytes(const String& digits, Dialect dialect) {
    if (dialect == Dialect::SqlServer) return u"0x" + digits;
    if (dialect == Dialect::PostgreSQL) return u"BYTEA '\\x" + digits + u"'";
    return u"X'" + digits + u"'";
}

/// The engines have one name in all languages.
MessageArgument argumentOf(Dialect dialect) {
    if (dialect == Dialect::Standard) return say<MessageCode::standardSql>();
    return nameOf(dialect);
}

} // namespace

StringView nameOf(Dialect dialect) {
    switch (dialect) {
    case Dialect::SQLite: return u"SQLite";
    case Dialect::PostgreSQL: return u"PostgreSQL";
    case Dialect::MySQL: return u"MySQL/MariaDB";
    case Dialect::SqlServer: return u"SQL Server";
    case Dialect::Standard: break;
    }
    return u"Standard SQL";
}

String identifier(StringView name, Dialect dialect) {
    if (isBare(name, dialect)) return String(name);
    if (dialect == Dialect::MySQL) return u"`" + doubled(name, u'`') + u"`";
    if (dialect == Dialect::SqlServer) return u"[" + doubled(name, u']') + u"]";
    return u"\"" + doubled(name, u'"') + u"\"";
}

std::optional<Message> cannotCarry(StringView name, Dialect dialect) {
    const MessageArgument reader = argumentOf(dialect);
    if (name.empty()) return say<MessageCode::emptyName>(reader);
    if (name.find(u'\0') != StringView::npos) return say<MessageCode::zeroInName>(reader);
    if (isTorn(name)) return say<MessageCode::halfCharacterInName>(reader);
    constexpr std::size_t mostBytes = 63;
    const auto ofMost = [&](std::size_t most) -> std::optional<Message> {
        if (name.size() <= most) return {};
        return say<MessageCode::nameOfTooManyCharacters>(shortened(name), reader, most);
    };
    switch (dialect) {
    case Dialect::PostgreSQL:
        if (platform::toUtf8(name).size() <= mostBytes) return {};
        return say<MessageCode::nameOfTooManyBytes>(shortened(name), reader, mostBytes);
    case Dialect::MySQL:
        if (std::any_of(name.begin(), name.end(), isHighSurrogate))
            return say<MessageCode::rareCharacterInName>(shortened(name), reader);
        if (name.back() == u' ') return say<MessageCode::blankBehindName>(shortened(name), reader);
        return ofMost(64);
    case Dialect::SqlServer:
    case Dialect::Standard: return ofMost(128);
    case Dialect::SQLite: break;
    }
    return {};
}

String literal(const Value& value, Dialect dialect) {
    switch (value.type) {
    case ColumnType::Integer:
    case ColumnType::Decimal: return value.text;
    case ColumnType::Boolean:
        if (dialect == Dialect::SqlServer) return value.text == u"true" ? u"1" : u"0";
        return value.text == u"true" ? u"TRUE" : u"FALSE";
    case ColumnType::Date: return moment(value.text, u"DATE", u"date", dialect);
    case ColumnType::Time: return moment(value.text, u"TIME", u"time", dialect);
    case ColumnType::Timestamp: return moment(value.text, u"TIMESTAMP", u"datetime2", dialect);
    case ColumnType::Blob: return bytes(value.text, dialect);
    case ColumnType::Text:
    case ColumnType::Unknown: break;
    }
    return quotedText(value.text, dialect);
}

String likePattern(StringView pattern, Dialect dialect) {
    if (dialect != Dialect::SqlServer) return String(pattern);
    // SQL Server also reads a bracket as a wildcard.
    String out;
    for (const char16_t c : pattern) {
        if (c == u'[') out += u'\\';
        out += c;
    }
    return out;
}

String placeholder(ColumnType type, Dialect dialect) {
    if (dialect != Dialect::PostgreSQL) return u"?";
    // PostgreSQL gives a bare placeholder the type of what it is compared with, and then refuses
    // a value that type cannot hold: 1.5 for a whole number, 70000 for a small one.
    switch (type) {
    case ColumnType::Integer: return u"CAST(? AS bigint)";
    case ColumnType::Decimal: return u"CAST(? AS numeric)";
    case ColumnType::Boolean: return u"CAST(? AS boolean)";
    case ColumnType::Date: return u"CAST(? AS date)";
    case ColumnType::Time: return u"CAST(? AS time)";
    case ColumnType::Timestamp: return u"CAST(? AS timestamp)";
    case ColumnType::Blob: return u"CAST(? AS bytea)";
    case ColumnType::Text:
    case ColumnType::Unknown: break;
    }
    return u"?";
}

} // namespace zandor::model::sql
