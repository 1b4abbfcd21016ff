#include "frontends/windows/automation/model/Exchange.h"

#include "frontends/windows/automation/host/HostDefinition.h"
#include "frontends/windows/automation/host/HostJoin.h"
#include "frontends/windows/automation/host/HostQuery.h"
#include "frontends/windows/automation/host/HostTable.h"
#include "frontends/windows/automation/model/ColumnObject.h"
#include "frontends/windows/automation/model/CriteriumObject.h"
#include "frontends/windows/automation/model/DefinitionObject.h"
#include "frontends/windows/automation/model/JoinObject.h"
#include "frontends/windows/automation/model/QueryObject.h"
#include "frontends/windows/automation/model/TableObject.h"

namespace zandor::automation {

namespace {

template <class Object, class T>
Held<IDispatch> give(const platform::Ref<T>& object) {
    if (!object) return {};
    if (const auto* const host = dynamic_cast<const HostObject*>(object.get()))
        return host->dispatch();
    if (Held<IDispatch> known = Holds<T>::known(*object)) return known;
    return Held<IDispatch>(new Object(object));
}

template <class HostsObject, class T>
platform::Ref<T> take(IDispatch* object) {
    if (!object) return {};
    Held<Own> own;
    if (FAILED(object->QueryInterface(ids::own, own.slotOfAny())))
        return platform::makeRef<HostsObject>(object);
    if (auto found = ownObject<T>(object)) return found;
    throw platform::errors::typeMismatch();
}

} // namespace

using namespace TalvikZandorLib;
using platform::Ref;

Held<IDispatch> toHost(const Ref<Zandor>& query) { return give<QueryObject>(query); }
Held<IDispatch> toHost(const Ref<ZDTable>& table) { return give<TableObject>(table); }
Held<IDispatch> toHost(const Ref<ZDColumn>& column) { return give<ColumnObject>(column); }
Held<IDispatch> toHost(const Ref<ZDJoin>& join) { return give<JoinObject>(join); }
Held<IDispatch> toHost(const Ref<ZDColumnDefinition>& definition) {
    return give<DefinitionObject>(definition);
}
Held<IDispatch> toHost(const Ref<ZDCriterium>& criterium) {
    return give<CriteriumObject>(criterium);
}

template <>
Ref<Zandor> fromHost(IDispatch* object) {
    return take<HostQuery, Zandor>(object);
}
template <>
Ref<ZDTable> fromHost(IDispatch* object) {
    return take<HostTable, ZDTable>(object);
}
template <>
Ref<ZDColumn> fromHost(IDispatch* object) {
    return take<HostColumn, ZDColumn>(object);
}
template <>
Ref<ZDJoin> fromHost(IDispatch* object) {
    return take<HostJoin, ZDJoin>(object);
}
template <>
Ref<ZDColumnDefinition> fromHost(IDispatch* object) {
    return take<HostDefinition, ZDColumnDefinition>(object);
}
template <>
Ref<ZDCriterium> fromHost(IDispatch* object) {
    return take<HostCriterium, ZDCriterium>(object);
}

} // namespace zandor::automation
