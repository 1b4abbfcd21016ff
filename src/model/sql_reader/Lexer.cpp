#include "model/sql_reader/Lexer.h"

#include "model/sql/Remarks.h"
#include "model/sql/ReservedWords.h"
#include "model/sql_reader/Refused.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <array>

namespace zandor::sql_reader {

using model::foldedName;

namespace {

bool isDigit(char16_t c) { return c >= u'0' && c <= u'9'; }
bool isHex(char16_t c) {
    return isDigit(c) || (c >= u'a' && c <= u'f') || (c >= u'A' && c <= u'F');
}
bool isBlank(char16_t c) {
    return c == u' ' || (c >= u'\t' && c <= u'\r') || c == 0xA0 || c == 0xFEFF;
}
bool startsWord(char16_t c) {
    return (c >= u'a' && c <= u'z') || (c >= u'A' && c <= u'Z') || c == u'_' || c > 0x7F;
}
bool isWordPart(char16_t c) { return startsWord(c) || isDigit(c) || c == u'$' || c == u'#'; }

/// Words of the parser's grammar that it takes for names too; in order.
constexpr std::array syntaxWords = std::to_array<StringView>({
    u"at",        u"between",   u"bigint",   u"bit",     u"boolean",   u"by",
    u"char",      u"character", u"coalesce", u"cube",    u"current",   u"day",
    u"dec",       u"decimal",   u"double",   u"escape",  u"exclude",   u"exists",
    u"extract",   u"filter",    u"first",    u"float",   u"following", u"greatest",
    u"group",     u"grouping",  u"groups",   u"hour",    u"inout",     u"int",
    u"integer",   u"interval",  u"last",     u"least",   u"locked",    u"materialized",
    u"minute",    u"month",     u"national", u"nchar",   u"next",      u"no",
    u"none",      u"nowait",    u"nullif",   u"nulls",   u"numeric",   u"of",
    u"others",    u"out",       u"over",     u"overlay", u"partition", u"position",
    u"preceding", u"precision", u"range",    u"real",    u"recursive", u"rollup",
    u"row",       u"rows",      u"second",   u"sets",    u"share",     u"skip",
    u"smallint",  u"substring", u"ties",     u"time",    u"timestamp", u"treat",
    u"trim",      u"unbounded", u"uescape",  u"update",  u"values",    u"varchar",
    u"varying",   u"with",      u"within",   u"without", u"year",      u"zone",
});

/// Words that begin or end a part of a statement in every dialect; in order.
constexpr std::array clauseWords = std::to_array<StringView>({
    u"asc",       u"both",           u"case",         u"cast",              u"collate",
    u"cross",     u"current_date",   u"current_time", u"current_timestamp", u"desc",
    u"distinct",  u"else",           u"end",          u"except",            u"false",
    u"fetch",     u"for",            u"from",         u"full",              u"group",
    u"having",    u"ilike",          u"inner",        u"intersect",         u"join",
    u"lateral",   u"leading",        u"left",         u"like",              u"limit",
    u"localtime", u"localtimestamp", u"natural",      u"not",               u"null",
    u"offset",    u"on",             u"only",         u"order",             u"outer",
    u"right",     u"select",         u"similar",      u"then",              u"trailing",
    u"true",      u"union",          u"using",        u"when",              u"where",
    u"window",    u"with",
});

bool isClause(const String& folded) {
    return std::binary_search(clauseWords.begin(), clauseWords.end(), folded);
}

bool isSyntax(const String& folded) {
    return std::find(syntaxWords.begin(), syntaxWords.end(), folded) != syntaxWords.end() ||
           model::sql::isReserved(folded, Dialect::PostgreSQL);
}

/// The lines of a comment without what only decorates it.
String withoutMargins(StringView inner) {
    String text;
    while (!inner.empty()) {
        const std::size_t end = std::min(inner.find(u'\n'), inner.size());
        StringView line = inner.substr(0, end);
        inner.remove_prefix(std::min(end + 1, inner.size()));
        const auto isMargin = [](char16_t c) {
            return c == u'*' || model::sql::isBlankInComment(c);
        };
        while (!line.empty() && isMargin(line.front())) line.remove_prefix(1);
        while (!line.empty() && isMargin(line.back())) line.remove_suffix(1);
        if (!text.empty()) text += u'\n';
        for (const char16_t c : line) text += model::sql::isBlankInComment(c) ? u' ' : c;
    }
    while (text.ends_with(u'\n')) text.pop_back();
    return text;
}

class Lexer {
public:
    Lexer(StringView text, Dialect dialect) : mText(text), mDialect(dialect) {}

