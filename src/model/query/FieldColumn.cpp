#include <Zandor/model/FieldColumn.h>

#include <Zandor/model/Table.h>

namespace zandor::model {

platform::String FieldColumn::Name() const {
    const auto table = mColumn.place().table().table();
    return table ? table->Name() + u'.' + mColumn.Name() : mColumn.Name();
}

platform::String FieldColumn::Key() const { return mColumn.Key(); }
bool FieldColumn::Marker() const { return mColumn.Marker(); }
bool FieldColumn::Selected() const { return mColumn.Selected(); }
void FieldColumn::Selected(bool value) { mColumn.Selected(value); }
void FieldColumn::activated(std::int16_t value) { mColumn.activated(value); }

} // namespace zandor::model
