#include <Zandor/model/Join.h>

#include <Zandor/model/Table.h>

namespace zandor::model {

using TalvikZandorLib::ZDColumn;
using TalvikZandorLib::ZDTable;

Ref<ZDTable> Join::LeftTable() const { return mLeft->table().table(); }
Ref<ZDTable> Join::RightTable() const { return mRight->table().table(); }
Ref<ZDColumn> Join::LeftColumn() const { return mLeft->column(); }
Ref<ZDColumn> Join::RightColumn() const { return mRight->column(); }

void Join::LeftTable(const Ref<ZDTable>& value) { setTable(mLeft, value); }
void Join::RightTable(const Ref<ZDTable>& value) { setTable(mRight, value); }
void Join::LeftColumn(const Ref<ZDColumn>& value) { setColumn(mLeft, value); }
void Join::RightColumn(const Ref<ZDColumn>& value) { setColumn(mRight, value); }

void Join::JoinType(std::int16_t value) {
    if (value < 0 || value > 3) throw platform::errors::invalidPropertyValue();
    mJoinType = value;
}

void Join::CompareOperator(std::int16_t value) {
    if (value < 0 || value > 5) throw platform::errors::invalidPropertyValue();
    mCompareOperator = value;
}

void Join::setTable(Revised<ColumnPlace>& end, const Ref<ZDTable>& value) {
    const TablePlace place = placeOf(value);
    requireHome(end->table(), place);
    if (!(place == end->table())) end = ColumnPlace(place, {});
}

void Join::setColumn(Revised<ColumnPlace>& end, const Ref<ZDColumn>& value) {
    const ColumnPlace place = placeOf(value);
    requireHome(end->table(), place.table());
    if (place.empty()) {
        end = ColumnPlace(end->table(), {});
        return;
    }
    if (!end->table().empty() && !(end->table() == place.table()))
        throw platform::errors::invalidProcedureCall();
    end = place;
}

void Join::requireHome(const TablePlace& end, const TablePlace& value) const {
    if (mKey.empty()) return;
    if (value.empty()) throw platform::errors::objectNotSet();
    if (!value.sameHome(end)) throw platform::errors::invalidProcedureCall();
}

} // namespace zandor::model
