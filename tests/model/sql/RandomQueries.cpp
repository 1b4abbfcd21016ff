#include "RandomQueries.h"

#include <Zandor/Library.h>

#include <algorithm>
#include <stdexcept>

using namespace zandor;

using model::ColumnType;
using platform::String;

namespace {

constexpr const char16_t* comparisons[] = {u"", u"= ", u"<> ", u"< ", u"> ", u"<= ", u">= "};

const std::vector<String> words = {
    u"Wien",    u"Graz", u"a",  u"M", u"'open'", u"\"paid\"", u"O'Brien & Sons",
    u"'it''s'", u"N",    u"''", u"Ö", u"'50'",   u"'\\'",     u"100 % sure",
    u":-|",     u"x?y",  u"--", u"?", u"/**/",   u"A\\B"};

const std::vector<String> pieces = {u"'",
                                    u"''",
                                    u"\"",
                                    u"`",
                                    u"[",
                                    u"]",
                                    u"(",
                                    u")",
                                    u";",
                                    u"--",
                                    u"/*",
                                    u"*/",
                                    u"\\",
                                    u"\\'",
                                    u"%",
                                    u"_",
                                    u"?",
                                    u":x",
                                    u"$1",
                                    u"$$",
                                    u"@a",
                                    u"#",
                                    u",",
                                    u"=",
                                    u"<",
                                    u">",
                                    u"!",
                                    u" Or ",
                                    u" And ",
                                    u" Not ",
                                    u" Like ",
                                    u" In ",
                                    u" Is ",
                                    u" Null ",
                                    u" Between ",
                                    u" Or 1=1",
                                    u"1",
                                    u"0x",
                                    u"union select * from employees",
                                    u"; drop table customers; --",
                                    u"') or ('1'='1",
                                    u"' Or 'a'='a",
                                    u"E'\\x27'",
                                    u"U&'\\0027'",
                                    u"\n",
                                    u"\t",
                                    u"\u00A0",
                                    u"\u2019",
                                    u"\uFF07",
                                    u"\u202E",
                                    u"😀",
                                    u"é",
                                    u"\uFFFF",
                                    u"[orders].[id]",
                                    u"customers.name",
                                    u"abc",
                                    u" ",
                                    u" ",
                                    u"word",
                                    u"{d '2024-01-01'}",
                                    u"N'x'",
                                    u"x'00'",
                                    u"current_user",
                                    u"null"};

} // namespace

RandomQueries::RandomQueries(std::uint32_t seed, reader::DatabaseReader& database) : mDice(seed) {
    const auto entries = database.tables();
    if (!entries) throw std::runtime_error(entries.error().toStdString());
    for (const auto& entry : *entries) {
        const auto table = database.table(entry.id);
        if (!table) throw std::runtime_error(table.error().toStdString());
        mTables.push_back(*table);
    }
}

platform::Ref<model::Query> RandomQueries::next() {
    const auto query = platform::makeRef<model::Query>();
    const std::size_t tables = 1 + mDice.roll(4);
    for (std::size_t i = 0; i < tables; ++i) {
        const auto table = query->addTable(mDice.pick(mTables));
        if (mDice.oneIn(6))
            query->renameTable(table, u"odd \"name\"; " + platform::decimal(static_cast<int>(i)));
    }
    // As many joins as tables now and then, so that there are cycles and islands.
    const std::size_t joins = tables == 1 ? mDice.roll(6) / 5 : tables - 1 + mDice.roll(3) - 1;
    for (std::size_t i = 0; i < joins; ++i) addJoin(*query);
    mColumns.clear();
    const std::size_t definitions = mDice.roll(5);
    for (std::size_t i = 0; i < definitions; ++i) addDefinition(*query);
    return query;
}

platform::Ref<model::Column> RandomQueries::anyColumn(model::Query& query) {
    auto& columns = query.Tables()
                        .Item(1 + static_cast<std::int32_t>(
                                      mDice.roll(static_cast<std::size_t>(query.Tables().Count()))))
                        ->Columns();
    const auto count = static_cast<std::size_t>(columns.Count());
    return std::static_pointer_cast<model::Column>(
        columns.Item(2 + static_cast<std::int32_t>(mDice.roll(count - 1))));
}

