#include "model/sql_reader/Forms.h"

#include "model/criteria/Signatures.h"
#include "model/sql/Templates.h"
#include "model/sql_reader/Lexer.h"
#include "model/sql_reader/Refused.h"
#include "model/sql_reader/parse.h"

#include <Zandor/model/Names.h>

#include <array>

namespace zandor::sql_reader {

namespace {

using Json = nlohmann::json;
using model::sql::Function;

/// The place of an argument in a pattern is a column of such a name: this, its number, and what
/// else the printer's templates say of it.
constexpr std::string_view mark = "\xEE\x80\x81"; // U+E001

struct Place {
    int number;
    std::string kind; ///< as templateOf says
};

std::optional<Place> placeIn(const Json& pattern) {
    const auto column = pattern.find("ColumnRef");
    if (column == pattern.end()) return {};
    const Json& fields = column->at("fields");
    if (fields.size() != 1 || !fields[0].contains("String")) return {};
    const std::string name = fields[0]["String"].value("sval", "");
    if (!name.starts_with(mark)) return {};
    return Place{name[mark.size()] - '0', name.substr(mark.size() + 1)};
}

/// Braces become columns that nobody has.
String withMarks(StringView form) {
    String out;
    while (!form.empty()) {
        const std::size_t open = std::min(form.find(u'{'), form.size());
        out += form.substr(0, open);
        form.remove_prefix(open);
        if (form.empty()) break;
        const std::size_t close = form.find(u'}');
        out += u"\uE001";
        for (const char16_t c : form.substr(1, close - 1))
            if (c != u':') out += c;
        form.remove_prefix(close + 1);
    }
    return out;
}

Json parsed(StringView form, Dialect dialect) {
    const ParserText text = lexed(u"SELECT " + withMarks(form), dialect);
    return parse(text.text)["stmts"][0]["stmt"]["SelectStmt"]["targetList"][0]["ResTarget"]["val"];
}

class Matching {
public:
    explicit Matching(Dialect dialect) : mDialect(dialect) {}

    bool match(const Json& pattern, const Json& given) {
        if (!pattern.is_object()) return pattern == given;
        if (const auto place = placeIn(pattern)) return bind(*place, given);
        if (!given.is_object()) return false;
        if (pattern.contains("String")) return sameWord(pattern, given);
        return matchParts(pattern, given);
    }

    std::map<int, const Json*> found;

private:
    static bool says(const std::string& name) {
        return name != "location" && name != "funcformat" && name != "typmod";
    }

    static std::size_t partsSaid(const Json& node) {
        std::size_t count = 0;
        for (const auto& [name, part] : node.items()) count += says(name) ? 1 : 0;
        return count;
    }

    static bool sameWord(const Json& pattern, const Json& given) {
        if (!given.contains("String")) return false;
        const auto word = [](const Json& node) {
            return platform::fromUtf8(
                std::string_view(node["String"].value("sval", std::string())));
        };
        return model::sameName(word(pattern), word(given));
    }

    bool matchParts(const Json& pattern, const Json& given) {
        if (partsSaid(pattern) != partsSaid(given)) return false;
        for (const auto& [name, part] : pattern.items()) {
            if (!says(name)) continue;
            const auto other = given.find(name);
            if (other == given.end()) return false;
            // pg_catalog.btrim is btrim.
            const bool qualified = name == "names" || name == "funcname";
            const bool same = qualified         ? match(part.back(), other->back())
                              : part.is_array() ? matchList(part, *other)
                                                : match(part, *other);
            if (!same) return false;
        }
        return true;
    }

    bool matchList(const Json& pattern, const Json& given) {
        if (!given.is_array() || pattern.size() != given.size()) return false;
        for (std::size_t n = 0; n < pattern.size(); ++n)
            if (!match(pattern[n], given[n])) return false;
        return true;
    }

    bool bind(const Place& place, const Json& given) {
        const Json* inner = &given;
        if (place.kind == "digits" && !isWhole(given)) return false;
        if (place.kind == "0" || place.kind == "1") inner = clamped(given, place.kind);
        if (place.kind == "moment") inner = withoutCast(given);
        if (!inner) return false;
        const auto [known, first] = found.emplace(place.number, inner);
        // What is said twice is one argument.
        return first || Matching(mDialect).match(*known->second, *inner);
    }

