#include "model/sql_reader/LikePattern.h"

#include "model/sql_reader/Refused.h"

#include <algorithm>

namespace zandor::sql_reader {

String likePattern(StringView pattern, char16_t escape, Dialect dialect, std::size_t place) {
    String out;
    for (std::size_t i = 0; i < pattern.size(); ++i) {
        char16_t c = pattern[i];
        const bool escapes = escape != 0 && c == escape;
        const bool itself = escapes && i + 1 < pattern.size();
        // At the end it is an ordinary sign in MySQL, and elsewhere finds nothing or is an error.
        if (escapes && !itself && dialect != Dialect::MySQL)
            refuse<MessageCode::unknownOperator>(place, u"LIKE");
        if (itself) c = pattern[++i];
        // One of several signs, in SQL Server.
        if (!itself && c == u'[' && dialect == Dialect::SqlServer)
            refuse<MessageCode::unknownOperator>(place, u"LIKE [");
        const bool wild = c == u'%' || c == u'_';
        if (c == u'\\' || (itself && wild)) out += u'\\';
        out += c;
    }
    return out;
}

bool hasCase(StringView pattern) {
    return std::any_of(pattern.begin(), pattern.end(), [](char16_t c) {
        return (c >= u'a' && c <= u'z') || (c >= u'A' && c <= u'Z') || c > 0x7F;
    });
}

} // namespace zandor::sql_reader
