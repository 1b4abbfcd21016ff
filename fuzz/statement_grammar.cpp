#include "statement_grammar.h"

#include <array>
#include <cstddef>
#include <initializer_list>
#include <string_view>
#include <utility>
#include <vector>

namespace {

enum class Kind { number, text, date, moment, truth };

struct Column {
    std::string name;
    Kind kind;
};

struct Source {
    std::string name;
    std::vector<Column> columns;
};

const std::array<Source, 3>& tables() {
    static const std::array<Source, 3> all = {{
        {"customers",
         {{"id", Kind::number},
          {"name", Kind::text},
          {"city", Kind::text},
          {"credit", Kind::number},
          {"active", Kind::truth},
          {"since", Kind::date}}},
        {"orders",
         {{"id", Kind::number},
          {"customer_id", Kind::number},
          {"placed", Kind::moment},
          {"total", Kind::number}}},
        {"lines",
         {{"order_id", Kind::number},
          {"number", Kind::number},
          {"quantity", Kind::number},
          {"price", Kind::number}}},
    }};
    return all;
}

class Grammar {
public:
    explicit Grammar(std::minstd_rand& random) : mRandom(random) {}

    std::string statement() {
        std::string text;
        if (oneIn(8)) {
            Source made = saved("x");
            text = "WITH " + made.name + " AS (" + mSaved + ") ";
            mNamed.push_back(std::move(made));
        }
        text += select(2);
        return text;
    }

private:
    std::size_t below(std::size_t limit) { return mRandom() % limit; }
    bool oneIn(std::size_t count) { return below(count) == 0; }
    /// For what most drawings have no place for.
    bool rarely() { return oneIn(40); }
    /// Tells sources of one query apart; but for some.
    std::string alias() { return std::to_string(rarely() ? 0 : mSources.size()); }
    std::string one(std::initializer_list<const char*> of) { return of.begin()[below(of.size())]; }
    std::string one(std::initializer_list<const char*> often,
                    std::initializer_list<const char*> rare) {
        return one(rarely() ? rare : often);
    }

    /// What stands after FROM; its columns can be named from then on.
    std::string from(std::size_t depth) {
        std::string text = source(depth);
        const std::size_t more = below(3);
        for (std::size_t n = 0; n < more; ++n) {
            const bool comma = oneIn(6);
            const std::string how = one({"JOIN", "JOIN", "JOIN", "LEFT JOIN", "LEFT OUTER JOIN",
                                         "INNER JOIN", "RIGHT JOIN", "FULL JOIN", "CROSS JOIN"},
                                        {"NATURAL JOIN", "NATURAL LEFT JOIN"});
            const bool parentheses = oneIn(20);
            const std::size_t before = mSources.size();
            std::string right = source(depth);
            if (parentheses && oneIn(2))
                right += " JOIN " + source(depth) + " ON " + connection(before);
            if (parentheses) right = '(' + right + ')';
            text += comma ? ", " + right : ' ' + how + ' ' + right;
            if (comma || how.find("NATURAL") == 0) continue;
            if (how != "CROSS JOIN" || rarely())
                text += oneIn(12) ? " USING (" + anyColumn().name + ')' : " ON " + connection(0);
        }
        return text;
    }

    std::string source(std::size_t depth) {
        if (depth > 0 && oneIn(10)) {
            Source made = saved("s" + alias());
            const std::string text = '(' + mSaved + ") " + (oneIn(2) ? "AS " : "") + made.name;
            mSources.push_back(std::move(made));
            return text;
        }
        Source taken = !mNamed.empty() && oneIn(2) ? mNamed.back() : tables()[below(3)];
        std::string text = taken.name;
        if (!oneIn(4)) {
            taken.name = taken.name.substr(0, 1) + alias();
            text += (oneIn(2) ? " AS " : " ") + taken.name;
        }
        mSources.push_back(std::move(taken));
        return text;
    }

    /// A query within another; its text is kept beside it.
    Source saved(std::string name) {
        Grammar inner(mRandom);
        mSaved = inner.select(1);
        Source made{std::move(name), {}};
        for (const Column& column : inner.mItems)
            if (!column.name.empty() || rarely()) made.columns.push_back(column);
        if (made.columns.empty()) made.columns.push_back({"id", Kind::number});
        return made;
    }

