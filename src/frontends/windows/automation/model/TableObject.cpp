#include "frontends/windows/automation/model/TableObject.h"

#include "frontends/windows/automation/model/CollectionObject.h"

#include <Zandor/model/Table.h>

namespace zandor::automation {

namespace {

const model::Table& tableOf(const TalvikZandorLib::ZDTable& table) {
    return dynamic_cast<const model::Table&>(table);
}

} // namespace

STDMETHODIMP TableObject::get_Name(BSTR* value) {
    return answer([&] { give(value, object()->Name()); });
}

STDMETHODIMP TableObject::get_Key(BSTR* value) {
    return answer([&] { give(value, object()->Key()); });
}

STDMETHODIMP TableObject::get_Left(LONG* value) {
    return answer([&] { give(value, object()->Left()); });
}

STDMETHODIMP TableObject::put_Left(LONG value) {
    return answer([&] { object()->Left(static_cast<float>(value)); });
}

STDMETHODIMP TableObject::get_Top(LONG* value) {
    return answer([&] { give(value, object()->Top()); });
}

STDMETHODIMP TableObject::put_Top(LONG value) {
    return answer([&] { object()->Top(static_cast<float>(value)); });
}

STDMETHODIMP TableObject::get_Width(LONG* value) {
    return answer([&] { give(value, object()->Width()); });
}

STDMETHODIMP TableObject::put_Width(LONG value) {
    return answer([&] { object()->Width(static_cast<float>(value)); });
}

STDMETHODIMP TableObject::get_Height(LONG* value) {
    return answer([&] { give(value, object()->Height()); });
}

STDMETHODIMP TableObject::put_Height(LONG value) {
    return answer([&] { object()->Height(static_cast<float>(value)); });
}

STDMETHODIMP TableObject::get_Selected(SHORT* value) {
    return answer([&] { give(value, object()->Selected()); });
}

STDMETHODIMP TableObject::put_Selected(SHORT value) {
    return answer([&] { object()->Selected(value); });
}

STDMETHODIMP TableObject::get_Columns(IDispatch** value) {
    return answer([&] {
        give(value, collectionOf<TalvikZandorLib::ZDColumn>(object(), object()->Columns()));
    });
}

STDMETHODIMP TableObject::get_SourceName(BSTR* value) {
    return answer([&] { give(value, tableOf(*object()).sourceName()); });
}

STDMETHODIMP TableObject::get_Schema(BSTR* value) {
    return answer([&] { give(value, tableOf(*object()).schema()); });
}

} // namespace zandor::automation
