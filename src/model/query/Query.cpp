#include <Zandor/Query.h>

#include "model/criteria/QueryColumns.h"
#include "model/criteria/Tying.h"

#include <algorithm>

namespace zandor::model {

using platform::Each;
using platform::makeRef;
using TalvikZandorLib::ZDColumn;
using TalvikZandorLib::ZDColumnDefinition;
using TalvikZandorLib::ZDJoin;
using TalvikZandorLib::ZDTable;

namespace {

/// The object as this model's own class. Error 91 for nothing, error 5 for a class of another
/// library.
template <class Own, class Interface>
Ref<Own> own(const Ref<Interface>& object) {
    if (!object) throw platform::errors::objectNotSet();
    Ref<Own> result = std::dynamic_pointer_cast<Own>(object);
    if (!result) throw platform::errors::invalidProcedureCall();
    return result;
}

/// Removes the items for which `hangs` is true.
template <class Own, class Interface, class Test>
void removeIf(TalvikZandorLib::EditableCollection<Interface>& items, Test hangs) {
    for (std::int32_t position = items.Count(); position >= 1; --position) {
        const Ref<Interface> item = items.Item(position);
        if (hangs(static_cast<const Own&>(*item))) items.Remove(item->Key());
    }
}

} // namespace

Ref<ZDJoin> Query::AddJoin(const Ref<ZDJoin>& join) {
    const auto added = own<Join>(join);
    added->mLeft->require(mTables);
    added->mRight->require(mTables);
    if (added->mKey.empty()) added->mKey = nextKey(u'j', mLastJoin);
    mJoins.Add(added);
    return added;
}

Ref<ZDColumnDefinition> Query::AddColumnDefinition(const Ref<ZDColumnDefinition>& definition) {
    const auto added = own<ColumnDefinition>(definition);
    if (added->isExpression())
        requireNames(*added);
    else
        added->mPlace->require(mTables);
    if (added->mKey.empty()) added->mKey = nextKey(u'x', mLastDefinition);
    mDefinitions.Add(added);
    // One that comes back may have missed that a table was renamed.
    criteria::followNames(*added);
    return added;
}

void Query::StandsBehind(const Ref<ZDColumnDefinition>& definition,
                         const Ref<ZDColumnDefinition>& predecessor) {
    const auto moved = own<ColumnDefinition>(definition);
    const std::int32_t from = mDefinitions.positionOf(*moved);
    std::int32_t to =
        predecessor ? mDefinitions.positionOf(*own<ColumnDefinition>(predecessor)) + 1 : 1;
    if (to == from + 1 && predecessor) throw platform::errors::invalidProcedureCall();
    if (to > from) --to; // its own place closes before it
    mDefinitions.Move(from, to);
}

void Query::DeleteTable(const Ref<ZDTable>& table) {
    requireOwn(table);
    tieCriteria();
    const String key = table->Key();
    removeIf<Join>(mJoins, [&](const Join& join) {
        return join.left().table().key() == key || join.right().table().key() == key;
    });
    removeIf<ColumnDefinition>(mDefinitions, [&](const ColumnDefinition& definition) {
        const auto& names = definition.expression().references;
        return definition.place().table().key() == key ||
               std::any_of(names.begin(), names.end(), [&](const criteria::Reference& name) {
                   return name.column.table().key() == key;
               });
    });
    mTables->Remove(key);
}

void Query::options(QueryOptions value) {
    if (value.first < 0 || value.first > QueryOptions::greatestFirst)
        throw platform::errors::invalidPropertyValue();
    if (!value.hasPlacedComments())
        throw platform::errors::invalidPropertyValue();
    mOptions = std::move(value);
}

Ref<Table> Query::addTable(const TableDescription& source) { return add(source, {}); }

Ref<Table> Query::add(const TableDescription& source, SavedQueryRef saved) {
    if (source.name.empty()) throw platform::errors::invalidProcedureCall();
    tieCriteria();
    String name = source.name;
    for (std::int32_t n = 1; tableNamed(name); ++n)
        name = source.name + u'_' + platform::decimal(n);

    const TablePlace place(mTables, nextKey(u't', mLastTable));
    TableContents contents{.columns = {}, .query = std::move(saved)};
    const auto addColumn = [&](ColumnDescription description) {
        const String key = nextKey(u'c', mLastColumn);
        contents.columns.Add(makeRef<Column>(ColumnPlace(place, key), std::move(description)), key);
    };
    addColumn({.name = String(Column::allColumns)});
    for (const auto& column : source.columns) addColumn(column);

    auto table =
        makeRef<Table>(place, std::move(name), source.schema, source.name, std::move(contents));
    mTables->Add(table);
    return table;
}

void Query::renameTable(const Ref<Table>& table, const String& name) {
    requireOwn(table);
    if (name.empty()) throw platform::errors::invalidProcedureCall();
    const auto bearer = tableNamed(name);
    if (bearer && bearer != table) throw platform::errors::duplicateKey();
    tieCriteria();
    table->mName = name;
    for (const auto& definition : Each<ZDColumnDefinition>(mDefinitions))
        criteria::followNames(static_cast<ColumnDefinition&>(*definition));
}

Ref<Table> Query::tableNamed(platform::StringView name) const {
    return model::tableNamed(*mTables, name);
}

void Query::tieCriteria() {
    const criteria::QueryColumns columns(*mTables);
    for (const auto& definition : Each<ZDColumnDefinition>(mDefinitions))
        criteria::tie(static_cast<ColumnDefinition&>(*definition), columns);
}

String Query::nextKey(char16_t letter, std::int32_t& last) {
    if (last == INT32_MAX) throw platform::errors::overflow();
    return letter + platform::decimal(++last);
}

/// An expression has no column to be of this query by; once its names were tied they are.
void Query::requireNames(ColumnDefinition& definition) {
    const TablePlace home(mTables, {});
    for (const criteria::Reference& name : definition.expression().references)
        if (!name.column.empty() && !name.column.table().sameHome(home))
            throw platform::errors::invalidProcedureCall();
    definition.mPlace = ColumnPlace(home, {});
}

void Query::requireOwn(const Ref<ZDTable>& table) const {
    if (!own<Table>(table)->place().isIn(mTables)) throw platform::errors::invalidProcedureCall();
}

} // namespace zandor::model