    std::string connection(std::size_t first) {
        if (oneIn(20)) return condition(2);
        const std::size_t last = mSources.size() - 1;
        const Source& left = mSources[first + below(mSources.size() - first)];
        std::string text = columnOf(left, Kind::number) +
                           one({" = ", " = ", " = ", " == ", " < "}) +
                           columnOf(mSources[last], Kind::number);
        if (oneIn(10)) text += one({" AND ", " AND ", " OR "}) + condition(1);
        return text;
    }

    std::string columnOf(const Source& source, Kind kind) {
        for (std::size_t n = 0; n < 8; ++n) {
            const Column& column = source.columns[below(source.columns.size())];
            if (column.kind == kind || n == 7) return source.name + '.' + column.name;
        }
        return {};
    }

    const Column& anyColumn() {
        const auto& columns = mSources[below(mSources.size())].columns;
        return columns[below(columns.size())];
    }

    std::string column(Kind kind) {
        if (!mItems.empty() && rarely() && !mItems.back().name.empty()) return mItems.back().name;
        for (std::size_t n = 0; n < 12; ++n) {
            const Source& source = mSources[below(mSources.size())];
            const Column& found = source.columns[below(source.columns.size())];
            if (found.kind == kind)
                return (mSources.size() == 1 || rarely() ? "" : source.name + '.') + found.name;
        }
        return literal(kind);
    }

    std::string literal(Kind kind) {
        if (rarely()) return "NULL";
        switch (kind) {
        case Kind::number:
            return one(
                {"0", "1", "2", "3", "5", "7", "2.5", "-1", "10.5"},
                {".5", "1e3", "0x2", "+1", "00", "1.0", "9223372036854775807", "-0.0", "1e400"});
        case Kind::text:
            return one({"'Wien'", "'wien'", "'Ada'", "''", "'a_b%'", "'O''Brien'", "'1'", "'%'",
                        "'A%'", "'_'", "'10.5'", "' x '", "'*a*'"});
        case Kind::date:
            return one({"'2020-01-01'", "'2021-05-06'", "'2022-12-31'"},
                       {"date('2022-12-31')", "'2020-1-1'", "'2020'", "'2020-01-01 00:00:00'",
                        "CURRENT_DATE", "DATE '2020-01-01'"});
        case Kind::moment:
            return one({"'2023-01-01 10:00:00'", "'2023-02-03 00:00:00'", "'2020-02-29 12:00:00'"},
                       {"'2023-02-03'", "'2023-02-03T00:00:00'", "datetime('2023-02-03')",
                        "'2023-02-03 00:00'", "CURRENT_TIMESTAMP", "'2020-02-29 12:00:00.000'"});
        case Kind::truth: return one({"TRUE", "FALSE", "1", "0", "true"}, {"2", "'1'"});
        }
        return {};
    }

    Kind anyKind() { return static_cast<Kind>(below(5)); }

    std::string value(Kind kind, std::size_t depth) {
        if (oneIn(40)) kind = anyKind();
        if (depth == 0 || !oneIn(3)) return oneIn(6) ? literal(kind) : column(kind);
        const std::size_t less = depth - 1;
        switch (below(14)) {
        case 0: return '(' + value(kind, less) + ')';
        case 1:
            return "CASE WHEN " + condition(less) + " THEN " + value(kind, less) +
                   (oneIn(4) ? "" : " ELSE " + value(kind, less)) + " END";
        case 2: {
            const Kind compared = anyKind();
            return "CASE " + value(compared, less) + " WHEN " + value(compared, less) + " THEN " +
                   value(kind, less) + (oneIn(2) ? "" : " ELSE " + value(kind, less)) + " END";
        }
        case 3:
            return one({"coalesce(", "ifnull(", "COALESCE("}, {"nullif(", "min(", "max("}) +
                   value(kind, less) + ", " + value(kind, less) + ')';
        case 4:
            return one({"iif(", "IIF("}) + condition(less) + ", " + value(kind, less) + ", " +
                   value(kind, less) + ')';
        default: break;
        }
        switch (kind) {
        case Kind::number: return number(less);
        case Kind::text: return text(less);
        case Kind::date:
            if (!rarely()) return column(kind);
            return one({"date(", "DATE("}) + value(oneIn(2) ? Kind::moment : Kind::date, less) +
                   (oneIn(2) ? ")"
                             : one({", '+1 day')", ", '-2 month')", ", 'start of month')",
                                    ", '1 years')", ", 'localtime')"}));
        case Kind::moment:
            if (!rarely()) return column(kind);
            return "datetime(" + value(Kind::moment, less) +
                   (oneIn(2) ? ")" : one({", '+1 hour')", ", '-2 days')", ", '+90 minutes')"}));
        case Kind::truth: return oneIn(2) ? '(' + condition(less) + ')' : condition(less);
        }
        return {};
    }

