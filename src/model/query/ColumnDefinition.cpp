#include <Zandor/model/ColumnDefinition.h>

#include <Zandor/model/OutputName.h>
#include <Zandor/model/Table.h>

namespace zandor::model {

Ref<TalvikZandorLib::ZDColumn> ColumnDefinition::Column() const {
    const Ref<model::Column> column = mPlace->column();
    if (!isExpression() && (!column || mTotal == Total::None)) return model::Column::field(column);
    return platform::makeRef<OutputName>(*mPlace, *mExpression, *mTotal);
}

void ColumnDefinition::Column(const Ref<TalvikZandorLib::ZDColumn>& value) {
    const auto output = std::dynamic_pointer_cast<const OutputName>(value);
    const ColumnPlace place = placeOf(value);
    const bool copiesExpression = output && !output->expression().text.empty();
    if (!mKey.empty()) {
        if (place.empty() && !copiesExpression) throw platform::errors::objectNotSet();
        if (!place.table().sameHome(mPlace->table()))
            throw platform::errors::invalidProcedureCall();
    }
    mPlace = place;
    if (output) mTotal = output->total();
    if (copiesExpression)
        mExpression = output->expression();
    else if (!place.empty())
        mExpression = {};
}

void ColumnDefinition::SortOrder(std::int16_t value) {
    if (value < 0 || value > 2) throw platform::errors::invalidPropertyValue();
    mSortOrder = value;
}

void ColumnDefinition::total(Total value) {
    if (value > lastTotal) throw platform::errors::invalidPropertyValue();
    mTotal = value;
}

void ColumnDefinition::sortPriority(std::int16_t value) {
    if (value < 0 || value > greatestSortPriority) throw platform::errors::invalidPropertyValue();
    mSortPriority = value;
}

void ColumnDefinition::format(Format value) {
    if (value > lastFormat) throw platform::errors::invalidPropertyValue();
    mFormat = value;
}

void ColumnDefinition::decimals(std::int16_t value) {
    if (value < asManyAsThereAre || value > mostDecimals)
        throw platform::errors::invalidPropertyValue();
    mDecimals = value;
}

void ColumnDefinition::expression(const String& text) {
    if (text == mExpression->text) return;
    if (!text.empty()) mPlace = ColumnPlace(mPlace->table().nowhere(), {});
    mExpression = {text, {}};
}

void ColumnDefinition::Width(std::int32_t value) {
    if (value < 0 || value > greatestWidth) throw platform::errors::invalidPropertyValue();
    mWidth = value;
}

} // namespace zandor::model
