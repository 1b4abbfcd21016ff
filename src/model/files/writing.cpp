#include "model/files/Unknown.h"
#include "model/files/limits.h"
#include "model/files/words.h"

#include <Zandor/QueryDocument.h>

namespace zandor::files {

namespace {

using platform::String;
using platform::StringView;

/// A text of the query for the file.
json::Value textOf(const String& text, const Pointer& place) {
    std::string utf8 = platform::toUtf8(text);
    if (platform::fromUtf8(utf8) != text)
        throw Refusal{model::say<MessageCode::halfCharacterInText>(place.shown()),
                      model::say<MessageCode::typeAfresh>()};
    return {std::move(utf8)};
}

json::Value orNull(const String& key) {
    if (key.empty()) return {};
    return {platform::toUtf8(key)};
}

std::string word(Words words, std::int16_t code) {
    return std::string(words[static_cast<std::size_t>(code)]);
}

/// Where a line of a text ends that may be longer than one text of a file.
std::size_t endOfPiece(StringView text) {
    const std::size_t end = text.substr(0, limits::textLength).find(u'\n');
    if (end != StringView::npos) return end + 1;
    if (text.size() <= limits::textLength) return text.size();
    const char16_t last = text[limits::textLength - 1];
    const bool isHalf = last >= 0xD800 && last < 0xDC00; // its other half comes next
    return limits::textLength - (isHalf ? 1 : 0);
}

/// Makes the file's content of a record, each object followed by what its version did not know.
class Writer {
public:
    explicit Writer(const Unknown* unknown) : mUnknown(unknown) {}

    json::Value file(const model::QueryRecord& record, const QueryDocument& document);

private:
    json::Value typed(const TypedStatement& typed) const;
    void add(json::Members& members, const model::QueryRecord& record, const Pointer& place);
    json::Value source(const model::TableRecord& table, const Pointer& place);
    json::Value table(const model::TableRecord& table, const Pointer& place);
    json::Value column(const model::ColumnRecord& column, const Pointer& place) const;
    json::Value join(const model::JoinRecord& join) const;
    json::Value end(const model::EndRecord& end, const std::string& owner) const;
    json::Value definition(const model::DefinitionRecord& definition, const Pointer& place) const;
    static json::Value names(const std::vector<model::NameRecord>& names);
    static json::Value comments(const std::vector<model::Comment>& comments, const Pointer& place);

    json::Value whole(json::Members members, const std::string& owner) const {
        if (mUnknown) {
            const auto at = mUnknown->membersOf.find(mWithin + owner);
            if (at != mUnknown->membersOf.end())
                members.insert(members.end(), at->second.begin(), at->second.end());
        }
        return {std::move(members)};
    }