    std::string number(std::size_t less) {
        switch (below(9)) {
        case 0: return one({"-", "- "}, {"+", "~", "NOT "}).append(column(Kind::number));
        case 1:
            return one({"abs(", "round("}, {"length(", "sign(", "unicode("}) +
                   value(rarely() ? Kind::text : Kind::number, less) + ')';
        case 2: return "length(" + value(Kind::text, less) + ')';
        case 3:
            return "round(" + value(Kind::number, less) +
                   one({", 1)", ", 0)"}, {", -1)", ", 2.5)"});
        case 4:
            if (!oneIn(4)) return column(Kind::number);
            return "CAST(" + value(rarely() ? anyKind() : Kind::text, less) +
                   one({" AS INTEGER)", " AS REAL)"}, {" AS NUMERIC)", " AS DECIMAL(10, 2))",
                                                       " AS INT)", " AS float)", " AS BOOLEAN)"});
        case 5:
            return (rarely() ? one({"strftime('%Y', ", "julianday(", "unixepoch("})
                             : one({"CAST(strftime('%Y', ", "CAST(strftime('%m', ",
                                    "CAST(strftime('%d', "})) +
                   value(oneIn(2) ? Kind::date : Kind::moment, less) +
                   (rarely() ? ")" : ") AS INTEGER)");
        case 6: return "instr(" + value(Kind::text, less) + ", " + value(Kind::text, less) + ')';
        default:
            return value(Kind::number, less) +
                   one({" + ", " - ", " * ", "+", "-", "*"},
                       {" / ", " % ", " || ", " & ", " | ", " << ", "/"}) +
                   value(Kind::number, less);
        }
    }

    std::string text(std::size_t less) {
        switch (below(6)) {
        case 0:
            return one({"upper(", "lower(", "trim("},
                       {"ltrim(", "rtrim(", "hex(", "quote(", "typeof("}) +
                   value(Kind::text, less) + ')';
        case 1:
            return one({"substr(", "substring(", "SUBSTR("}) + value(Kind::text, less) + ", " +
                   one({"1", "2", "3"}, {"0", "-1"}) +
                   (oneIn(3) ? ")" : one({", 1)", ", 2)", ", 20)"}, {", 0)", ", -1)"}));
        case 2:
            return "replace(" + value(Kind::text, less) + ", " + literal(Kind::text) + ", " +
                   literal(Kind::text) + ')';
        case 3:
            return "CAST(" + value(rarely() ? anyKind() : Kind::number, less) +
                   one({" AS TEXT)"}, {" AS VARCHAR(3))", " AS CHAR)"});
        case 4:
            if (!rarely()) return column(Kind::text);
            return one({"printf('%d', ", "char(", "concat(", "strftime('%Y-%m', "}) +
                   value(Kind::number, less) + ')';
        default:
            return value(rarely() ? anyKind() : Kind::text, less) + " || " +
                   value(rarely() ? anyKind() : Kind::text, less);
        }
    }

    std::string condition(std::size_t depth) {
        if (depth > 0 && oneIn(2)) {
            const std::size_t less = depth - 1;
            switch (below(7)) {
            case 0: return "NOT " + condition(less);
            case 1: return "NOT (" + condition(less) + ')';
            case 2:
                return '(' + condition(less) + ')' +
                       one({" AND ", " OR ", " and "}, {" = ", " <> ", " IS "}) + '(' +
                       condition(less) + ')';
            case 3:
                if (!rarely()) return condition(less);
                return '(' + condition(less) + ')' +
                       one({" IS TRUE", " IS NOT TRUE", " IS FALSE", " IS NULL", " = 1",
                            " IS NOT FALSE"});
            default:
                return condition(less) + one({" AND ", " OR ", " OR ", " and "}) + condition(less);
            }
        }
        const Kind kind = anyKind();
        const std::size_t less = depth > 0 ? depth - 1 : 0;
        switch (below(12)) {
        case 0:
            return value(kind, less) +
                   one({" IS NULL", " IS NOT NULL"}, {" ISNULL", " NOTNULL", " NOT NULL"});
        case 1:
            return value(kind, less) + one({" BETWEEN ", " NOT BETWEEN "}) + value(kind, less) +
                   " AND " + value(kind, less);
        case 2: {
            std::string text = value(kind, less) + one({" IN (", " NOT IN (", " in ("});
            for (std::size_t n = below(3); n > 0; --n) text += literal(kind) + ", ";
            return text + (rarely() ? value(kind, less) : literal(kind)) + ')';
        }
        case 3:
            return value(rarely() ? kind : Kind::text, less) +
                   one({" LIKE ", " NOT LIKE "}, {" GLOB ", " REGEXP "}) +
                   one({"'W%'", "'%e%'", "'_da'", "'wien'", "'%n'", "'1%'", "'*a*'"},
                       {"'%\\%' ESCAPE '\\'", "'a!_b%' ESCAPE '!'", "'%'", "''", "NULL", "'%1_'"});
        case 4:
            if (!rarely()) return column(Kind::truth);
            return value(kind, less) +
                   one({" IS ", " IS NOT ", " IS DISTINCT FROM ", " IS NOT DISTINCT FROM "}) +
                   value(kind, less);
        case 5: return column(Kind::truth);
        default:
            return value(kind, less) +
                   one({" = ", " = ", " == ", " <> ", " != ", " < ", " > ", " <= ", " >= "}) +
                   (oneIn(3) ? value(kind, less) : literal(kind));
        }
    }

