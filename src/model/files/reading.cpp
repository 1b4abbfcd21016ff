#include "model/files/JsonReader.h"
#include "model/files/Unknown.h"
#include "model/files/limits.h"
#include "model/files/migrations.h"
#include "model/files/words.h"

#include <Zandor/QueryDocument.h>

#include <algorithm>
#include <functional>

namespace zandor::files {

namespace {

using platform::String;

/// Makes a record of the query of what stands in a file, and puts aside what it does not know.
class Reader {
public:
    void read(json::Value file);

    model::QueryRecord record = {};
    String database = {};
    std::optional<TypedStatement> typed = {};
    Unknown unknown = {};

private:
    TypedStatement typedStatement(Object object);
    model::QueryRecord query(Object& object);
    model::SavedQueryRef savedQuery(Object& source, const std::string& owner);
    model::TableRecord table(Object object);
    model::ColumnRecord column(Object object);
    model::JoinRecord join(Object object);
    model::EndRecord end(Object object, const std::string& owner);
    model::DefinitionRecord definition(Object object);
    static std::vector<model::NameRecord> names(Object& owner);
    static std::vector<model::Comment> comments(Object& owner);

    static void each(json::Items items, const Pointer& list,
                     const std::function<void(Object)>& use) {
        for (std::size_t n = 0; n < items.size(); ++n) use({std::move(items[n]), list / n});
    }

    void keep(Object&& object, const std::string& owner) {
        json::Members members = std::move(object).unknown();
        if (!members.empty()) unknown.membersOf[mWithin + owner] = std::move(members);
    }

