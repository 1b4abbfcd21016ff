#include "support/FakeModel.h"

#include <Zandor/platform/Numbers.h>

#include <stdexcept>
#include <unordered_set>

using namespace zandor;

namespace fake {

using platform::makeRef;

const std::vector<std::string>& memberNames() {
    // clang-format off
    static const std::vector<std::string> names = {
        "ZDColumn.Name", "ZDColumn.Key", "ZDColumn.Marker", "ZDColumn.Selected",
        "ZDColumn.Selected=", "ZDColumn.activated=",
        "ZDTable.Name", "ZDTable.Key", "ZDTable.Left", "ZDTable.Left=", "ZDTable.Top",
        "ZDTable.Top=", "ZDTable.Width", "ZDTable.Width=", "ZDTable.Height", "ZDTable.Height=",
        "ZDTable.Selected", "ZDTable.Selected=", "ZDTable.Columns",
        "ZDJoin.LeftTable", "ZDJoin.LeftTable=", "ZDJoin.LeftColumn", "ZDJoin.LeftColumn=",
        "ZDJoin.RightTable", "ZDJoin.RightTable=", "ZDJoin.RightColumn", "ZDJoin.RightColumn=",
        "ZDJoin.JoinType", "ZDJoin.JoinType=", "ZDJoin.CompareOperator",
        "ZDJoin.CompareOperator=", "ZDJoin.Key",
        "ZDCriterium.Criterium", "ZDCriterium.Criterium=",
        "ZDColumnDefinition.Column", "ZDColumnDefinition.Column=", "ZDColumnDefinition.Synonym",
        "ZDColumnDefinition.Synonym=", "ZDColumnDefinition.SortOrder",
        "ZDColumnDefinition.SortOrder=", "ZDColumnDefinition.Visible",
        "ZDColumnDefinition.Visible=", "ZDColumnDefinition.Key", "ZDColumnDefinition.Criteria",
        "ZDColumnDefinition.HasCriterium", "ZDColumnDefinition.AddCriterium",
        "Zandor.Tables", "Zandor.Joins", "Zandor.ColumnDefinitions", "Zandor.AddJoin",
        "Zandor.AddColumnDefinition", "Zandor.DeleteTable",
        "Library.NewZandor", "Library.NewZDJoin", "Library.NewZDColumnDefinition",
        "Tables.Count", "Tables.Item(position)", "Tables.Item(key)",
        "Columns.Count", "Columns.Item(position)", "Columns.Item(key)",
        "Joins.Count", "Joins.Item(position)", "Joins.Item(key)", "Joins.Remove",
        "ColumnDefinitions.Count", "ColumnDefinitions.Item(position)",
        "ColumnDefinitions.Item(key)", "ColumnDefinitions.Remove",
        "Criteria.Count", "Criteria.Item(position)", "Criteria.Item(key)", "Criteria.Remove",
    };
    // clang-format on
    return names;
}

namespace {

bool isMember(const std::string& name) {
    static const std::unordered_set<std::string> names(memberNames().begin(), memberNames().end());
    return names.count(name) != 0;
}

} // namespace

void Part::called(const std::string& member) const {
    if (!isMember(member)) throw std::logic_error(member + " is missing among the member names");
    mCalls->pass(member);
}

String Column::Name() const {
    called("ZDColumn.Name");
    return name;
}

String Column::Key() const {
    called("ZDColumn.Key");
    return key;
}

bool Column::Marker() const {
    called("ZDColumn.Marker");
    return marker;
}

bool Column::Selected() const {
    called("ZDColumn.Selected");
    return selected;
}

void Column::Selected(bool value) {
    called("ZDColumn.Selected=");
    selected = value;
}

void Column::activated(std::int16_t value) {
    called("ZDColumn.activated=");
    activatedValue = value;
}

String Table::Name() const {
    called("ZDTable.Name");
    return name;
}

String Table::Key() const {
    called("ZDTable.Key");
    return key;
}

std::int32_t Table::Left() const {
    called("ZDTable.Left");
    return platform::toLong(left);
}

void Table::Left(float value) {
    called("ZDTable.Left=");
    left = value;
}

std::int32_t Table::Top() const {
    called("ZDTable.Top");
    return platform::toLong(top);
}

void Table::Top(float value) {
    called("ZDTable.Top=");
    top = value;
}

std::int32_t Table::Width() const {
    called("ZDTable.Width");
    return platform::toLong(width);
}

void Table::Width(float value) {
    called("ZDTable.Width=");
    width = value;
}

std::int32_t Table::Height() const {
    called("ZDTable.Height");
    return platform::toLong(height);
}

void Table::Height(float value) {
    called("ZDTable.Height=");
    height = value;
}

std::int16_t Table::Selected() const {
    called("ZDTable.Selected");
    return selected;
}

void Table::Selected(std::int16_t value) {
    called("ZDTable.Selected=");
    selected = value;
}

TalvikZandorLib::Collection<TalvikZandorLib::ZDColumn>& Table::Columns() {
    called("ZDTable.Columns");
    return columns;
}

Ref<Column> Table::addColumn(const String& columnName, const String& columnKey) {
    auto column = makeRef<fake::Column>(mCalls);
    column->name = columnName;
    column->key = columnKey.empty() ? u"k" + columnName : columnKey;
    columns.items.Add(std::shared_ptr<TalvikZandorLib::ZDColumn>(column), column->key);
    return column;
}

Ref<Column> Table::columnRef(const String& columnName) const {
    for (std::int32_t i = 1; i <= columns.items.Count(); ++i) {
        auto column = std::static_pointer_cast<fake::Column>(columns.items.Item(i));
        if (column->name == columnName) return column;
    }
    throw std::logic_error("the table has no such column");
}

Column& Table::column(const String& columnName) const { return *columnRef(columnName); }

Table& Table::place(float toLeft, float toTop, float toWidth, float toHeight) {
    left = toLeft;
    top = toTop;
    width = toWidth;
    height = toHeight;
    return *this;
}

Ref<TalvikZandorLib::ZDTable> Join::LeftTable() const {
    called("ZDJoin.LeftTable");
    return leftTable;
}

void Join::LeftTable(const Ref<TalvikZandorLib::ZDTable>& value) {
    called("ZDJoin.LeftTable=");
    leftTable = value;
}

Ref<TalvikZandorLib::ZDColumn> Join::LeftColumn() const {
    called("ZDJoin.LeftColumn");
    return leftColumn;
}

void Join::LeftColumn(const Ref<TalvikZandorLib::ZDColumn>& value) {
    called("ZDJoin.LeftColumn=");
    leftColumn = value;
}

Ref<TalvikZandorLib::ZDTable> Join::RightTable() const {
    called("ZDJoin.RightTable");
    return rightTable;
}

void Join::RightTable(const Ref<TalvikZandorLib::ZDTable>& value) {
    called("ZDJoin.RightTable=");
    rightTable = value;
}

Ref<TalvikZandorLib::ZDColumn> Join::RightColumn() const {
    called("ZDJoin.RightColumn");
    return rightColumn;
}

void Join::RightColumn(const Ref<TalvikZandorLib::ZDColumn>& value) {
    called("ZDJoin.RightColumn=");
    rightColumn = value;
}

std::int16_t Join::JoinType() const {
    called("ZDJoin.JoinType");
    return joinType;
}

void Join::JoinType(std::int16_t value) {
    called("ZDJoin.JoinType=");
    joinType = value;
}

std::int16_t Join::CompareOperator() const {
    called("ZDJoin.CompareOperator");
    return compareOperator;
}

void Join::CompareOperator(std::int16_t value) {
    called("ZDJoin.CompareOperator=");
    compareOperator = value;
}

String Join::Key() const {
    called("ZDJoin.Key");
    return key;
}

String Criterion::Criterium() const {
    called("ZDCriterium.Criterium");
    return text;
}

void Criterion::Criterium(const String& value) {
    called("ZDCriterium.Criterium=");
    text = value;
}

Ref<TalvikZandorLib::ZDColumn> Definition::Column() const {
    called("ZDColumnDefinition.Column");
    return column;
}

void Definition::Column(const Ref<TalvikZandorLib::ZDColumn>& value) {
    called("ZDColumnDefinition.Column=");
    column = value;
}

String Definition::Synonym() const {
    called("ZDColumnDefinition.Synonym");
    return synonym;
}

void Definition::Synonym(const String& value) {
    called("ZDColumnDefinition.Synonym=");
    synonym = value;
}

std::int16_t Definition::SortOrder() const {
    called("ZDColumnDefinition.SortOrder");
    return sortOrder;
}

void Definition::SortOrder(std::int16_t value) {
    called("ZDColumnDefinition.SortOrder=");
    sortOrder = value;
}

bool Definition::Visible() const {
    called("ZDColumnDefinition.Visible");
    return visible;
}

void Definition::Visible(bool value) {
    called("ZDColumnDefinition.Visible=");
    visible = value;
}

String Definition::Key() const {
    called("ZDColumnDefinition.Key");
    return key;
}

TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDCriterium>& Definition::Criteria() {
    called("ZDColumnDefinition.Criteria");
    return criteria;
}

bool Definition::HasCriterium(const String& criteriumKey) const {
    called("ZDColumnDefinition.HasCriterium");
    return criteria.items.Contains(criteriumKey);
}

void Definition::AddCriterium(const String& text, const String& criteriumKey) {
    called("ZDColumnDefinition.AddCriterium");
    addCriterion(text, criteriumKey);
}

String Definition::criterion(const String& criteriumKey) const {
    return std::static_pointer_cast<Criterion>(criteria.items.Item(criteriumKey))->text;
}

void Definition::addCriterion(const String& text, const String& criteriumKey) {
    auto criterion = makeRef<Criterion>(mCalls);
    criterion->text = text;
    criteria.items.Add(std::shared_ptr<TalvikZandorLib::ZDCriterium>(criterion), criteriumKey);
}

Model::Model(Calls record)
    : Part(record), calls(record), tables(record, "Tables"), joins(record, "Joins"),
      definitions(record, "ColumnDefinitions") {}

TalvikZandorLib::Collection<TalvikZandorLib::ZDTable>& Model::Tables() {
    called("Zandor.Tables");
    return tables;
}

TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDJoin>& Model::Joins() {
    called("Zandor.Joins");
    return joins;
}

TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDColumnDefinition>&
Model::ColumnDefinitions() {
    called("Zandor.ColumnDefinitions");
    return definitions;
}

Ref<TalvikZandorLib::ZDJoin> Model::AddJoin(const Ref<TalvikZandorLib::ZDJoin>& given) {
    called("Zandor.AddJoin");
    auto& source = dynamic_cast<Join&>(*given);
    std::shared_ptr<Join> stored = std::dynamic_pointer_cast<Join>(given);
    if (storesCopies) {
        stored = std::make_shared<Join>(calls);
        stored->leftTable = source.leftTable;
        stored->leftColumn = source.leftColumn;
        stored->rightTable = source.rightTable;
        stored->rightColumn = source.rightColumn;
        stored->joinType = source.joinType;
        stored->compareOperator = source.compareOperator;
    }
    stored->key = u"j" + platform::decimal(++mLastJoin);
    const Ref<TalvikZandorLib::ZDJoin> result{std::shared_ptr<TalvikZandorLib::ZDJoin>(stored)};
    joins.items.Add(result, stored->key);
    return result;
}

Ref<TalvikZandorLib::ZDColumnDefinition>
Model::AddColumnDefinition(const Ref<TalvikZandorLib::ZDColumnDefinition>& given) {
    called("Zandor.AddColumnDefinition");
    auto& source = dynamic_cast<Definition&>(*given);
    std::shared_ptr<Definition> stored = std::dynamic_pointer_cast<Definition>(given);
    if (storesCopies) {
        stored = std::make_shared<Definition>(calls);
        stored->column = source.column;
        stored->synonym = source.synonym;
        stored->sortOrder = source.sortOrder;
        stored->visible = source.visible;
        stored->criteria.items = source.criteria.items;
    }
    stored->key = u"x" + platform::decimal(++mLastDefinition);
    const Ref<TalvikZandorLib::ZDColumnDefinition> result{
        std::shared_ptr<TalvikZandorLib::ZDColumnDefinition>(stored)};
    definitions.items.Add(result, stored->key);
    return result;
}

void Model::DeleteTable(const Ref<TalvikZandorLib::ZDTable>& table) {
    called("Zandor.DeleteTable");
    tables.items.Remove(dynamic_cast<Table&>(*table).key);
}

Ref<Table> Model::table(const String& name, std::initializer_list<String> columns,
                        const String& key) {
    auto table = makeRef<Table>(calls);
    table->name = name;
    table->key = key.empty() ? u"t" + name : key;
    for (const String& column : columns) table->addColumn(column);
    tables.items.Add(std::shared_ptr<TalvikZandorLib::ZDTable>(table), table->key);
    return table;
}

Ref<Join> Model::join(const Ref<Table>& left, const String& leftColumn, const Ref<Table>& right,
                      const String& rightColumn, std::int16_t joinType,
                      std::int16_t compareOperator) {
    auto join = makeRef<Join>(calls);
    join->leftTable = std::shared_ptr<TalvikZandorLib::ZDTable>(left);
    join->leftColumn = std::shared_ptr<TalvikZandorLib::ZDColumn>(left->columnRef(leftColumn));
    join->rightTable = std::shared_ptr<TalvikZandorLib::ZDTable>(right);
    join->rightColumn = std::shared_ptr<TalvikZandorLib::ZDColumn>(right->columnRef(rightColumn));
    join->joinType = joinType;
    join->compareOperator = compareOperator;
    join->key = u"j" + platform::decimal(++mLastJoin);
    joins.items.Add(std::shared_ptr<TalvikZandorLib::ZDJoin>(join), join->key);
    return join;
}

Ref<Definition> Model::definition(const Ref<Table>& table, const String& column,
                                  std::initializer_list<String> criteria) {
    auto definition = makeRef<Definition>(calls);
    definition->column = std::shared_ptr<TalvikZandorLib::ZDColumn>(table->columnRef(column));
    std::int32_t row = 4;
    for (const String& text : criteria) definition->addCriterion(text, platform::decimal(row++));
    definition->key = u"x" + platform::decimal(++mLastDefinition);
    definitions.items.Add(std::shared_ptr<TalvikZandorLib::ZDColumnDefinition>(definition),
                          definition->key);
    return definition;
}

Table& Model::tableAt(std::int32_t position) const {
    return dynamic_cast<Table&>(*tables.items.Item(position));
}

Join& Model::joinAt(std::int32_t position) const {
    return dynamic_cast<Join&>(*joins.items.Item(position));
}

Definition& Model::definitionAt(std::int32_t position) const {
    return dynamic_cast<Definition&>(*definitions.items.Item(position));
}

void Model::mustKnow(const std::string& member) {
    if (!isMember(member)) throw std::logic_error("a model has no " + member);
}

Ref<TalvikZandorLib::Zandor> Library::NewZandor() {
    called("Library.NewZandor");
    return std::shared_ptr<TalvikZandorLib::Zandor>(makeRef<Model>(calls));
}

Ref<TalvikZandorLib::ZDJoin> Library::NewZDJoin() {
    called("Library.NewZDJoin");
    return std::shared_ptr<TalvikZandorLib::ZDJoin>(makeRef<Join>(calls));
}

Ref<TalvikZandorLib::ZDColumnDefinition> Library::NewZDColumnDefinition() {
    called("Library.NewZDColumnDefinition");
    return std::shared_ptr<TalvikZandorLib::ZDColumnDefinition>(makeRef<Definition>(calls));
}

} // namespace fake