void RandomQueries::addJoin(model::Query& query) {
    static constexpr std::int16_t types[] = {0, 0, 0, 1, 1, 2, 2, 3};
    static constexpr std::int16_t operators[] = {0, 0, 0, 0, 1, 2, 3, 4, 5};
    // Most pairs do not fit; the query has a join less when none was found.
    for (int attempt = 0; attempt < 40; ++attempt) {
        const auto left = anyColumn(query);
        const auto right = anyColumn(query);
        const ColumnType type = left->description().type;
        const bool sameTable = left->place().table() == right->place().table();
        if (type != right->description().type || type == ColumnType::Unknown ||
            type == ColumnType::Blob || (sameTable && !mDice.oneIn(20)))
            continue;
        model::Library library;
        const auto join = library.NewZDJoin();
        join->LeftColumn(left);
        join->RightColumn(right);
        join->JoinType(mDice.pick(types));
        join->CompareOperator(mDice.pick(operators));
        query.AddJoin(join);
        return;
    }
}

void RandomQueries::addDefinition(model::Query& query) {
    model::Library library;
    const auto definition = library.NewZDColumnDefinition();
    const auto column = anyColumn(query);
    const auto table = column->place().table().table();
    definition->Column(column);
    if (mDice.oneIn(12)) definition->Column(table->Columns().Item(1));
    definition->Visible(!mDice.oneIn(6));
    if (mDice.oneIn(4)) definition->Synonym(mDice.oneIn(2) ? u"s" : u"say \"x?\"");
    if (mDice.oneIn(3)) definition->SortOrder(static_cast<std::int16_t>(1 + mDice.roll(2)));
    for (int row = 4; row < 7; ++row)
        if (mDice.oneIn(2))
            definition->AddCriterium(criterion(column->description().type), platform::decimal(row));
    query.AddColumnDefinition(definition);
    if (column->description().type == ColumnType::Unknown) return;
    String name;
    for (const char16_t c : table->Name()) name += c == u']' ? String(u"]]") : String(1, c);
    mColumns.push_back(u"[" + name + u"].[" + column->Name() + u"]");
}

String RandomQueries::criterion(ColumnType type) {
    // Of a column of unknown type PostgreSQL knows the type, and takes no text for a number.
    if (type != ColumnType::Unknown && mDice.oneIn(25)) return hostileText();
    String text = predicate(type);
    for (int more = 0; more < 3 && mDice.oneIn(3); ++more) {
        const bool either = mDice.oneIn(2);
        text = (mDice.oneIn(4) ? u"(" + text + u")" : text) + (either ? u" Or " : u" And ") +
               (mDice.oneIn(5) ? u"Not (" + predicate(type) + u")" : predicate(type));
    }
    return text;
}

String RandomQueries::predicate(ColumnType type) {
    const bool text = type == ColumnType::Text;
    if (type == ColumnType::Blob) return mDice.oneIn(2) ? u"Is Null" : u"Is Not Null";
    switch (mDice.roll(9)) {
    case 0: return mDice.oneIn(2) ? u"Is Null" : u"Not Is Null";
    case 1: return u"Between " + value(type) + u" And " + value(type);
    case 2: return u"Not In (" + value(type) + u", " + value(type) + u")";
    case 3: return u"In (" + value(type) + u")";
    case 4: return u"Not " + value(type);
    case 5:
        if (text) return u"Like '" + String(mDice.oneIn(2) ? u"*" : u"?") + u"a[*]_%\\*'";
        break;
    case 6:
        if (text) return u"Not Like *" + String(1, u"aeSr"[mDice.roll(4)]) + u"*";
        break;
    case 7:
        if (!mColumns.empty() && type != ColumnType::Unknown)
            return mDice.pick(comparisons) + mDice.pick(mColumns);
        break;
    default: break;
    }
    return mDice.pick(comparisons) + value(type);
}

String RandomQueries::number(std::size_t sides) {
    return platform::decimal(static_cast<std::int64_t>(mDice.roll(sides)));
}

