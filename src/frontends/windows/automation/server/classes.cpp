#include "frontends/windows/automation/server/classes.h"

#include "frontends/windows/automation/com/ids.h"
#include "frontends/windows/automation/control/ControlObject.h"
#include "frontends/windows/automation/model/Exchange.h"
#include "frontends/windows/automation/model/TableDescriptionObject.h"
#include "frontends/windows/automation/pages/PropertyPage.h"

#include <Zandor/Query.h>

namespace zandor::automation {

namespace {

/// An object of the ready-made model, behind its own.
template <class Interface, class T>
Held<IUnknown> makeOfModel() {
    return Held<IUnknown>(toHost(platform::Ref<Interface>(platform::makeRef<T>())).get());
}

const CreatableClass classes[] = {
    {ids::control, L"TalvikDBxZandor.Zandor", L"Zandor query designer", &ids::controlLibrary,
     [] { return Held<IUnknown>(static_cast<_Zandor*>(new ControlObject)); }, true},
    {ids::propertyPage, nullptr, L"Property page of the Zandor query designer", nullptr,
     [] { return Held<IUnknown>(new PropertyPage); }},
    {ids::query, L"TalvikZandorLib.Zandor", L"Zandor query", &ids::modelLibrary,
     makeOfModel<TalvikZandorLib::Zandor, model::Query>},
    {ids::join, L"TalvikZandorLib.ZDJoin", L"Join of a Zandor query", &ids::modelLibrary,
     makeOfModel<TalvikZandorLib::ZDJoin, model::Join>},
    {ids::columnDefinition, L"TalvikZandorLib.ZDColumnDefinition",
     L"Output column of a Zandor query", &ids::modelLibrary,
     makeOfModel<TalvikZandorLib::ZDColumnDefinition, model::ColumnDefinition>},
    {ids::tableDescription, L"TalvikZandorLib.ZDTableDescription",
     L"Table to be put into a Zandor query", &ids::modelLibrary,
     [] {
         return Held<IUnknown>(static_cast<_ZDTableDescription*>(
             new TableDescriptionObject(platform::makeRef<model::TableDescription>())));
     }},
};

} // namespace

std::span<const CreatableClass> creatableClasses() { return classes; }

} // namespace zandor::automation