    static bool isWhole(const Json& node) {
        return node.contains("A_Const") && node["A_Const"].contains("ival");
    }

    /// The number of which no less than `least` is taken.
    const Json* clamped(const Json& given, const std::string& least) const {
        if (isWhole(given)) {
            const auto value = given["A_Const"]["ival"].value("ival", 0);
            return value >= std::stoi(least) ? &given : nullptr;
        }
        static constexpr std::array<StringView, 5> forms = {
            u"MAX({1}, {2})", u"CAST(CASE WHEN {1} < {2} THEN {2} ELSE {1} END AS integer)",
            u"GREATEST({1}, {2})", u"CASE WHEN {1} < {2} THEN {2} ELSE {1} END",
            u"CASE WHEN {1} < {2} THEN {2} ELSE {1} END"};
        Matching inner(mDialect);
        const Json form = parsed(forms[static_cast<std::size_t>(mDialect)], mDialect);
        if (!inner.match(form, given)) return nullptr;
        const Json* limit = inner.found[2];
        if (!isWhole(*limit)) return nullptr;
        const auto value = (*limit)["A_Const"]["ival"].value("ival", 0);
        return value == std::stoi(least) ? inner.found[1] : nullptr;
    }

    static const Json* withoutCast(const Json& given) {
        const auto cast = given.find("TypeCast");
        if (cast == given.end()) return &given;
        const Json& type = (*cast)["typeName"]["names"].back();
        const bool moment = type["String"].value("sval", "") == "timestamp";
        return moment ? &cast->at("arg") : &given;
    }

