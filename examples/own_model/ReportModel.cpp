#include "ReportModel.h"

#include <algorithm>

using namespace zandor;

namespace report {

using platform::makeRef;
using TalvikZandorLib::ZDColumn;
using TalvikZandorLib::ZDColumnDefinition;
using TalvikZandorLib::ZDCriterium;
using TalvikZandorLib::ZDJoin;
using TalvikZandorLib::ZDTable;

namespace {

constexpr int firstRow = 4; // of the grid, for conditions

/// The designer hands back handles of this model only.
template <class Handle, class Interface>
const Handle& own(const Ref<Interface>& object) {
    return dynamic_cast<const Handle&>(*object);
}

Ref<ZDTable> tableOf(const std::shared_ptr<Source>& source) {
    return source ? makeRef<Table>(source) : Ref<Table>();
}

Ref<ZDColumn> columnOf(const std::shared_ptr<Source>& source, int field) {
    if (!source || field < 0) return {};
    return makeRef<Column>(source, static_cast<std::size_t>(field));
}

int rowOf(const String& key) { return std::stoi(platform::toUtf8(key)); }

template <class T>
auto countOf(std::vector<T>& items) {
    return [&items] { return items.size(); };
}

template <class T>
auto removeFrom(std::vector<T>& items) {
    return
        [&items](std::size_t at) { items.erase(items.begin() + static_cast<std::ptrdiff_t>(at)); };
}

} // namespace

Table::Table(std::shared_ptr<Source> from)
    : source(std::move(from)), mColumns(countOf(source->fields), [source = source](std::size_t at) {
          return makeRef<Column>(source, at);
      }) {}

// [join]
Ref<ZDTable> Join::LeftTable() const { return tableOf(link->from); }
Ref<ZDTable> Join::RightTable() const { return tableOf(link->to); }
Ref<ZDColumn> Join::LeftColumn() const { return columnOf(link->from, link->fromField); }
Ref<ZDColumn> Join::RightColumn() const { return columnOf(link->to, link->toField); }

void Join::LeftTable(const Ref<ZDTable>& value) { link->from = own<Table>(value).source; }
void Join::RightTable(const Ref<ZDTable>& value) { link->to = own<Table>(value).source; }
void Join::LeftColumn(const Ref<ZDColumn>& value) {
    link->fromField = static_cast<int>(own<Column>(value).position);
}
void Join::RightColumn(const Ref<ZDColumn>& value) {
    link->toField = static_cast<int>(own<Column>(value).position);
}
// [join]

String Condition::Criterium() const {
    const auto at = mOutput->conditions.find(mRow);
    return at == mOutput->conditions.end() ? String() : platform::fromUtf8(at->second);
}

void Condition::Criterium(const String& value) {
    mOutput->conditions[mRow] = platform::toUtf8(value);
}

std::int32_t Conditions::Count() const {
    const auto& conditions = mOutput->conditions;
    return conditions.empty() ? 0 : conditions.rbegin()->first - firstRow + 1;
}

Ref<ZDCriterium> Conditions::Item(std::int32_t position) const {
    if (position < 1 || position > Count()) throw platform::errors::subscriptOutOfRange();
    return makeRef<Condition>(mOutput, position - 1 + firstRow);
}

Ref<ZDCriterium> Conditions::Item(const String& key) const {
    if (!contains(key)) throw platform::errors::invalidProcedureCall();
    return makeRef<Condition>(mOutput, rowOf(key));
}

void Conditions::Remove(const String& key) {
    if (mOutput->conditions.erase(rowOf(key)) == 0) throw platform::errors::invalidProcedureCall();
}

bool Conditions::contains(const String& key) const {
    return mOutput->conditions.contains(rowOf(key));
}

Ref<ZDColumn> Definition::Column() const { return columnOf(output->source, output->field); }

void Definition::Column(const Ref<ZDColumn>& value) {
    const auto& column = own<report::Column>(value);
    output->source = column.source;
    output->field = static_cast<int>(column.position);
}

void Definition::AddCriterium(const String& text, const String& key) {
    if (!output->conditions.emplace(rowOf(key), platform::toUtf8(text)).second)
        throw platform::errors::duplicateKey();
}

// [model]
Model::Model(std::shared_ptr<Report> report)
    : mReport(std::move(report)),
      mTables(countOf(mReport->sources),
              [this](std::size_t at) { return makeRef<Table>(mReport->sources.at(at)); }),
      mJoins(
          countOf(mReport->links),
          [this](std::size_t at) { return makeRef<Join>(mReport->links.at(at)); },
          removeFrom(mReport->links)),
      mDefinitions(
          countOf(mReport->outputs),
          [this](std::size_t at) { return makeRef<Definition>(mReport->outputs.at(at)); },
          removeFrom(mReport->outputs)) {}

Ref<ZDJoin> Model::AddJoin(const Ref<ZDJoin>& join) {
    const auto& link = own<Join>(join).link;
    if (link->id == 0) link->id = ++mReport->lastId;
    mReport->links.push_back(link);
    return join;
}

Ref<ZDColumnDefinition> Model::AddColumnDefinition(const Ref<ZDColumnDefinition>& definition) {
    const auto& output = own<Definition>(definition).output;
    if (output->id == 0) output->id = ++mReport->lastId;
    mReport->outputs.push_back(output);
    return definition;
}

void Model::DeleteTable(const Ref<ZDTable>& table) {
    const std::shared_ptr<Source> source = own<Table>(table).source;
    std::erase_if(mReport->links,
                  [&](const auto& link) { return link->from == source || link->to == source; });
    std::erase_if(mReport->outputs, [&](const auto& output) { return output->source == source; });
    std::erase(mReport->sources, source);
}
// [model]

} // namespace report
