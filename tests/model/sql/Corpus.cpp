#include "Corpus.h"

#include <Zandor/Library.h>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <array>
#include <filesystem>
#include <fstream>
#include <stdexcept>

using namespace zandor;

namespace corpus {

namespace {

using nlohmann::json;
using platform::fromUtf8;

constexpr std::array<const char*, 4> types = {"inner", "left", "right", "full"};
constexpr std::array<const char*, 6> operators = {"=", "<>", "<", ">", "<=", ">="};

template <std::size_t size>
int positionIn(const std::array<const char*, size>& words, const std::string& word) {
    const auto at = std::find(words.begin(), words.end(), word);
    if (at == words.end()) throw std::runtime_error("no such word: " + word);
    return static_cast<int>(at - words.begin());
}

/// "table.column", or both in a list where the names have dots in them.
Names names(const json& value) {
    if (value.is_array()) return {value.at(0), value.at(1)};
    const std::string text = value;
    const auto dot = text.find('.');
    if (dot == std::string::npos) throw std::runtime_error("no table: " + text);
    return {text.substr(0, dot), text.substr(dot + 1)};
}

/// "orders", "orders as old", or an object for a saved query.
Table table(const json& value) {
    if (value.is_object()) return {value.at("query"), value.value("as", ""), true};
    const std::string text = value;
    const auto as = text.find(" as ");
    if (as == std::string::npos) return {text, {}};
    return {text.substr(0, as), text.substr(as + 4)};
}

/// "a.x = b.y", "left a.x = b.y", or a list of the four parts.
Join join(const json& value) {
    if (value.is_array())
        return {names(value.at(1)), names(value.at(3)), positionIn(types, value.at(0)),
                positionIn(operators, value.at(2))};
    std::string text = value;
    int type = 0;
    for (std::size_t i = 1; i < types.size(); ++i) {
        const std::string prefix = std::string(types[i]) + ' ';
        if (text.rfind(prefix, 0) != 0) continue;
        type = static_cast<int>(i);
        text.erase(0, prefix.size());
    }
    const auto first = text.find(' ');
    const auto second = text.find(' ', first + 1);
    return {names(text.substr(0, first)), names(text.substr(second + 1)), type,
            positionIn(operators, text.substr(first + 1, second - first - 1))};
}

/// "orders.id" alone is shown and nothing else.
Column column(const json& value) {
    if (!value.is_object()) return {names(value), {}, 0, true, {}};
    static constexpr std::array<const char*, 9> totals = {
        "",        "group",    "count",   "count different", "sum",
        "average", "smallest", "largest", "condition"};
    static constexpr std::array<const char*, 3> sorts = {"", "ascending", "descending"};
    return {value.contains("column") ? names(value["column"]) : Names(),
            value.value("as", ""),
            positionIn(sorts, value.value("sort", "")),
            !value.value("hidden", false),
            value.value("criteria", std::vector<std::string>()),
            value.value("expression", ""),
            static_cast<model::Total>(positionIn(totals, value.value("total", ""))),
            value.value("priority", 0)};
}

/// A text, or its lines.
std::string lines(const json& value) {
    if (value.is_string()) return value;
    std::string text;
    for (const std::string line : value) text += (text.empty() ? "" : "\n") + line;
    return text;
}

Case readCase(const json& from) {
    Case to;
    to.name = from.value("name", "");
    if (from.contains("queries"))
        for (const auto& [name, query] : from["queries"].items())
            to.queries[name] = std::make_shared<const Case>(readCase(query));
    for (const json& value : from.at("tables")) to.tables.push_back(table(value));
    if (from.contains("joins"))
        for (const json& value : from["joins"]) to.joins.push_back(join(value));
    if (from.contains("columns"))
        for (const json& value : from["columns"]) to.columns.push_back(column(value));
    to.collated = from.value("collated", false);
    to.answers = from.value("answers", to.answers);
    if (from.contains("sql"))
        for (const auto& [dialects, text] : from["sql"].items())
            for (const auto dialect : model::sql::allDialects)
                if ((", " + dialects + ",").find(", " + corpus::nameOf(dialect) + ",") !=
                    std::string::npos)
                    to.sql[corpus::nameOf(dialect)] = lines(text);
    if (from.contains("findings"))
        for (const json& value : from["findings"])
            to.findings.push_back({value.at("kind"), value.at("text"), value.value("row", 0),
                                   value.value("position", 0)});
    to.options.distinct = from.value("distinct", false);
    to.options.first = from.value("first", 0);
    if (from.contains("reference")) {
        const json& reference = from["reference"];
        for (const auto dialect : model::sql::allDialects) {
            const std::string name = corpus::nameOf(dialect);
            if (!reference.is_object())
                to.references[name] = lines(reference);
            else if (reference.contains(name))
                to.references[name] = lines(reference[name]);
        }
    }
    return to;
}

} // namespace

std::vector<Case> read(const std::string& directory) {
    std::vector<std::filesystem::path> files;
    for (const auto& entry : std::filesystem::directory_iterator(directory))
        if (entry.path().extension() == ".json") files.push_back(entry.path());
    std::sort(files.begin(), files.end());
    std::vector<Case> cases;
    for (const auto& file : files) {
        std::ifstream stream(file);
        for (const json& value : json::parse(stream)) {
            try {
                cases.push_back(readCase(value));
                if (cases.back().name.empty()) throw std::runtime_error("no name");
            } catch (const std::exception& error) {
                throw std::runtime_error(file.string() + ": " + value.dump() + ": " + error.what());
            }
        }
    }
    return cases;
}

std::string nameOf(model::sql::Dialect dialect) {
    switch (dialect) {
    case model::sql::Dialect::SQLite: return "sqlite";
    case model::sql::Dialect::PostgreSQL: return "postgresql";
    case model::sql::Dialect::MySQL: return "mysql";
    case model::sql::Dialect::SqlServer: return "sqlserver";
    case model::sql::Dialect::Standard: break;
    }
    return "standard";
}

std::string nameOf(model::Finding::Kind kind) {
    using Kind = model::Finding::Kind;
    switch (kind) {
    case Kind::noTables: return "noTables";
    case Kind::definitionWithoutColumn: return "definitionWithoutColumn";
    case Kind::sortOnAllColumns: return "sortOnAllColumns";
    case Kind::duplicateOutputName: return "duplicateOutputName";
    case Kind::cartesianProduct: return "cartesianProduct";
    case Kind::patternWithoutLike: return "patternWithoutLike";
    case Kind::incomparableJoin: return "incomparableJoin";
    case Kind::ambiguousOuterJoin: return "ambiguousOuterJoin";
    case Kind::badCriterion: return "badCriterion";
    case Kind::nameNotCarried: return "nameNotCarried";
    case Kind::badExpression: return "badExpression";
    case Kind::badTotal: return "badTotal";
    case Kind::criterionNotPlaced: return "criterionNotPlaced";
    case Kind::sortNotOutput: return "sortNotOutput";
    case Kind::firstUnsorted: return "firstUnsorted";
    case Kind::otherColumnsGiven: return "otherColumnsGiven";
    case Kind::notInDialect: break;
    }
    return "notInDialect";
}

platform::Ref<model::Query> draw(const Case& drawn, reader::DatabaseReader& database) {
    const auto query = platform::makeRef<model::Query>();
    model::Library library;
    query->options(drawn.options);
    const auto add = [&](const Table& table) {
        const auto name = fromUtf8(table.source);
        if (table.query) {
            const auto saved = draw(*drawn.queries.at(table.source), database);
            return query->addQuery(name, {.file = {}, .record = saved->record()});
        }
        const auto description = database.table({u"", name});
        if (!description) throw std::runtime_error(description.error().toStdString());
        return query->addTable(*description);
    };
    for (const Table& table : drawn.tables) {
        const auto added = add(table);
        if (!table.name.empty()) query->renameTable(added, fromUtf8(table.name));
    }
    const auto columnOf = [&](const Names& names) -> platform::Ref<TalvikZandorLib::ZDColumn> {
        const auto table = query->tableNamed(fromUtf8(names.first));
        if (!table) throw std::runtime_error(drawn.name + ": no table " + names.first);
        if (names.second == "*") return table->Columns().Item(1);
        const auto column = table->columnNamed(fromUtf8(names.second));
        if (!column) throw std::runtime_error(drawn.name + ": no column " + names.second);
        return column;
    };
    for (const Join& from : drawn.joins) {
        const auto join = library.NewZDJoin();
        join->LeftColumn(columnOf(from.left));
        join->RightColumn(columnOf(from.right));
        join->JoinType(static_cast<std::int16_t>(from.type));
        join->CompareOperator(static_cast<std::int16_t>(from.comparison));
        query->AddJoin(join);
    }
    for (const Column& from : drawn.columns) {
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        if (from.expression.empty())
            definition->Column(columnOf(from.what));
        else
            definition->expression(fromUtf8(from.expression));
        definition->total(from.total);
        definition->sortPriority(static_cast<std::int16_t>(from.priority));
        definition->Synonym(fromUtf8(from.synonym));
        definition->SortOrder(static_cast<std::int16_t>(from.sort));
        definition->Visible(from.visible);
        for (std::size_t row = 0; row < from.criteria.size(); ++row)
            if (!from.criteria[row].empty())
                definition->AddCriterium(
                    fromUtf8(from.criteria[row]),
                    platform::decimal(model::Criteria::firstRow + static_cast<int>(row)));
        query->AddColumnDefinition(definition);
    }
    return query;
}

} // namespace corpus