    ParserText run() {
        while (mAt < mText.size()) token();
        return std::move(mOut);
    }

private:
    char16_t at(std::size_t ahead = 0) const {
        return mAt + ahead < mText.size() ? mText[mAt + ahead] : u'\0';
    }
    bool is(Dialect dialect) const { return mDialect == dialect; }

    /// Writes a token that began at a place of the text.
    void put(StringView token, std::size_t from) {
        mOut.origins.push_back({mOut.text.size(), from});
        mOut.text += platform::toUtf8(token);
    }

    void token() {
        const char16_t c = at();
        if (isBlank(c)) {
            // The parser joins texts on two lines; here the second one is a name.
            const bool names = is(Dialect::SQLite) || is(Dialect::SqlServer);
            mOut.text += c == u'\n' && !names ? '\n' : ' ';
            ++mAt;
            return;
        }
        if (comment()) return;
        const std::size_t begin = mAt;
        const bool national = (c == u'N' || c == u'n') && is(Dialect::SqlServer) && at(1) == u'\'';
        const bool escapes = (c == u'E' || c == u'e') && is(Dialect::PostgreSQL) && at(1) == u'\'';
        const bool bytes = (c == u'X' || c == u'x') && at(1) == u'\'';
        if (national) {
            ++mAt;
            text(u'\'', false);
        } else if (escapes) {
            ++mAt;
            verbatimEscapes(begin);
        } else if (bytes) {
            ++mAt;
            const String digits = delimited(u'\'', false);
            put(u"X'" + digits + u'\'', begin);
        } else if (c == u'\'' || (c == u'"' && is(Dialect::MySQL))) {
            if (namesText())
                name(delimited(c, is(Dialect::MySQL)), begin);
            else
                text(c, is(Dialect::MySQL));
        } else if (c == u'"' || (c == u'`' && !is(Dialect::PostgreSQL))) {
            name(delimited(c, false), begin);
        } else if (c == u'[' && (is(Dialect::SqlServer) || is(Dialect::SQLite))) {
            name(delimited(u']', false), begin);
        } else if (c == u'$' && is(Dialect::PostgreSQL) && dollarQuoted()) {
        } else if (parameter()) {
        } else if (isDigit(c) || (c == u'.' && isDigit(at(1)))) {
            number();
        } else if (startsWord(c)) {
            word();
        } else {
            symbol();
        }
        if (mAt > begin) mLast = {begin, mAt};
    }

    bool comment() {
        if (at() == u'-' && at(1) == u'-' && !areSigns()) return lineComment(2);
        if (at() == u'#' && is(Dialect::MySQL)) return lineComment(1);
        if (at() != u'/' || at(1) != u'*') return false;
        const std::size_t begin = mAt;
        const bool runs = at(2) == u'!' || (at(2) == u'M' && at(3) == u'!');
        if (is(Dialect::MySQL) && runs) refusePart<MessageCode::aCommentThatRuns>(begin);
        const bool nests = is(Dialect::PostgreSQL) || is(Dialect::SqlServer);
        int depth = 0;
        do {
            if (at() == u'/' && at(1) == u'*' && (depth == 0 || nests)) {
                ++depth;
                mAt += 2;
            } else if (at() == u'*' && at(1) == u'/') {
                --depth;
                mAt += 2;
            } else if (mAt >= mText.size()) {
                refuse<MessageCode::notClosed>(begin, u"*/");
            } else {
                ++mAt;
            }
        } while (depth > 0);
        keep(begin, mText.substr(begin + 2, mAt - begin - 4), false);
        return true;
    }

    /// Two signs are no comment in MySQL without a blank behind them.
    bool areSigns() const { return is(Dialect::MySQL) && mAt + 2 < mText.size() && at(2) > u' '; }

    bool lineComment(std::size_t mark) {
        const std::size_t begin = mAt;
        const auto ends = [&](char16_t c) {
            return c == u'\n' || (c == u'\r' && is(Dialect::PostgreSQL));
        };
        while (mAt < mText.size() && !ends(at())) ++mAt;
        keep(begin, mText.substr(begin + mark, mAt - begin - mark), true);
        return true;
    }