    std::string total() {
        const std::string name =
            one({"count", "sum", "min", "max", "avg", "COUNT"}, {"total", "group_concat"});
        if (oneIn(3)) return "count(*)";
        const Kind kind = rarely() || name == "count" ? anyKind() : Kind::number;
        return name + '(' + (oneIn(8) ? "DISTINCT " : "") + value(kind, oneIn(3) ? 1 : 0) + ')' +
               (rarely() ? " FILTER (WHERE " + condition(1) + ')' : "");
    }

    std::string item(bool totals) {
        const Kind kind = anyKind();
        Column made{{}, kind};
        std::string text = totals && oneIn(2) ? total() : oneIn(2) ? column(kind) : value(kind, 2);
        if (oneIn(3)) {
            made.name = one({"a", "b", "id", "name", "total", "n", "[n x]", "\"q\"", "city"});
            text += (oneIn(4) ? " " : " AS ") + made.name;
        } else if (text.find_first_of("( '+-") == std::string::npos) {
            made.name = text.substr(text.find('.') + 1);
        }
        mMade.push_back(std::move(made));
        return text;
    }

    std::string select(std::size_t depth) {
        const std::string tail = " FROM " + from(depth);
        const bool totals = oneIn(4);
        std::string text = oneIn(10) ? "SELECT DISTINCT " : oneIn(20) ? "SELECT ALL " : "SELECT ";
        if (oneIn(12)) {
            text += oneIn(2) ? "*" : mSources.front().name + ".*";
        } else {
            text += item(totals);
            for (std::size_t n = below(4); n > 0; --n) text += ", " + item(totals);
        }
        mItems = mMade;
        text += tail;
        if (!oneIn(3)) text += " WHERE " + condition(3);
        if (totals ? !oneIn(3) : oneIn(12)) {
            text += " GROUP BY " + place();
            while (oneIn(3)) text += ", " + place();
        }
        if (totals && oneIn(2)) text += " HAVING " + asked();
        if (oneIn(3)) {
            text += " ORDER BY " + (totals && oneIn(3) ? total() : place()) +
                    one({"", " DESC", " ASC"});
            while (oneIn(3)) text += ", " + place() + one({"", " DESC"});
        }
        if (oneIn(15)) text += " LIMIT " + one({"3", "0", "-1", "2, 1", "100", "1 OFFSET 0"});
        return text;
    }

    std::string asked() {
        const std::string first =
            total() + one({" > ", " = ", " <> ", " >= "}) + literal(Kind::number);
        if (oneIn(2)) return first;
        return first + one({" AND ", " OR "}) +
               (oneIn(2) ? condition(1) : total() + " IS NOT NULL");
    }

    /// What is grouped or sorted by: a number, a name, a value.
    std::string place() {
        if (oneIn(5)) return one({"1", "2", "1"});
        if (oneIn(4) && !mItems.empty() && !mItems.front().name.empty()) return mItems.front().name;
        return oneIn(4) ? value(anyKind(), 1) : column(anyKind());
    }

    std::minstd_rand& mRandom;
    std::vector<Source> mSources;
    std::vector<Source> mNamed;
    std::vector<Column> mItems;
    std::vector<Column> mMade;
    std::string mSaved;
};

} // namespace

std::string randomStatement(std::minstd_rand& random) { return Grammar(random).statement(); }
