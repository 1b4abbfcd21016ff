#include <Zandor/model/Place.h>

#include <Zandor/model/OutputName.h>
#include <Zandor/model/Table.h>

namespace zandor::model {

Ref<Table> TablePlace::table() const {
    const auto home = mHome.lock();
    if (!home || !home->Contains(mKey)) return {};
    return std::static_pointer_cast<Table>(home->Item(mKey));
}

bool TablePlace::sameHome(const TablePlace& other) const {
    return !mHome.owner_before(other.mHome) && !other.mHome.owner_before(mHome);
}

bool TablePlace::isIn(const std::shared_ptr<const Tables>& tables) const {
    return sameHome(TablePlace(tables, mKey)) && tables->Contains(mKey);
}

Ref<Column> ColumnPlace::column() const {
    const auto table = mTable.table();
    return table ? table->column(mKey) : Ref<Column>();
}

void ColumnPlace::require(const std::shared_ptr<const Tables>& tables) const {
    if (empty()) throw platform::errors::objectNotSet();
    if (!mTable.isIn(tables) || !column()) throw platform::errors::invalidProcedureCall();
}

TablePlace placeOf(const Ref<TalvikZandorLib::ZDTable>& table) {
    if (!table) return {};
    const auto own = std::dynamic_pointer_cast<const Table>(table);
    if (!own) throw platform::errors::invalidProcedureCall();
    return own->place();
}

ColumnPlace placeOf(const Ref<TalvikZandorLib::ZDColumn>& column) {
    if (!column) return {};
    if (const auto own = std::dynamic_pointer_cast<const Column>(column)) return own->place();
    if (const auto field = std::dynamic_pointer_cast<const FieldColumn>(column))
        return field->column().place();
    if (const auto output = std::dynamic_pointer_cast<const OutputName>(column))
        return output->place();
    throw platform::errors::invalidProcedureCall();
}

} // namespace zandor::model
