#include "frontends/windows/automation/model/DefinitionObject.h"

#include "frontends/windows/automation/model/CollectionObject.h"
#include "frontends/windows/automation/model/OpenDefinition.h"

#include <Zandor/model/ColumnDefinition.h>

namespace zandor::automation {

namespace {

/// One of the ready-made model; error 438 for one that is being made for another model.
model::ColumnDefinition& own(TalvikZandorLib::ZDColumnDefinition& definition) {
    if (auto* const found = dynamic_cast<model::ColumnDefinition*>(&definition)) return *found;
    throw platform::errors::unsupportedMember();
}

} // namespace

STDMETHODIMP DefinitionObject::get_Key(BSTR* value) {
    return answer([&] { give(value, object()->Key()); });
}

STDMETHODIMP DefinitionObject::put_Key(BSTR value) {
    return answer([&] {
        auto* const open = dynamic_cast<OpenDefinition*>(object().get());
        // One of a query has its key for good.
        if (!open) throw platform::errors::unsupportedMember();
        open->Key(textOf(value));
    });
}

STDMETHODIMP DefinitionObject::get_Column(IDispatch** value) {
    return answer([&] { give(value, object()->Column()); });
}

STDMETHODIMP DefinitionObject::putref_Column(IDispatch* value) {
    return answer([&] { object()->Column(fromHost<TalvikZandorLib::ZDColumn>(value)); });
}

STDMETHODIMP DefinitionObject::get_Synonym(BSTR* value) {
    return answer([&] { give(value, object()->Synonym()); });
}

STDMETHODIMP DefinitionObject::put_Synonym(BSTR value) {
    return answer([&] { object()->Synonym(textOf(value)); });
}

STDMETHODIMP DefinitionObject::get_SortOrder(SHORT* value) {
    return answer([&] { give(value, object()->SortOrder()); });
}

STDMETHODIMP DefinitionObject::put_SortOrder(SHORT value) {
    return answer([&] { object()->SortOrder(value); });
}

STDMETHODIMP DefinitionObject::get_Visible(VARIANT_BOOL* value) {
    return answer([&] { give(value, object()->Visible()); });
}

STDMETHODIMP DefinitionObject::put_Visible(VARIANT_BOOL value) {
    return answer([&] { object()->Visible(value != VARIANT_FALSE); });
}

STDMETHODIMP DefinitionObject::get_Criteria(IDispatch** value) {
    return answer([&] { give(value, editableCollectionOf(object(), object()->Criteria())); });
}

STDMETHODIMP DefinitionObject::HasCriterium(BSTR Key, VARIANT_BOOL* value) {
    return answer([&] { give(value, object()->HasCriterium(textOf(Key))); });
}

STDMETHODIMP DefinitionObject::AddCriterium(BSTR Text, BSTR Key) {
    return answer([&] { object()->AddCriterium(textOf(Text), textOf(Key)); });
}

STDMETHODIMP DefinitionObject::get_Expression(BSTR* value) {
    return answer([&] { give(value, own(*object()).expression().text); });
}

STDMETHODIMP DefinitionObject::put_Expression(BSTR value) {
    return answer([&] { own(*object()).expression(textOf(value)); });
}

STDMETHODIMP DefinitionObject::get_Total(SHORT* value) {
    return answer([&] { give(value, static_cast<std::int16_t>(own(*object()).total())); });
}

STDMETHODIMP DefinitionObject::put_Total(SHORT value) {
    return answer([&] {
        if (value < 0 || value > static_cast<std::int16_t>(model::lastTotal))
            throw platform::errors::invalidPropertyValue();
        own(*object()).total(static_cast<model::Total>(value));
    });
}

STDMETHODIMP DefinitionObject::get_SortPriority(SHORT* value) {
    return answer([&] { give(value, own(*object()).sortPriority()); });
}

STDMETHODIMP DefinitionObject::put_SortPriority(SHORT value) {
    return answer([&] { own(*object()).sortPriority(value); });
}

} // namespace zandor::automation