    /// An empty line parts others.
    void keep(std::size_t begin, StringView inner, bool line) {
        const std::size_t before = begin == 0 ? StringView::npos : mText.rfind(u'\n', begin - 1);
        const bool beside = mLast.second > (before == StringView::npos ? 0 : before + 1);
        const String text = withoutMargins(inner);
        if (!text.empty() || (line && !beside))
            mOut.comments.push_back({mOut.text.size(), beside, text});
        mOut.text += ' ';
    }

    /// What stands between quotes, doubled ones halved.
    String delimited(char16_t close, bool backslashes) {
        const std::size_t begin = mAt++;
        String inner;
        while (true) {
            if (mAt >= mText.size()) refuse<MessageCode::notClosed>(begin, StringView(&close, 1));
            const char16_t c = mText[mAt++];
            if (c == close) {
                if (at() != close) return inner;
                ++mAt;
            } else if (c == u'\\' && backslashes && mAt < mText.size()) {
                inner += escaped(mText[mAt++]);
                continue;
            }
            inner += c;
        }
    }

    /// As MySQL reads a letter behind a backslash; in a pattern % and _ keep theirs.
    static String escaped(char16_t c) {
        switch (c) {
        case u'n': return u"\n";
        case u't': return u"\t";
        case u'r': return u"\r";
        case u'b': return u"\b";
        case u'0': return String(1, u'\0');
        case u'Z': return String(1, u'\x1A');
        case u'%': return u"\\%";
        case u'_': return u"\\_";
        default: return String(1, c);
        }
    }

    void text(char16_t quote, bool backslashes) {
        const std::size_t begin = mAt;
        const String inner = delimited(quote, backslashes);
        String out = u"'";
        for (const char16_t c : inner) {
            if (c == 0) refuse<MessageCode::notUnderstood>(begin, u"U+0000");
            out += c;
            if (c == u'\'') out += c;
        }
        put(out + u'\'', begin);
    }

    /// Whether a text stands where only a name can.
    bool namesText() const {
        return !is(Dialect::PostgreSQL) && model::sameName(lastToken(), u"as") && !inCast();
    }

    /// PostgreSQL's own, for its own parser.
    void verbatimEscapes(std::size_t begin) {
        ++mAt;
        while (mAt < mText.size() && (at() != u'\'' || at(1) == u'\'')) {
            const bool two = at() == u'\\' || at() == u'\'';
            mAt += two ? 2 : 1;
        }
        if (mAt >= mText.size()) refuse<MessageCode::notClosed>(begin, u"'");
        ++mAt;
        put(mText.substr(begin, mAt - begin), begin);
    }

    bool dollarQuoted() {
        std::size_t end = mAt + 1;
        while (end < mText.size() && isWordPart(mText[end]) && mText[end] != u'$') ++end;
        if (end >= mText.size() || mText[end] != u'$' || isDigit(at(1))) return false;
        const StringView mark = mText.substr(mAt, end + 1 - mAt);
        const std::size_t close = mText.find(mark, end + 1);
        if (close == StringView::npos) refuse<MessageCode::notClosed>(mAt, mark);
        put(mText.substr(mAt, close + mark.size() - mAt), mAt);
        mAt = close + mark.size();
        return true;
    }

    void name(const String& inner, std::size_t begin) {
        constexpr std::size_t mostBytes = 63; // what is longer the parser cuts
        if (platform::toUtf8(inner).size() > mostBytes) refuse<MessageCode::nameTooLong>(begin);
        String out = u"\"";
        for (const char16_t c : inner) {
            out += c;
            if (c == u'"') out += c;
        }
        put(out + u'"', begin);
    }

    bool parameter() {
        const std::size_t begin = mAt;
        const char16_t c = at();
        if (c == u':' && (at(1) == u'"' || at(1) == u'\'')) {
            ++mAt;
            ask(delimited(at(), false), begin);
            return true;
        }
        const bool marks = c == u':' || c == u'@' || c == u'$';
        if (marks && (startsWord(at(1)) || isDigit(at(1)))) {
            // A type behind two colons is a cast.
            if (c == u':' && begin > 0 && mText[begin - 1] == u':') return false;
            ++mAt;
            ask(String(wordAhead()), begin);
            return true;
        }
        if (c != u'?' || at(1) == u'|' || at(1) == u'&') return false;
        ++mAt;
        const std::size_t digits = mAt;
        while (isDigit(at())) ++mAt;
        const StringView number = mText.substr(digits, mAt - digits);
        ask(number.empty() ? platform::decimal(static_cast<std::int64_t>(++mQuestions))
                           : String(number),
            begin);
        return true;
    }

