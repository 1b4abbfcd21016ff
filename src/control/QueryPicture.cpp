#include "control/QueryPicture.h"

#include <Zandor/control/KeyNumber.h>

#include <Zandor/control/ModelList.h>

namespace TalvikDBxZandor {

using platform::String;
using TalvikZandorLib::ZDColumnDefinition;
using TalvikZandorLib::ZDTable;

namespace {

template <class Owner, class Collection>
auto list(const Life& life, const Held<Owner>& owner, Collection& (Owner::*collection)()) {
    return ModelList<Owner, Collection>(life, owner, collection);
}

TablePicture pictureOf(const Life& life, const Held<ZDTable>& table) {
    TablePicture result;
    result.key = table->Key();
    result.name = table->Name();
    result.left = table->Left();
    result.top = table->Top();
    result.width = table->Width();
    result.height = table->Height();
    result.selected = table->Selected() != 0;
    for (const auto& column : list(life, table, &ZDTable::Columns)) {
        EntryPicture& entry = result.entries.emplace_back();
        entry.key = column->Key();
        entry.text = column->Name();
        entry.marked = column->Marker();
    }
    return result;
}

/// Texts that the editors of the cells read as what they say: a column that is not shown is "Not
/// Visible", and one that is not sorted says nothing.
DefinitionPicture pictureOf(const Life& life, const Held<ZDColumnDefinition>& definition,
                            std::size_t rows, const platform::Words& words) {
    constexpr std::size_t firstCriterion = 4;
    const String key = definition->Key();
    DefinitionPicture result{.number = isKeyOfNumber(key) ? numberOfKey(key) : 0,
                             .cells = std::vector<String>(rows)};
    const auto column = hold(life, definition->Column());
    // One that has lost its column must be seen to be deleted.
    result.cells.at(0) = column ? column->Name() : u"?";
    result.cells.at(1) = definition->Synonym();
    const std::int16_t order = definition->SortOrder();
    if (order == 1) result.cells.at(2) = words.Ascending;
    if (order == 2) result.cells.at(2) = words.Descending;
    result.cells.at(3) = definition->Visible() ? words.Visible : words.NotVisible;
    std::size_t row = firstCriterion;
    for (const auto& criterium : list(life, definition, &ZDColumnDefinition::Criteria)) {
        if (row == rows) break;
        result.cells.at(row++) = criterium->Criterium();
    }
    return result;
}

} // namespace

QueryPicture pictureOf(const Life& life, const Held<TalvikZandorLib::Zandor>& model,
                       std::size_t tables, std::size_t definitions, std::size_t rows,
                       const platform::Words& words) {
    using Query = TalvikZandorLib::Zandor;
    QueryPicture picture;
    for (const auto& table : list(life, model, &Query::Tables)) {
        if (picture.tables.size() == tables) break;
        picture.tables.push_back(pictureOf(life, table));
    }
    for (const auto& join : list(life, model, &Query::Joins)) {
        const auto leftTable = hold(life, join->LeftTable());
        const auto leftColumn = hold(life, join->LeftColumn());
        const auto rightTable = hold(life, join->RightTable());
        const auto rightColumn = hold(life, join->RightColumn());
        if (!leftTable || !leftColumn || !rightTable || !rightColumn) continue;
        JoinPicture each;
        each.key = join->Key();
        each.leftTable = leftTable->Key();
        each.leftColumn = leftColumn->Name();
        each.rightTable = rightTable->Key();
        each.rightColumn = rightColumn->Name();
        each.type = join->JoinType();
        each.comparison = join->CompareOperator();
        if (each.leftTable != each.rightTable) picture.joins.push_back(std::move(each));
    }
    for (const auto& definition : list(life, model, &Query::ColumnDefinitions)) {
        if (picture.definitions.size() == definitions) break;
        picture.definitions.push_back(pictureOf(life, definition, rows, words));
    }
    return picture;
}

} // namespace TalvikDBxZandor
