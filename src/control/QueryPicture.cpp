#include "control/QueryPicture.h"

#include "control/KeyNumber.h"
#include "platform/KeyedCollection.h"

namespace TalvikDBxZandor {

using platform::Each;
using platform::Ref;
using platform::String;

namespace {

TablePicture pictureOf(TalvikZandorLib::ZDTable& table) {
    TablePicture result{.key = table.Key(),
                        .name = table.Name(),
                        .left = table.Left(),
                        .top = table.Top(),
                        .width = table.Width(),
                        .height = table.Height(),
                        .selected = table.Selected() != 0,
                        .entries = {}};
    for (const auto& column : Each(table.Columns()))
        result.entries.push_back({column->Key(), column->Name(), column->Marker()});
    return result;
}

/// Texts that the editors of the cells read as what they say: a column that is not shown is "Not
/// Visible", and one that is not sorted says nothing.
DefinitionPicture pictureOf(TalvikZandorLib::ZDColumnDefinition& definition, std::size_t rows) {
    constexpr std::size_t firstCriterion = 4;
    const String key = definition.Key();
    DefinitionPicture result{.number = isKeyOfNumber(key) ? numberOfKey(key) : 0,
                             .cells = std::vector<String>(rows)};
    const auto column = definition.Column();
    // One that has lost its column must be seen to be deleted.
    result.cells.at(0) = column ? column->Name() : u"?";
    result.cells.at(1) = definition.Synonym();
    const std::int16_t order = definition.SortOrder();
    if (order == 1) result.cells.at(2) = u"Ascending";
    if (order == 2) result.cells.at(2) = u"Descending";
    result.cells.at(3) = definition.Visible() ? u"Visible" : u"Not Visible";
    std::size_t row = firstCriterion;
    for (const auto& criterium : Each(definition.Criteria())) {
        if (row == rows) break;
        result.cells.at(row++) = criterium->Criterium();
    }
    return result;
}

} // namespace

QueryPicture pictureOf(TalvikZandorLib::Zandor& model, std::size_t tables, std::size_t definitions,
                       std::size_t rows) {
    QueryPicture picture;
    for (const auto& table : Each(model.Tables())) {
        if (picture.tables.size() == tables) break;
        picture.tables.push_back(pictureOf(*table));
    }
    for (const auto& join : Each(model.Joins())) {
        const auto leftTable = join->LeftTable();
        const auto leftColumn = join->LeftColumn();
        const auto rightTable = join->RightTable();
        const auto rightColumn = join->RightColumn();
        if (!leftTable || !leftColumn || !rightTable || !rightColumn) continue;
        JoinPicture each{
            join->Key(),         leftTable->Key(), leftColumn->Name(),     rightTable->Key(),
            rightColumn->Name(), join->JoinType(), join->CompareOperator()};
        if (each.leftTable != each.rightTable) picture.joins.push_back(std::move(each));
    }
    for (const auto& definition : Each(model.ColumnDefinitions())) {
        if (picture.definitions.size() == definitions) break;
        picture.definitions.push_back(pictureOf(*definition, rows));
    }
    return picture;
}

} // namespace TalvikDBxZandor
