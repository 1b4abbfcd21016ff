#include "model/criteria/QueryColumns.h"

namespace zandor::model::criteria {

namespace {

void add(std::vector<NamedColumn>& found, const Table& table, StringView name) {
    if (const Ref<Column> column = table.columnNamed(name))
        found.push_back({columnRef(*column, table), column->place()});
}

} // namespace

sql::ColumnRef columnRef(const Column& column, const Table& table) {
    const ColumnDescription& described = column.description();
    return {table.Name(), column.Name(), described.type, described.declaredType};
}

std::vector<NamedColumn> QueryColumns::columnsNamed(StringView table, StringView column) const {
    std::vector<NamedColumn> found;
    if (const Ref<Table> named = tableNamed(mTables, table)) add(found, *named, column);
    return found;
}

std::vector<NamedColumn> QueryColumns::columnsNamed(StringView column) const {
    std::vector<NamedColumn> found;
    for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(mTables))
        add(found, static_cast<const Table&>(*table), column);
    return found;
}

} // namespace zandor::model::criteria