    const Unknown* mUnknown;
    std::string mWithin; ///< as the reader's
};

json::Value Writer::file(const model::QueryRecord& record, const QueryDocument& document) {
    json::Members members = {{"format", {std::string(words::format)}},
                             {"version", json::number(currentVersion)}};
    if (!document.database.empty())
        members.push_back({"database", textOf(document.database, Pointer() / "database")});
    if (document.typed) members.push_back({"typed", typed(*document.typed)});
    add(members, record, {});
    return whole(std::move(members), "");
}

json::Value Writer::typed(const TypedStatement& typed) const {
    const Pointer place = Pointer() / "typed" / "text";
    json::Items pieces;
    for (StringView rest = typed.text; !rest.empty();) {
        const StringView piece = rest.substr(0, endOfPiece(rest));
        pieces.push_back(textOf(String(piece), place / pieces.size()));
        rest.remove_prefix(piece.size());
    }
    return whole({{"dialect", {word(words::dialects, static_cast<std::int16_t>(typed.dialect))}},
                  {"text", {std::move(pieces)}}},
                 "typed");
}

void Writer::add(json::Members& members, const model::QueryRecord& record, const Pointer& place) {
    const model::LastKeys& last = record.lastKeys;
    members.push_back({"lastKeys", whole({{"table", json::number(last.table)},
                                          {"column", json::number(last.column)},
                                          {"join", json::number(last.join)},
                                          {"definition", json::number(last.definition)}},
                                         "lastKeys")});
    const model::QueryOptions& options = record.options;
    if (options.distinct) members.push_back({"distinct", {true}});
    if (options.first != 0) members.push_back({"first", json::number(options.first)});
    if (!options.description.empty())
        members.push_back({"description", textOf(options.description, place / "description")});
    if (!options.comments.empty())
        members.push_back({"comments", comments(options.comments, place / "comments")});
    json::Items tables;
    for (const auto& each : record.tables)
        tables.push_back(table(each, place / "tables" / tables.size()));
    members.push_back({"tables", {std::move(tables)}});
    json::Items joins;
    for (const auto& each : record.joins) joins.push_back(join(each));
    members.push_back({"joins", {std::move(joins)}});
    json::Items definitions;
    for (const auto& each : record.definitions)
        definitions.push_back(definition(each, place / "definitions" / definitions.size()));
    members.push_back({"definitions", {std::move(definitions)}});
}

json::Value Writer::source(const model::TableRecord& table, const Pointer& place) {
    const std::string owner = platform::toUtf8(table.key) + "/source";
    json::Members members = {{"schema", textOf(table.schema, place / "schema")},
                             {"name", textOf(table.sourceName, place / "name")}};
    if (table.query) {
        if (!table.query->file.empty())
            members.push_back({"file", textOf(table.query->file, place / "file")});
        const std::string outside = mWithin;
        mWithin += owner + "/query/";
        json::Members query;
        add(query, table.query->record, place / "query");
        mWithin = outside;
        members.push_back({"query", whole(std::move(query), owner + "/query")});
    }
    return whole(std::move(members), owner);
}

json::Value Writer::table(const model::TableRecord& table, const Pointer& place) {
    json::Items columns;
    for (const auto& each : table.columns)
        columns.push_back(column(each, place / "columns" / columns.size()));
    const std::string key = platform::toUtf8(table.key);
    return whole({{"key", {key}},
                  {"name", textOf(table.name, place / "name")},
                  {"source", source(table, place / "source")},
                  {"place", whole({{"left", json::number(table.left)},
                                   {"top", json::number(table.top)},
                                   {"width", json::number(table.width)},
                                   {"height", json::number(table.height)}},
                                  key + "/place")},
                  {"selected", json::number(table.selected)},
                  {"columns", {std::move(columns)}}},
                 key);
}

json::Value Writer::column(const model::ColumnRecord& column, const Pointer& place) const {
    const model::ColumnDescription& description = column.description;
    const std::string key = platform::toUtf8(column.key);
    json::Members members = {{"key", {key}}, {"name", textOf(description.name, place / "name")}};
    // Most columns are plain, and a table has many.
    if (description.type != model::ColumnType::Unknown)
        members.push_back(
            {"type", {word(words::columnTypes, static_cast<std::int16_t>(description.type))}});
    if (!description.declaredType.empty())
        members.push_back(
            {"declaredType", textOf(description.declaredType, place / "declaredType")});
    if (description.primaryKey) members.push_back({"primaryKey", {true}});
    if (column.selected) members.push_back({"selected", {true}});
    return whole(std::move(members), key);
}

json::Value Writer::join(const model::JoinRecord& join) const {
    const std::string key = platform::toUtf8(join.key);
    return whole({{"key", {key}},
                  {"left", end(join.left, key + "/left")},
                  {"right", end(join.right, key + "/right")},
                  {"type", {word(words::joinTypes, join.type)}},
                  {"operator", {word(words::comparisons, join.comparison)}}},
                 key);
}

json::Value Writer::end(const model::EndRecord& end, const std::string& owner) const {
    return whole({{"table", orNull(end.table)}, {"column", orNull(end.column)}}, owner);
}

json::Value Writer::names(const std::vector<model::NameRecord>& names) {
    json::Items items;
    for (const auto& name : names) {
        json::Members members = {{"at", json::number(name.begin)},
                                 {"tableLength", json::number(name.tableEnd - name.begin)}};
        if (!name.column.empty()) {
            members.push_back({"table", {platform::toUtf8(name.table)}});
            members.push_back({"column", {platform::toUtf8(name.column)}});
        }
        items.push_back({std::move(members)});
    }
    return {std::move(items)};
}

json::Value Writer::comments(const std::vector<model::Comment>& comments, const Pointer& place) {
    json::Items items;
    for (const auto& comment : comments) {
        json::Members members = {
            {"by", {word(words::commentPlaces, static_cast<std::int16_t>(comment.place))}}};
        const Pointer own = place / items.size();
        if (!comment.key.empty()) members.push_back({"key", textOf(comment.key, own / "key")});
        if (comment.row != 0) members.push_back({"row", json::number(comment.row)});
        if (comment.beside) members.push_back({"beside", {true}});
        members.push_back({"text", textOf(comment.text, own / "text")});
        items.push_back({std::move(members)});
    }
    return {std::move(items)};
}

json::Value Writer::definition(const model::DefinitionRecord& definition,
                               const Pointer& place) const {
    const std::string key = platform::toUtf8(definition.key);
    json::Items criteria;
    for (const auto& criterion : definition.criteria) {
        json::Members members = {
            {"row", json::number(criterion.row)},
            {"text", textOf(criterion.text, place / "criteria" / criteria.size() / "text")}};
        if (!criterion.names.empty()) members.push_back({"names", names(criterion.names)});
        criteria.push_back(whole(std::move(members), key + '/' + std::to_string(criterion.row)));
    }
    json::Members members = {{"key", {key}},
                             {"column", orNull(definition.column)},
                             {"synonym", textOf(definition.synonym, place / "synonym")},
                             {"sort", {word(words::sortOrders, definition.sortOrder)}},
                             {"visible", {definition.visible}}};
    if (definition.width != 0) members.push_back({"width", json::number(definition.width)});
    if (!definition.expression.empty()) {
        members.push_back({"expression", textOf(definition.expression, place / "expression")});
        if (!definition.names.empty()) members.push_back({"names", names(definition.names)});
    }
    if (definition.total != model::Total::None)
        members.push_back(
            {"total", {word(words::totals, static_cast<std::int16_t>(definition.total))}});
    if (definition.sortPriority != 0)
        members.push_back({"sortPriority", json::number(definition.sortPriority)});
    if (definition.format != model::Format::None)
        members.push_back(
            {"format", {word(words::formats, static_cast<std::int16_t>(definition.format))}});
    if (definition.decimals != model::asManyAsThereAre)
        members.push_back({"decimals", json::number(definition.decimals)});
    members.push_back({"criteria", {std::move(criteria)}});
    return whole(std::move(members), key);
}

} // namespace

Result<std::string> toJson(const QueryDocument& document) {
    const model::QueryRecord record = document.query->record();
    std::string text;
    try {
        text = json::print(Writer(document.unknown.get()).file(record, document));
    } catch (const Refusal& refusal) {
        return refusal.error();
    }
    // Better no file than one that cannot be read, whatever the reason.
    const auto again = fromJson(text);
    if (!again) return Error{model::say<MessageCode::notReadAgain>(again.failure().message)};
    if (again->query->record() != record || again->database != document.database ||
        again->typed != document.typed)
        return Error{model::say<MessageCode::notTheSameAgain>()};
    return text;
}

} // namespace zandor::files