    void ask(String name, std::size_t begin) {
        if (name.empty()) refuse<MessageCode::notUnderstood>(begin, u":");
        auto& known = mOut.parameters;
        auto place = std::find(known.begin(), known.end(), name);
        if (place == known.end()) place = known.insert(known.end(), std::move(name));
        put(u"$" + platform::decimal(static_cast<std::int64_t>(place - known.begin() + 1)), begin);
    }

    StringView wordAhead() {
        const std::size_t begin = mAt;
        while (mAt < mText.size() && isWordPart(at())) ++mAt;
        return mText.substr(begin, mAt - begin);
    }

    void number() {
        const std::size_t begin = mAt;
        const bool bytes = at() == u'0' && (at(1) == u'x' || at(1) == u'X') &&
                           (is(Dialect::SqlServer) || is(Dialect::MySQL));
        if (bytes) {
            mAt += 2;
            const std::size_t digits = mAt;
            while (isHex(at())) ++mAt;
            put(u"X'" + String(mText.substr(digits, mAt - digits)) + u'\'', begin);
            return;
        }
        while (isDigit(at()) || at() == u'.') ++mAt;
        const std::size_t sign = at(1) == u'+' || at(1) == u'-' ? 2 : 1;
        if ((at() == u'e' || at() == u'E') && isDigit(at(sign))) {
            mAt += sign;
            while (isDigit(at())) ++mAt;
        }
        // The parser would take letters that follow at once for a name.
        if (!wordAhead().empty())
            refuse<MessageCode::notParsed>(begin, mText.substr(begin, mAt - begin));
        put(mText.substr(begin, mAt - begin), begin);
    }

    void word() {
        const std::size_t begin = mAt;
        const StringView typed = wordAhead();
        const String folded = foldedName(typed);
        if (folded == u"top" && is(Dialect::SqlServer) && top(begin)) return;
        if (folded == u"limit" && limit(begin)) return;
        if (is(Dialect::MySQL) && folded == u"interval") {
            mIntervals.push_back(mDepth);
            return;
        }
        if (endsInterval(folded)) {
            mIntervals.pop_back();
            put(u", '" + folded + u'\'', begin);
            return;
        }
        mCasts = folded == u"cast" || folded == u"try_cast";
        const StringView last = lastToken();
        const bool qualified = last == u"." || behindBlanks(mAt) == u'.';
        const bool called = behindBlanks(mAt) == u'(';
        const bool behindAs = model::sameName(last, u"as") && !inCast();
        if (is(Dialect::PostgreSQL) ||
            (!qualified && !behindAs && isSyntax(folded) && !isNameHere(folded, called))) {
            if (folded == u"true" || folded == u"false") ++mOut.truths;
            put(typed, begin);
            return;
        }
        name(String(typed), begin);
    }

    /// Whether the parser would take a word for its own that the dialect takes for a name.
    bool isNameHere(const String& folded, bool called) const {
        return !called && !isClause(folded) &&
               model::sql::isReserved(folded, Dialect::PostgreSQL) &&
               !model::sql::isReserved(folded, mDialect);
    }

    bool inCast() const { return !mParentheses.empty() && mParentheses.back().ofCast; }
    StringView lastToken() const { return mText.substr(mLast.first, mLast.second - mLast.first); }

    std::size_t skipBlanks(std::size_t from) const {
        while (from < mText.size() && isBlank(mText[from])) ++from;
        return from;
    }
    char16_t behindBlanks(std::size_t from) const {
        from = skipBlanks(from);
        return from < mText.size() ? mText[from] : u'\0';
    }
    StringView wordAt(std::size_t from) const {
        std::size_t end = from;
        while (end < mText.size() && isWordPart(mText[end])) ++end;
        return mText.substr(from, end - from);
    }