    std::string mWithin; ///< the owners of the saved query that is being read; keys are its own
    std::size_t mColumns = 0;
};

void Reader::read(json::Value file) {
    Object object(std::move(file), {});
    database = object.text("database", String());
    if (object.has("typed")) typed = typedStatement(object.object("typed"));
    record = query(object);
    keep(std::move(object), "");
}

TypedStatement Reader::typedStatement(Object object) {
    TypedStatement typed;
    typed.dialect = static_cast<model::sql::Dialect>(object.word("dialect", words::dialects));
    typed.text = object.pieces("text");
    keep(std::move(object), "typed");
    return typed;
}

model::QueryRecord Reader::query(Object& object) {
    model::QueryRecord query;
    auto tables = object.list("tables", limits::tables);
    auto joins = object.list("joins", limits::joins);
    auto definitions = object.list("definitions", limits::definitions);
    query.options.distinct = object.flag("distinct", false);
    query.options.first = object.integer<std::int32_t>("first", 0);
    query.options.description = object.text("description", String());
    query.options.comments = comments(object);
    Object last = object.object("lastKeys");
    query.lastKeys = {last.integer<std::int32_t>("table"), last.integer<std::int32_t>("column"),
                      last.integer<std::int32_t>("join"), last.integer<std::int32_t>("definition")};
    keep(std::move(last), "lastKeys");
    each(std::move(tables), object.place() / "tables",
         [&](Object each) { query.tables.push_back(table(std::move(each))); });
    each(std::move(joins), object.place() / "joins",
         [&](Object each) { query.joins.push_back(join(std::move(each))); });
    each(std::move(definitions), object.place() / "definitions",
         [&](Object each) { query.definitions.push_back(definition(std::move(each))); });
    return query;
}

model::SavedQueryRef Reader::savedQuery(Object& source, const std::string& owner) {
    if (!source.has("query")) return {};
    model::SavedQuery saved;
    saved.file = source.text("file", String());
    Object inner = source.object("query");
    const std::string outside = mWithin;
    mWithin += owner + "/query/";
    saved.record = query(inner);
    mWithin = outside;
    keep(std::move(inner), owner + "/query");
    return saved;
}

model::TableRecord Reader::table(Object object) {
    model::TableRecord table;
    table.key = object.text("key");
    table.name = object.text("name");
    table.selected = object.integer<std::int16_t>("selected", std::int16_t{0});
    const std::string key = platform::toUtf8(table.key);
    Object source = object.object("source");
    table.schema = source.text("schema", String());
    table.sourceName = source.text("name");
    table.query = savedQuery(source, key + "/source");
    Object place = object.objectOrNone("place");
    table.left = place.integer<std::int32_t>("left", table.left);
    table.top = place.integer<std::int32_t>("top", table.top);
    table.width = place.integer<std::int32_t>("width", table.width);
    table.height = place.integer<std::int32_t>("height", table.height);
    auto columns = object.list("columns", limits::columnsOfTable);
    mColumns += columns.size();
    if (mColumns > limits::columns)
        refuse<MessageCode::tooManyColumns>(object.place() / "columns", limits::columns);
    each(std::move(columns), object.place() / "columns",
         [&](Object each) { table.columns.push_back(column(std::move(each))); });

    keep(std::move(source), key + "/source");
    keep(std::move(place), key + "/place");
    keep(std::move(object), key);
    return table;
}

model::ColumnRecord Reader::column(Object object) {
    model::ColumnRecord column;
    column.key = object.text("key");
    column.description.name = object.text("name");
    column.description.type =
        static_cast<model::ColumnType>(object.word("type", words::columnTypes, 0));
    column.description.declaredType = object.text("declaredType", String());
    column.description.primaryKey = object.flag("primaryKey", false);
    column.selected = object.flag("selected", false);
    keep(std::move(object), platform::toUtf8(column.key));
    return column;
}

model::JoinRecord Reader::join(Object object) {
    model::JoinRecord join;
    join.key = object.text("key");
    const std::string key = platform::toUtf8(join.key);
    join.left = end(object.object("left"), key + "/left");
    join.right = end(object.object("right"), key + "/right");
    join.type = object.word("type", words::joinTypes, 0);
    join.comparison = object.word("operator", words::comparisons, 0);
    keep(std::move(object), key);
    return join;
}

model::EndRecord Reader::end(Object object, const std::string& owner) {
    model::EndRecord end{object.textOrNull("table"), object.textOrNull("column")};
    keep(std::move(object), owner);
    return end;
}

std::vector<model::NameRecord> Reader::names(Object& owner) {
    std::vector<model::NameRecord> names;
    each(owner.listOrNone("names", limits::textLength), owner.place() / "names", [&](Object each) {
        constexpr std::int64_t longest = limits::textLength;
        model::NameRecord name;
        name.begin = each.integer<std::int32_t>("at");
        const auto length = each.integer<std::int32_t>("tableLength", 0);
        if (length < 0 || length > longest)
            refuse<MessageCode::notALength>(each.place() / "tableLength");
        name.tableEnd = std::min<std::int64_t>(name.begin, longest) + length;
        name.table = each.textOrNull("table");
        name.column = each.textOrNull("column");
        names.push_back(std::move(name));
    });
    return names;
}

std::vector<model::Comment> Reader::comments(Object& owner) {
    std::vector<model::Comment> comments;
    each(owner.listOrNone("comments", limits::comments), owner.place() / "comments",
         [&](Object each) {
             model::Comment comment;
             comment.place =
                 static_cast<model::CommentPlace>(each.word("by", words::commentPlaces));
             comment.key = each.text("key", String());
             comment.row = each.integer<std::int16_t>("row", std::int16_t{0});
             comment.beside = each.flag("beside", false);
             comment.text = each.text("text");
             comments.push_back(std::move(comment));
         });
    return comments;
}

model::DefinitionRecord Reader::definition(Object object) {
    model::DefinitionRecord definition;
    definition.key = object.text("key");
    definition.column = object.textOrNull("column");
    definition.synonym = object.text("synonym", String());
    definition.sortOrder = object.word("sort", words::sortOrders, 0);
    definition.visible = object.flag("visible", true);
    definition.width = object.integer<std::int32_t>("width", 0);
    definition.expression = object.text("expression", String());
    definition.names = names(object);
    definition.total = static_cast<model::Total>(object.word("total", words::totals, 0));
    definition.sortPriority = object.integer<std::int16_t>("sortPriority", std::int16_t{0});
    definition.format = static_cast<model::Format>(object.word("format", words::formats, 0));
    definition.decimals = object.integer<std::int16_t>("decimals", model::asManyAsThereAre);
    const std::string key = platform::toUtf8(definition.key);
    each(object.listOrNone("criteria", INT16_MAX), object.place() / "criteria", [&](Object each) {
        const auto row = each.integer<std::int16_t>("row");
        definition.criteria.push_back({row, each.text("text"), names(each)});
        keep(std::move(each), key + '/' + std::to_string(row));
    });
    keep(std::move(object), key);
    return definition;
}

/// Takes the members that say what the file is; refuses what is no query of a version that is
/// known.
json::Value current(json::Value file) {
    const auto choose = model::say<MessageCode::chooseQueryFile>();
    auto* members = std::get_if<json::Members>(&file.content);
    if (!members) throw Refusal{model::say<MessageCode::notAnObject>(Pointer().shown()), choose};
    const json::Value* format = json::find(*members, "format");
    const auto* name = format ? std::get_if<std::string>(&format->content) : nullptr;
    if (!name || *name != words::format)
        throw Refusal{
            model::say<MessageCode::notTheFormat>((Pointer() / "format").shown(), words::format),
            choose};

    Object object(std::move(file), {});
    object.text("format");
    const auto version = object.integer<std::int32_t>("version");
    const Pointer place = Pointer() / "version";
    if (version < 1) refuse<MessageCode::versionTooSmall>(place);
    if (version > currentVersion)
        throw Refusal{
            model::say<MessageCode::versionTooNew>(place.shown(), version, currentVersion),
            model::say<MessageCode::newerProgram>()};
    json::Members rest = std::move(object).unknown();
    migrate(rest, version);
    return {std::move(rest)};
}

} // namespace

Result<QueryDocument> fromJson(std::string_view text) {
    try {
        Reader reader;
        reader.read(current(json::read(text)));
        if (const auto fault = model::faultOf(reader.record)) throw Refusal{fault->message};
        QueryDocument document(model::Query::restored(reader.record));
        document.database = std::move(reader.database);
        document.typed = std::move(reader.typed);
        if (!reader.unknown.membersOf.empty())
            document.unknown = std::make_shared<const Unknown>(std::move(reader.unknown));
        return document;
    } catch (const Refusal& refusal) {
        return refusal.error();
    }
}

} // namespace zandor::files
