#include "model/files/migrations.h"

#include "model/files/words.h"

#include <Zandor/QueryDocument.h>
#include <Zandor/model/Record.h>

#include <algorithm>
#include <array>

namespace zandor::files {

namespace {

/// The objects of a list; none when there is no such list, which is for the reader to refuse.
std::vector<json::Members*> objectsOf(json::Members& owner, std::string_view name) {
    std::vector<json::Members*> objects;
    json::Value* list = json::find(owner, name);
    auto* items = list ? std::get_if<json::Items>(&list->content) : nullptr;
    if (!items) return objects;
    for (json::Value& item : *items)
        if (auto* members = std::get_if<json::Members>(&item.content)) objects.push_back(members);
    return objects;
}

void numberToWord(json::Members& join, std::string_view name, Words words, const Pointer& place) {
    json::Value* value = json::find(join, name);
    if (!value) return;
    const auto greatest = static_cast<std::int64_t>(words.size()) - 1;
    const auto code = wholeNumber(*value, 0, greatest);
    if (!code) refuse<MessageCode::notAWholeNumber>(place / name, 0, greatest);
    value->content = std::string(words[static_cast<std::size_t>(*code)]);
}

std::int64_t greatestKey(const std::vector<json::Members*>& objects, char16_t letter) {
    std::int32_t greatest = 0;
    for (json::Members* object : objects) {
        const json::Value* key = json::find(*object, "key");
        const auto* text = key ? std::get_if<std::string>(&key->content) : nullptr;
        if (!text) continue;
        greatest =
            std::max(greatest, model::keyNumber(platform::fromUtf8(*text), letter).value_or(0));
    }
    return greatest;
}

/// Version 1 had a join's type and operator as the numbers of the model, and not the last keys: a
/// key could be given again after its object was deleted and the query saved.
void from1(json::Members& file) {
    const auto tables = objectsOf(file, "tables");
    const auto joins = objectsOf(file, "joins");
    for (std::size_t n = 0; n < joins.size(); ++n) {
        const Pointer place = Pointer() / "joins" / n;
        numberToWord(*joins[n], "type", words::joinTypes, place);
        numberToWord(*joins[n], "operator", words::comparisons, place);
    }
    std::int64_t lastColumn = 0;
    for (json::Members* table : tables)
        lastColumn = std::max(lastColumn, greatestKey(objectsOf(*table, "columns"), u'c'));
    const json::Members lastKeys = {
        {"table", json::number(greatestKey(tables, u't'))},
        {"column", json::number(lastColumn)},
        {"join", json::number(greatestKey(joins, u'j'))},
        {"definition", json::number(greatestKey(objectsOf(file, "definitions"), u'x'))}};
    if (!json::find(file, "lastKeys")) file.push_back({"lastKeys", {lastKeys}});
}

/// Version 2 had no totals, expressions, priorities of sorting and options of the query: an older
/// program would leave them out and ask another question.
void from2(json::Members&) {}

using Step = void (*)(json::Members&);

/// The step at position n leads from version n + 1 to the next.
constexpr std::array<Step, currentVersion - 1> steps = {from1, from2};

} // namespace

void migrate(json::Members& file, int version) {
    for (auto step = static_cast<std::size_t>(version) - 1; step < steps.size(); ++step)
        steps[step](file);
}

} // namespace zandor::files