    /// TOP 5 or TOP (5), which becomes the first of what is selected.
    bool top(std::size_t begin) {
        const StringView before = lastToken();
        const bool behind = model::sameName(before, u"select") ||
                            model::sameName(before, u"distinct") || model::sameName(before, u"all");
        std::size_t from = skipBlanks(mAt);
        const bool within = from < mText.size() && mText[from] == u'(';
        if (within) from = skipBlanks(from + 1);
        const StringView digits = wordAt(from);
        if (!behind || digits.empty() || !std::all_of(digits.begin(), digits.end(), isDigit))
            return false;
        std::size_t end = from + digits.size();
        if (within) {
            end = skipBlanks(end);
            if (end >= mText.size() || mText[end] != u')') return false;
            ++end;
        }
        const StringView next = wordAt(skipBlanks(end));
        if (model::sameName(next, u"percent") || model::sameName(next, u"with"))
            refuse<MessageCode::noPlaceFor>(begin, model::say<MessageCode::ties>());
        put(u"\"" + String(topFunction) + u"\"(" + String(digits) + u"),", begin);
        mAt = end;
        return true;
    }

    /// LIMIT rows left out, rows.
    bool limit(std::size_t begin) {
        if (!is(Dialect::SQLite) && !is(Dialect::MySQL)) return false;
        const std::size_t from = skipBlanks(mAt);
        const StringView first = wordAt(from);
        const std::size_t comma = skipBlanks(from + first.size());
        if (first.empty() || comma >= mText.size() || mText[comma] != u',') return false;
        const std::size_t second = skipBlanks(comma + 1);
        const StringView rows = wordAt(second);
        if (rows.empty()) return false;
        put(u"LIMIT " + String(rows) + u" OFFSET " + String(first), begin);
        mAt = second + rows.size();
        return true;
    }

    /// INTERVAL n DAY of MySQL, which becomes two arguments.
    bool endsInterval(const String& folded) const {
        constexpr std::array units = std::to_array<StringView>(
            {u"day", u"week", u"month", u"quarter", u"year", u"hour", u"minute", u"second"});
        return !mIntervals.empty() && mIntervals.back() == mDepth &&
               std::find(units.begin(), units.end(), folded) != units.end() &&
               behindBlanks(mAt) == u')';
    }

    void symbol() {
        const std::size_t begin = mAt;
        if (at() == u'=' && at(1) == u'=' && is(Dialect::SQLite)) {
            mAt += 2;
            put(u"=", begin);
            return;
        }
        if (at() == u'(') {
            mParentheses.push_back({mCasts, mOut.parentheses.size()});
            mOut.parentheses.push_back({mOut.text.size(), std::string::npos});
            ++mDepth;
        }
        if (at() == u')' && !mParentheses.empty()) {
            mOut.parentheses[mParentheses.back().number].end = mOut.text.size();
            mParentheses.pop_back();
            --mDepth;
        }
        partSigns();
        mCasts = false;
        const bool pair = at() >= 0xD800 && at() < 0xDC00;
        mAt += pair ? 2 : 1;
        mAt = std::min(mAt, mText.size());
        put(mText.substr(begin, mAt - begin), begin);
    }

    /// The parser would take two signs for a comment, and others together for one operator.
    void partSigns() {
        if (mOut.text.empty()) return;
        const bool isSign = at() == u'-' || at() == u'+' || at() == u'~';
        const bool joins =
            StringView(u"+-*/%<>=!&|^~#@").find(static_cast<char16_t>(mOut.text.back())) !=
            StringView::npos;
        if (isSign && joins && !is(Dialect::PostgreSQL)) mOut.text += ' ';
    }

    const StringView mText;
    const Dialect mDialect;
    std::size_t mAt = 0;
    std::pair<std::size_t, std::size_t> mLast; ///< the token before
    int mDepth = 0;
    std::int64_t mQuestions = 0;
    bool mCasts = false; ///< the word before was CAST
    struct Open {
        bool ofCast;
        std::size_t number; ///< among all
    };
    std::vector<Open> mParentheses; ///< those open
    std::vector<int> mIntervals;    ///< depths of those open
    ParserText mOut;
};

} // namespace

std::size_t ParserText::origin(std::size_t byte) const {
    const auto behind =
        std::upper_bound(origins.begin(), origins.end(), byte,
                         [](std::size_t sought, const Origin& each) { return sought < each.byte; });
    return behind == origins.begin() ? 0 : std::prev(behind)->unit;
}

ParserText lexed(StringView text, Dialect dialect) { return Lexer(text, dialect).run(); }

} // namespace zandor::sql_reader
