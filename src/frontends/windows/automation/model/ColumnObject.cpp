#include "frontends/windows/automation/model/ColumnObject.h"

#include "frontends/windows/automation/model/members.h"

#include <Zandor/model/Column.h>

namespace zandor::automation {

namespace {

// The numbers of a type library are for good.
static_assert(zdUnknown == static_cast<int>(model::ColumnType::Unknown));
static_assert(zdBlob == static_cast<int>(model::ColumnType::Blob));

/// The column itself, also of one as an output column shows it.
const model::Column& columnOf(const TalvikZandorLib::ZDColumn& column) {
    if (const auto* const field = dynamic_cast<const model::FieldColumn*>(&column))
        return field->column();
    if (const auto* const own = dynamic_cast<const model::Column*>(&column)) return *own;
    throw platform::errors::unsupportedMember(); // an expression
}

} // namespace

STDMETHODIMP ColumnObject::get_Name(BSTR* value) {
    return answer([&] { give(value, object()->Name()); });
}

STDMETHODIMP ColumnObject::get_Key(BSTR* value) {
    return answer([&] { give(value, object()->Key()); });
}

STDMETHODIMP ColumnObject::get_Marker(VARIANT_BOOL* value) {
    return answer([&] { give(value, object()->Marker()); });
}

STDMETHODIMP ColumnObject::get_Selected(VARIANT_BOOL* value) {
    return answer([&] { give(value, object()->Selected()); });
}

STDMETHODIMP ColumnObject::put_Selected(VARIANT_BOOL value) {
    return answer([&] { object()->Selected(value != VARIANT_FALSE); });
}

STDMETHODIMP ColumnObject::get_activated(SHORT* value) {
    return answer([&] { give(value, columnOf(*object()).activated()); });
}

STDMETHODIMP ColumnObject::put_activated(SHORT value) {
    return answer([&] { object()->activated(value); });
}

STDMETHODIMP ColumnObject::get_Type(ZDColumnType* value) {
    return answer([&] {
        placeOf(value) = static_cast<ZDColumnType>(columnOf(*object()).description().type);
    });
}

STDMETHODIMP ColumnObject::get_DeclaredType(BSTR* value) {
    return answer([&] { give(value, columnOf(*object()).description().declaredType); });
}

} // namespace zandor::automation