    const Dialect mDialect;
};

/// What people write beside what the printer does.
struct Custom {
    Dialect dialect;
    StringView form;
    StringView expression;
};

constexpr Dialect lite = Dialect::SQLite;
constexpr Dialect postgres = Dialect::PostgreSQL;
constexpr Dialect mysql = Dialect::MySQL;
constexpr Dialect server = Dialect::SqlServer;

constexpr auto customs = std::to_array<Custom>({
    {lite, u"ROUND({1})", u"Round({1}, 0)"},
    {lite, u"IFNULL({1}, {2})", u"Coalesce({1}, {2})"},
    {lite, u"IIF({1}, {2}, {3})", u"If({1}, {2}, {3})"},
    {lite, u"SUBSTRING({1}, {2:1})", u"Mid({1}, {2})"},
    {lite, u"SUBSTRING({1}, {2:1}, {3:0})", u"Mid({1}, {2}, {3})"},
    {postgres, u"ROUND({1}, {2:digits})", u"Round({1}, {2})"},
    {postgres, u"CHAR_LENGTH({1})", u"Length({1})"},
    {postgres, u"CHARACTER_LENGTH({1})", u"Length({1})"},
    {postgres, u"BTRIM({1})", u"Trim({1})"},
    {postgres, u"EXTRACT(YEAR FROM {1})", u"Year({1})"},
    {postgres, u"EXTRACT(MONTH FROM {1})", u"Month({1})"},
    {postgres, u"EXTRACT(DAY FROM {1})", u"Day({1})"},
    {postgres, u"SUBSTR({1}, {2:1})", u"Mid({1}, {2})"},
    {postgres, u"SUBSTR({1}, {2:1}, {3:0})", u"Mid({1}, {2}, {3})"},
    {postgres, u"SUBSTRING({1}, {2:1}, {3:0})", u"Mid({1}, {2}, {3})"},
    {mysql, u"ROUND({1}, {2:digits})", u"Round({1}, {2})"},
    {mysql, u"IFNULL({1}, {2})", u"Coalesce({1}, {2})"},
    {mysql, u"IF({1}, {2}, {3})", u"If({1}, {2}, {3})"},
    {mysql, u"CHARACTER_LENGTH({1})", u"Length({1})"},
    {mysql, u"UCASE({1})", u"Upper({1})"},
    {mysql, u"LCASE({1})", u"Lower({1})"},
    {mysql, u"CURDATE()", u"Today()"},
    {mysql, u"NOW()", u"Now()"},
    {mysql, u"SUBSTR({1}, {2:1})", u"Mid({1}, {2})"},
    {mysql, u"SUBSTR({1}, {2:1}, {3:0})", u"Mid({1}, {2}, {3})"},
    {mysql, u"EXTRACT(YEAR FROM {1})", u"Year({1})"},
    {mysql, u"EXTRACT(MONTH FROM {1})", u"Month({1})"},
    {mysql, u"EXTRACT(DAY FROM {1})", u"Day({1})"},
    {mysql, u"DAYOFMONTH({1})", u"Day({1})"},
    {server, u"ISNULL({1}, {2})", u"Coalesce({1}, {2})"},
    // It has bits for values, and conditions.
    {server, u"CASE WHEN {1} THEN 1 WHEN NOT ({1}) THEN 0 END", u"({1})"},
    {server, u"DATEPART(year, {1})", u"Year({1})"},
    {server, u"DATEPART(month, {1})", u"Month({1})"},
    {server, u"DATEPART(day, {1})", u"Day({1})"},
});

String called(StringView name, std::size_t arguments) {
    String out = String(name) + u'(';
    for (std::size_t n = 1; n <= arguments; ++n) {
        if (n > 1) out += u", ";
        out += u'{' + platform::decimal(static_cast<std::int64_t>(n)) + u'}';
    }
    return out + u')';
}

void addTemplate(std::vector<Form>& forms, Function function, std::size_t arguments,
                 StringView expression, Dialect dialect) {
    const StringView form = model::sql::templateOf(function, arguments, dialect);
    if (form.empty() || form.find(u"{*}") != StringView::npos) return;
    forms.push_back({parsed(form, dialect), String(expression), function, dialect});
}

std::vector<Form> made(Dialect dialect) {
    std::vector<Form> forms;
    for (const auto& name : model::criteria::functions()) {
        const auto* signature = model::criteria::signatureOf(name.name);
        if (!signature) continue;
        constexpr std::size_t mostOfTemplates = 3;
        for (std::size_t n = signature->fewest; n <= std::min(signature->most, mostOfTemplates);
             ++n)
            addTemplate(forms, signature->function, n, called(name.name, n), dialect);
    }
    for (const Function function : {Function::addDays, Function::addDaysLater})
        addTemplate(forms, function, 2, u"({1} + {2})", dialect);
    for (const Custom& custom : customs) {
        if (custom.dialect != dialect) continue;
        const StringView word = custom.expression.substr(0, custom.expression.find(u'('));
        const auto* signature = model::criteria::signatureOf(word);
        const auto function = signature ? std::optional(signature->function) : std::nullopt;
        forms.push_back(
            {parsed(custom.form, dialect), String(custom.expression), function, dialect});
    }
    return forms;
}

} // namespace

std::optional<std::map<int, Tree>> Form::match(const Tree& node) const {
    Matching matching(dialect);
    if (!matching.match(pattern, node.json())) return {};
    std::map<int, Tree> arguments;
    for (const auto& [number, json] : matching.found) arguments.emplace(number, *json);
    return arguments;
}

const Form& momentOf(Dialect dialect) {
    static const std::array<Form, 5> all = [] {
        std::array<Form, 5> forms;
        for (const Dialect each : model::sql::allDialects) {
            const StringView form = model::sql::templateOf(Function::moment, 1, each);
            forms[static_cast<std::size_t>(each)] = {parsed(form, each), u"{1}", {}, each};
        }
        return forms;
    }();
    return all[static_cast<std::size_t>(dialect)];
}

const std::vector<Form>& formsOf(Dialect dialect) {
    static const std::array<std::vector<Form>, 5> all = {
        made(Dialect::SQLite), made(Dialect::PostgreSQL), made(Dialect::MySQL),
        made(Dialect::SqlServer), made(Dialect::Standard)};
    return all[static_cast<std::size_t>(dialect)];
}

} // namespace zandor::sql_reader
