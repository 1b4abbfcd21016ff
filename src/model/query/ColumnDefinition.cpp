#include <Zandor/model/ColumnDefinition.h>

#include <Zandor/model/Table.h>

namespace zandor::model {

Ref<TalvikZandorLib::ZDColumn> ColumnDefinition::Column() const {
    return model::Column::field(mPlace->column());
}

void ColumnDefinition::Column(const Ref<TalvikZandorLib::ZDColumn>& value) {
    const ColumnPlace place = placeOf(value);
    if (!mKey.empty()) {
        if (place.empty()) throw platform::errors::objectNotSet();
        if (!place.table().sameHome(mPlace->table()))
            throw platform::errors::invalidProcedureCall();
    }
    mPlace = place;
}

void ColumnDefinition::SortOrder(std::int16_t value) {
    if (value < 0 || value > 2) throw platform::errors::invalidPropertyValue();
    mSortOrder = value;
}

void ColumnDefinition::Width(std::int32_t value) {
    if (value < 0 || value > greatestWidth) throw platform::errors::invalidPropertyValue();
    mWidth = value;
}

} // namespace zandor::model