String RandomQueries::value(ColumnType type) {
    switch (type) {
    case ColumnType::Integer: return (mDice.oneIn(8) ? u"-" : u"") + number(12);
    case ColumnType::Unknown:
    case ColumnType::Decimal: return number(90) + u"." + number(100);
    case ColumnType::Date: return u"2019-01-1" + number(10);
    case ColumnType::Time: return u"1" + number(10) + u":30";
    case ColumnType::Timestamp: return u"#2019-01-1" + number(10) + u" 12:00#";
    case ColumnType::Boolean: return mDice.oneIn(2) ? u"true" : u"no";
    case ColumnType::Text:
    case ColumnType::Blob: break;
    }
    return mDice.pick(words);
}

String RandomQueries::hostileText() {
    String text;
    const std::size_t count = 1 + mDice.roll(8);
    for (std::size_t i = 0; i < count; ++i) text += mDice.pick(pieces);
    return text;
}

namespace {

bool endsWith(const std::string& text, const std::string& end) {
    return text.size() >= end.size() &&
           text.compare(text.size() - end.size(), end.size(), end) == 0;
}

bool isDigit(char c) { return c >= '0' && c <= '9'; }

bool isLetter(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_' || (c & 0x80) != 0;
}

/// Collects tokens; what makes one value together becomes one.
class Shape {
public:
    void add(const std::string& token) {
        if (token == "?") {
            for (const char* keyword : {" DATE", " TIME", " TIMESTAMP"})
                if (endsWith(mOut, keyword)) mOut.erase(mOut.size() - std::string(keyword).size());
        }
        mOut += ' ' + (token == "TRUE" || token == "FALSE" ? "?" : token);
        if (token != ")") return;
        for (const char* type : {"bigint", "numeric", "boolean", "date", "time", "timestamp"}) {
            const std::string cast = std::string(" CAST ( ? AS ") + type + " )";
            if (endsWith(mOut, cast)) mOut.replace(mOut.size() - cast.size(), cast.size(), " ?");
        }
    }

    void addText(const std::string& token) {
        const bool isEscape = token == "'\\'" && endsWith(mOut, " ESCAPE");
        add(token.front() == '\'' && !isEscape ? "?" : token);
    }

    std::string take() { return std::move(mOut); }

private:
    std::string mOut;
};

/// Behind the closing one of two quotes, or behind the end when there is none.
std::size_t behindQuoted(const std::string& sql, std::size_t begin) {
    for (std::size_t at = begin + 1; at < sql.size(); ++at) {
        if (sql[at] != sql[begin]) continue;
        if (at + 1 == sql.size() || sql[at + 1] != sql[begin]) return at + 1;
        ++at;
    }
    return sql.size() + 1;
}

std::size_t behindNumber(const std::string& sql, std::size_t at) {
    const auto signsExponent = [&](std::size_t i) {
        return (sql[i] == '+' || sql[i] == '-') && sql[i - 1] == 'e';
    };
    for (++at; at < sql.size(); ++at)
        if (!isDigit(sql[at]) && !isLetter(sql[at]) && sql[at] != '.' && !signsExponent(at)) break;
    return at;
}

} // namespace

std::string shape(const std::string& sql) {
    Shape shape;
    for (std::size_t at = 0; at < sql.size();) {
        const std::size_t begin = at;
        const char c = sql[at];
        if (c == ' ' || c == '\n') {
            ++at;
        } else if (c == '\'' || c == '"') {
            at = behindQuoted(sql, begin);
            if (at > sql.size()) return "an open quote in " + sql;
            shape.addText(sql.substr(begin, at - begin));
        } else if (isLetter(c)) {
            while (at < sql.size() && (isLetter(sql[at]) || isDigit(sql[at]))) ++at;
            shape.add(sql.substr(begin, at - begin));
        } else if (isDigit(c) || (c == '-' && at + 1 < sql.size() && isDigit(sql[at + 1]))) {
            at = behindNumber(sql, begin);
            shape.add("?");
        } else {
            shape.add(std::string(1, sql[at++]));
        }
    }
    return shape.take();
}
